// SPDX-License-Identifier: MIT
#include "blocks/measurementstable/KvStatisticsMeasurementsTableOptionsWidget.h"

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
    : KvThemedOptionsWidget(tr("Measurements table"), parent)
    , m_cfg(cfg)
{
    if (withPlacement)
        addPlacementRows();
    addThemeRow();
    addColumnsRow(KvStatisticsMeasurementsTableNodeCfg::columnNames(),
                  &KvStatisticsMeasurementsTableNodeCfg::columnLabel);
    addOrderRow();
    setFromConfig(cfg);
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
    showPlacement(tableCfg->widthPercent(), tableCfg->alignment());
    showTheme(tableCfg->themeIndex());
    showColumns(tableCfg->columns());

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
    showAlignment(alignment);
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
    const int theme = chosenTheme();
    if (!m_cfg || theme < 0)
        return;
    m_cfg->setTheme(theme);
    emit signalThemeChanged(static_cast<kvCharts::KvChartThemes::ThemeType>(theme));
}

void KvStatisticsMeasurementsTableOptionsWidget::slotColumnStateChanged(const QString &aName, int aState)
{
    if (!m_cfg)
        return;
    m_cfg->setColumns(changedColumns(m_cfg->columns(), aName, aState));
    emit signalColumnsChanged(m_cfg->columns());
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
