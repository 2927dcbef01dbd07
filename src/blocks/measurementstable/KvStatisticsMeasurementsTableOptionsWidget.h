// SPDX-License-Identifier: MIT
#pragma once

#include "blocks/common/KvThemedOptionsWidget.h"
#include "charts/KvChartThemes.h"

#include <QPointer>

class KvStatisticsMeasurementsTableNodeCfg;
class QComboBox;

/**
 * Options panel of the measurements table: width, alignment, theme, columns, order of the rows. Every change
 * is written to the configuration and then announced.
 */
class KvStatisticsMeasurementsTableOptionsWidget : public KvThemedOptionsWidget
{
    Q_OBJECT
public:
    /** Without \a withPlacement the rows for width and alignment are left out. */
    KvStatisticsMeasurementsTableOptionsWidget(KvStatisticsMeasurementsTableNodeCfg *cfg, QWidget *parent,
                                               bool withPlacement);

    void setFromConfig(const KvBaseEditorNodeCfg *cfg) override;

signals:
    void signalWidthChanged(int aWidth);
    void signalAlignmentChanged(Qt::Alignment aAlignment);
    void signalThemeChanged(kvCharts::KvChartThemes::ThemeType aTheme);
    void signalColumnsChanged(QSet<QString> aColumns);
    void signalOrderByChanged(QString aColumn, bool aAscending);

public slots:
    void slotAlignLeftClicked();
    void slotAlignCenterClicked();
    void slotAlignRightClicked();
    void slotThemeToggled();
    void slotColumnStateChanged(const QString &aName, int aState);
    void slotOrderBySelected();

private slots:
    void slotWidthEdited(int aWidth);

private:
    void addOrderRow();
    void selectAlignment(Qt::Alignment alignment);

    QPointer<KvStatisticsMeasurementsTableNodeCfg> m_cfg; ///< the block may die before its panel
    QComboBox *m_orderBox = nullptr;
};
