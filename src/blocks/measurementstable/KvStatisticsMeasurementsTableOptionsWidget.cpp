// SPDX-License-Identifier: MIT
#include "blocks/measurementstable/KvStatisticsMeasurementsTableOptionsWidget.h"

#include "blocks/common/KvAlignmentOptionsRow.h"
#include "blocks/common/KvChoiceOptionsRow.h"
#include "blocks/common/KvColumnsOptionsRow.h"
#include "blocks/common/KvWidthOptionsRow.h"
#include "blocks/measurementstable/KvStatisticsMeasurementsTableNodeCfg.h"

#include <QComboBox>
#include <QLabel>
#include <QSignalBlocker>
#include <QVBoxLayout>

namespace {

constexpr int kColumnRole = Qt::UserRole;
constexpr int kAscendingRole = Qt::UserRole + 1;
constexpr int kSpacing = 4;

} // namespace

KvStatisticsMeasurementsTableOptionsWidget::KvStatisticsMeasurementsTableOptionsWidget(
    KvStatisticsMeasurementsTableNodeCfg *cfg, QWidget *parent, bool withPlacement)
    : KvBaseOptionsWidget(tr("Measurements table"), parent)
    , m_cfg(cfg)
{
    qRegisterMetaType<Qt::Alignment>("Qt::Alignment");
    qRegisterMetaType<QSet<QString>>("QSet<QString>");
    if (withPlacement)
        addPlacementRows();
    addThemeRow();
    addColumnsRow();
    addOrderRow();
    setFromConfig(cfg);
}

void KvStatisticsMeasurementsTableOptionsWidget::addPlacementRows()
{
    m_widthRow = new KvWidthOptionsRow(this);
    addRow(m_widthRow);
    connect(m_widthRow, SIGNAL(signalWidthChanged(int)), this, SLOT(slotWidthEdited(int)));
    m_alignmentRow = new KvAlignmentOptionsRow(this);
    addRow(m_alignmentRow);
    connect(m_alignmentRow, SIGNAL(signalLeftClicked()), this, SLOT(slotAlignLeftClicked()));
    connect(m_alignmentRow, SIGNAL(signalCenterClicked()), this, SLOT(slotAlignCenterClicked()));
    connect(m_alignmentRow, SIGNAL(signalRightClicked()), this, SLOT(slotAlignRightClicked()));
}

void KvStatisticsMeasurementsTableOptionsWidget::addThemeRow()
{
    m_themeRow = new KvChoiceOptionsRow(tr("Color theme:"), {tr("Dark"), tr("Light")}, this);
    addRow(m_themeRow);
    connect(m_themeRow, SIGNAL(signalToggled()), this, SLOT(slotThemeToggled()));
}

void KvStatisticsMeasurementsTableOptionsWidget::addColumnsRow()
{
    const QStringList &names = KvStatisticsMeasurementsTableNodeCfg::columnNames();
    QStringList labels;
    for (const QString &name : names)
        labels.append(KvStatisticsMeasurementsTableNodeCfg::columnLabel(name));
    m_columnsRow = new KvColumnsOptionsRow(names, labels, this);
    addRow(m_columnsRow);
    connect(m_columnsRow, SIGNAL(signalColumnStateChanged(QString, int)), this,
                                 SLOT(slotColumnStateChanged(QString, int)));
}

void KvStatisticsMeasurementsTableOptionsWidget::addOrderRow()
{
    auto *row = new QWidget(this);
    auto *layout = new QVBoxLayout(row);
    layout->setContentsMargins(0, 0, 0, 0);
    layout->setSpacing(kSpacing);
    auto *label = new QLabel(tr("Order by:"), row);
    m_orderBox = new QComboBox(row);
    label->setBuddy(m_orderBox);
    layout->addWidget(label);
    layout->addWidget(m_orderBox);

    m_orderBox->addItem(tr("default"), QString());
    m_orderBox->setItemData(0, true, kAscendingRole);
    for (const QString &name : KvStatisticsMeasurementsTableNodeCfg::columnNames()) {
        const QString columnLabel = KvStatisticsMeasurementsTableNodeCfg::columnLabel(name);
        m_orderBox->addItem(tr("%1, ascending").arg(columnLabel), name);
        m_orderBox->setItemData(m_orderBox->count() - 1, true, kAscendingRole);
        m_orderBox->addItem(tr("%1, descending").arg(columnLabel), name);
        m_orderBox->setItemData(m_orderBox->count() - 1, false, kAscendingRole);
    }
    addRow(row);
    connect(m_orderBox, SIGNAL(currentIndexChanged(int)), this, SLOT(slotOrderBySelected()));
}

