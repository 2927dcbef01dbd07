// SPDX-License-Identifier: MIT
#pragma once

#include <QWidget>

#include <memory>

namespace kvCharts {
class KvChartThemes;
}
class KvBaseTableItemDelegate;
class KvStatisticsBaseTableWidgetModel;
class KvStatisticsTableView;
class KvStatisticsThemedNodeCfg;
class QTableView;
struct KvTableContents;

/**
 * One page piece of a table block. As wide as a page's content; the table in it takes its share of that
 * width.
 *
 * On screen the table is a QTableView. A piece that is made only to be printed has none: it paints the same
 * rows with the same delegate itself, since setting up hundreds of views costs more than all the drawing.
 */
class KvStatisticSubTable : public QWidget
{
    Q_OBJECT
public:
    /** \a cfg and \a delegate are not owned and outlive the piece. The piece has no view yet. */
    KvStatisticSubTable(KvStatisticsThemedNodeCfg *cfg, KvBaseTableItemDelegate *delegate,
                        QWidget *parent = nullptr);
    ~KvStatisticSubTable() override;

    /** Makes the view for the screen, once. */
    void ensureView();
    /** The view; null in a piece made for print. */
    QTableView *tableView() const;
    KvStatisticsBaseTableWidgetModel *model() const { return m_model; }

    /** Shows the header and \a bodyRows rows of the body from \a firstBodyRow on. */
    void fill(const std::shared_ptr<const KvTableContents> &contents, int firstBodyRow, int bodyRows);
    /** Shows nothing; takes the spans away, too. */
    void clear();

    /** Gives every row the height \a height in pixels. */
    void setRowHeight(int height);
    /** Merges cells; only for more than one row or column, since Qt warns of spans of one cell. */
    void setSpan(int row, int column, int rowSpan, int columnSpan);
    /** Applies the theme's style sheet to the view. */
    void applyStyle();

    /**
     * Fits the piece to a page: \a pageWidth is the width between the margins, \a tableWidth that of the
     * table, \a alignment its place (left, centre, right). The height follows from the rows.
     */
    void setPlacement(int pageWidth, int tableWidth, Qt::Alignment alignment);
    /** Height of the piece: its rows and a little room above and below, in pixels. */
    int contentsHeight() const;

    QSize sizeHint() const override;
    QSize minimumSizeHint() const override;

protected:
    void paintEvent(QPaintEvent *event) override;
    void resizeEvent(QResizeEvent *event) override;

private:
    QRect tableRect() const;
    void placeView();
    void applySpans();

    KvStatisticsThemedNodeCfg *m_cfg;
    KvStatisticsBaseTableWidgetModel *m_model;
    KvBaseTableItemDelegate *m_delegate;
    KvStatisticsTableView *m_view = nullptr;
    int m_rowHeight = 0;
    int m_tableWidth = -1; ///< negative: as wide as the piece
    Qt::Alignment m_alignment = Qt::AlignHCenter;
};
