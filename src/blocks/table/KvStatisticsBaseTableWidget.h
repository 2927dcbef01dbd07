// SPDX-License-Identifier: MIT
#pragma once

#include "blocks/table/KvTablePageSplit.h"
#include "report/KvBaseDisplayWidget.h"

#include <QList>
#include <QObject>
#include <QPointer>

#include <memory>

class KvBaseTableItemDelegate;
class KvStatisticSubTable;
class KvStatisticsEngine;
class KvStatisticsThemedNodeCfg;
class KvTableGrid;
class QFont;
struct KvTableContents;

/**
 * Display object of a table block: collects the table as a grid of cells and shows it in page-sized pieces,
 * each under the same header rows.
 *
 * Not a widget itself; its pieces are. Derived classes fill the grid (startUpdate(), setHeaderCell(),
 * setCell(), then finishUpdate()) and answer where the table stands.
 */
class KvStatisticsBaseTableWidget
    : public QObject
    , public KvBaseDisplayWidget
{
    Q_OBJECT
public:
    ~KvStatisticsBaseTableWidget() override;

    int subWidgetCount() override;
    /** The piece \a index, made and filled on first request; null for an index without a piece. */
    QWidget *subWidgetAt(int index) override;

    void setHeaderCell(int row, int column, const QString &text, int columnSpan);
    /** A flagged cell is drawn in the warning colour. */
    void setCell(int row, int column, const QString &text, bool flagged, int columnSpan);
    void clear();
    KvStatisticSubTable *addSubTable();
    /** Shows page \a page of the grid in \a subTable. */
    void fillSubTable(KvStatisticSubTable *subTable, int page);

    int bodyRowCount() const;
    int columnCount() const;
    const KvTablePageSplit &pageSplit() const { return m_split; }
    const QList<KvStatisticSubTable *> &subTables() const { return m_subTables; }

protected:
    /** \a cfg is not owned and outlives the block; pieces become children of \a displayParent, which may be
     * null. */
    KvStatisticsBaseTableWidget(QWidget *displayParent, KvStatisticsThemedNodeCfg *cfg);

    void setFonts(const QFont &headerFont, const QFont &bodyFont);
    /** Connects measurements, theme and page height by name to slotUpdateTableContents() and
     * slotContentHeightChanged(), which every table block declares. */
    void connectSources();
    /** Connects what the panels of all table blocks have by name to the block's slotWidthChanged(int),
     * slotAlignmentChanged(), slotThemeChanged() and slotColumnsChanged(). */
    void connectOptions(QWidget *options);
    /**
     * Empties the grid for a new filling, which finishUpdate() ends. Unlike clear() it leaves the pieces
     * alone: they are refilled at the end, and every reset of a piece costs as much as filling it.
     */
    void startUpdate();
    /** Makes room for a grid of known size. */
    void reserve(int bodyRows, int columns);
    /**
     * Lets columns with long texts take room from those with short ones; called between startUpdate() and
     * finishUpdate() by tables of few rows. Otherwise all columns are equal. The first \a yieldingColumns
     * give way where the width is too small: names can be cut, a number that is cut would be read as another
     * one.
     */
    void fitColumnsToTexts(int yieldingColumns);
    /** Cuts the filled grid into pieces, refills them and tells the layout what changed. */
    void finishUpdate();
    /** Cuts the same grid anew after the page's content height changed. */
    void updatePageSplit();
    /** Places all pieces anew after a change of width, alignment or page. */
    void updatePlacement();
    /** After the user changed an option: tells the window, which may save it, and marks the template
     * modified. */
    void announceConfigChanged();
    /**
     * Whether \a current differs from \a announced, which becomes equal to it; the change is announced then.
     * The options panel has written to the configuration before, so the configuration cannot tell what
     * changed.
     */
    template <typename Options>
    bool announceChange(const Options &current, Options &announced)
    {
        if (current == announced)
            return false;
        announced = current;
        announceConfigChanged();
        return true;
    }
    /** Takes over the theme that the user chose and announces a real change. The themes object announces it
     * itself, which refills the table. */
    void changeTheme(int theme);

    /** Width of the table in percent of the width between the margins. */
    virtual int widthPercent() const = 0;
    virtual Qt::Alignment alignment() const = 0;

    KvStatisticsEngine &engine() const { return m_engine; }

private slots:
    void slotSubTableDestroyed(QObject *aSubTable);

private:
    void widenColumns(const KvTableGrid &grid, const QFont &font);
    KvTablePageSplit computeSplit() const;
    void applySplit(const KvTablePageSplit &split);
    void dropSurplusSubTables();
    void place(KvStatisticSubTable *subTable) const;

    KvStatisticsEngine &m_engine;
    KvStatisticsThemedNodeCfg *m_cfg;
    int m_announcedTheme;
    QPointer<QWidget> m_displayParent;
    std::unique_ptr<KvBaseTableItemDelegate> m_delegate;
    float m_scale = 1.0f; ///< reserved for zoomed tables; nothing reads it
    std::shared_ptr<KvTableContents> m_contents;
    KvTablePageSplit m_split;
    QList<KvStatisticSubTable *> m_subTables;
};