void KvStatisticsMeasurementsTableOptionsWidget::setFromConfig(const KvBaseEditorNodeCfg *cfg)
{
    const auto *tableCfg = qobject_cast<const KvStatisticsMeasurementsTableNodeCfg *>(cfg);
    if (!tableCfg)
        return;
    const QSignalBlocker blocker(this);
    if (m_widthRow)
        m_widthRow->setWidthPercent(tableCfg->widthPercent());
    if (m_alignmentRow)
        m_alignmentRow->setAlignment(tableCfg->alignment());
    m_themeRow->setChoice(tableCfg->themeIndex());
    m_columnsRow->setColumns(tableCfg->columns());

    const QSignalBlocker orderBlocker(m_orderBox);
    m_orderBox->setCurrentIndex(0);
    for (int i = 1; i < m_orderBox->count(); ++i) {
        if (m_orderBox->itemData(i, kColumnRole).toString() == tableCfg->orderColumn() &&
            m_orderBox->itemData(i, kAscendingRole).toBool() == tableCfg->isOrderAscending())
            m_orderBox->setCurrentIndex(i);
    }
}

void KvStatisticsMeasurementsTableOptionsWidget::selectAlignment(Qt::Alignment alignment)
{
    m_alignmentRow->setAlignment(alignment);
    if (!m_cfg)
        return;
    m_cfg->setAlignment(alignment);
    emit signalAlignmentChanged(alignment);
}

void KvStatisticsMeasurementsTableOptionsWidget::slotWidthEdited(int aWidth)
{
    if (!m_cfg)
        return;
    m_cfg->setWidthPercent(aWidth);
    emit signalWidthChanged(aWidth);
}

void KvStatisticsMeasurementsTableOptionsWidget::slotAlignLeftClicked()
{
    selectAlignment(Qt::AlignLeft);
}

void KvStatisticsMeasurementsTableOptionsWidget::slotAlignCenterClicked()
{
    // Only the centre value carries the vertical flag: part of the stored format.
    selectAlignment(Qt::AlignHCenter | Qt::AlignVCenter);
}

void KvStatisticsMeasurementsTableOptionsWidget::slotAlignRightClicked()
{
    selectAlignment(Qt::AlignRight);
}

void KvStatisticsMeasurementsTableOptionsWidget::slotThemeToggled()
{
    const int theme = m_themeRow->choice();
    if (!m_cfg || theme < 0)
        return;
    m_cfg->setTheme(theme);
    emit signalThemeChanged(static_cast<kvCharts::KvChartThemes::ThemeType>(theme));
}

void KvStatisticsMeasurementsTableOptionsWidget::slotColumnStateChanged(const QString &aName, int aState)
{
    if (!m_cfg)
        return;
    QSet<QString> columns = m_cfg->columns();
    if (aState == Qt::Checked)
        columns.insert(aName);
    else
        columns.remove(aName);
    m_cfg->setColumns(columns);
    emit signalColumnsChanged(columns);
}

void KvStatisticsMeasurementsTableOptionsWidget::slotOrderBySelected()
{
    if (!m_cfg)
        return;
    const QString column = m_orderBox->currentData(kColumnRole).toString();
    const bool ascending = m_orderBox->currentData(kAscendingRole).toBool();
    m_cfg->setOrder(column, ascending);
    emit signalOrderByChanged(column, ascending);
}
