// SPDX-License-Identifier: MIT
#pragma once

#include "blocks/common/KvBaseOptionsWidget.h"

#include <QSet>
#include <QStringList>

class KvAlignmentOptionsRow;
class KvColumnsOptionsRow;
class KvGroupByOptionsRow;
class KvThemeOptionsRow;
class KvWidthOptionsRow;

/**
 * Base of the options panels of tables and charts: rows for width, alignment, colour theme, grouping and
 * columns.
 *
 * The panels' constructors add the rows that they want, top to bottom. Each row is connected by name to slots
 * that the panel itself declares; what is shown goes through the show functions, which emit nothing.
 */
class KvThemedOptionsWidget : public KvBaseOptionsWidget
{
    Q_OBJECT
protected:
    KvThemedOptionsWidget(const QString &heading, QWidget *parent);

    /** Adds the rows for width and alignment; they call slotWidthEdited(int), slotAlignLeftClicked(),
     * slotAlignCenterClicked() and slotAlignRightClicked(). */
    void addPlacementRows();
    void addThemeRow();   ///< calls slotThemeToggled()
    void addGroupByRow(); ///< calls slotGroupByToggled()
    /** One check box per column; they call slotColumnStateChanged(QString,int). */
    void addColumnsRow(const QStringList &names, QString (*labelOf)(const QString &));

    /** Without placement rows there is nothing to show, and nothing happens. */
    void showPlacement(int widthPercent, Qt::Alignment alignment);
    void showAlignment(Qt::Alignment alignment);
    void showTheme(int theme);
    void showGrouping(int grouping);
    void showColumns(const QSet<QString> &columns);

    int chosenTheme() const;    ///< index of the theme, or -1
    int chosenGrouping() const; ///< 0 by measurement, 1 by object, or -1

    /** \a columns after the check box of one of them changed; unknown names stay. */
    static QSet<QString> changedColumns(const QSet<QString> &columns, const QString &name, int state);

private:
    KvWidthOptionsRow *m_widthRow = nullptr;
    KvAlignmentOptionsRow *m_alignmentRow = nullptr;
    KvThemeOptionsRow *m_themeRow = nullptr;
    KvGroupByOptionsRow *m_groupByRow = nullptr;
    KvColumnsOptionsRow *m_columnsRow = nullptr;
};
