// SPDX-License-Identifier: MIT
#include "blocks/common/KvThemedOptionsWidget.h"

#include "blocks/common/KvAlignmentOptionsRow.h"
#include "blocks/common/KvColumnsOptionsRow.h"
#include "blocks/common/KvGroupByOptionsRow.h"
#include "blocks/common/KvThemeOptionsRow.h"
#include "blocks/common/KvWidthOptionsRow.h"

KvThemedOptionsWidget::KvThemedOptionsWidget(const QString &heading, QWidget *parent)
    : KvBaseOptionsWidget(heading, parent)
{
    qRegisterMetaType<Qt::Alignment>("Qt::Alignment");
    qRegisterMetaType<QSet<QString>>("QSet<QString>");
}

void KvThemedOptionsWidget::addPlacementRows()
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

void KvThemedOptionsWidget::addThemeRow()
{
    m_themeRow = new KvThemeOptionsRow(this);
    addRow(m_themeRow);
    connect(m_themeRow, SIGNAL(signalToggled()), this, SLOT(slotThemeToggled()));
}

void KvThemedOptionsWidget::addGroupByRow()
{
    m_groupByRow = new KvGroupByOptionsRow(this);
    addRow(m_groupByRow);
    connect(m_groupByRow, SIGNAL(signalToggled()), this, SLOT(slotGroupByToggled()));
}

void KvThemedOptionsWidget::addColumnsRow(const QStringList &names, QString (*labelOf)(const QString &))
{
    QStringList labels;
    for (const QString &name : names)
        labels.append(labelOf(name));
    m_columnsRow = new KvColumnsOptionsRow(names, labels, this);
    addRow(m_columnsRow);
    connect(m_columnsRow, SIGNAL(signalColumnStateChanged(QString, int)), this,
                                 SLOT(slotColumnStateChanged(QString, int)));
}

void KvThemedOptionsWidget::showPlacement(int widthPercent, Qt::Alignment alignment)
{
    if (m_widthRow)
        m_widthRow->setWidthPercent(widthPercent);
    showAlignment(alignment);
}

void KvThemedOptionsWidget::showAlignment(Qt::Alignment alignment)
{
    if (m_alignmentRow)
        m_alignmentRow->setAlignment(alignment);
}

void KvThemedOptionsWidget::showTheme(int theme)
{
    if (m_themeRow)
        m_themeRow->setChoice(theme);
}

void KvThemedOptionsWidget::showGrouping(int grouping)
{
    if (m_groupByRow)
        m_groupByRow->setGrouping(grouping);
}

void KvThemedOptionsWidget::showColumns(const QSet<QString> &columns)
{
    if (m_columnsRow)
        m_columnsRow->setColumns(columns);
}

int KvThemedOptionsWidget::chosenTheme() const
{
    return m_themeRow ? m_themeRow->choice() : -1;
}

int KvThemedOptionsWidget::chosenGrouping() const
{
    return m_groupByRow ? m_groupByRow->grouping() : -1;
}

QSet<QString> KvThemedOptionsWidget::changedColumns(const QSet<QString> &columns, const QString &name,
                                                    int state)
{
    QSet<QString> changed = columns;
    if (state == Qt::Checked)
        changed.insert(name);
    else
        changed.remove(name);
    return changed;
}
