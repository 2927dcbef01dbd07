// SPDX-License-Identifier: MIT
#pragma once

#include <QRect>
#include <QStyledItemDelegate>
#include <QVector>

#include <memory>
#include <vector>

namespace kvCharts {
class KvChartThemes;
}
class KvStatisticsBaseTableWidgetModel;
class KvTextFit;

/**
 * Paints the cells of a table piece: flat background, one line of text, left and vertically centred,
 * shortened where it is too wide. Cells without colours of their own take the theme's.
 */
class KvBaseTableItemDelegate : public QStyledItemDelegate
{
    Q_OBJECT
public:
    /** \a themes is not owned and outlives the delegate. */
    explicit KvBaseTableItemDelegate(const kvCharts::KvChartThemes *themes, QObject *parent = nullptr);
    ~KvBaseTableItemDelegate() override;

    void paint(QPainter *painter, const QStyleOptionViewItem &option,
               const QModelIndex &index) const override;

    /** Where cells lie: left edges of the columns (and the right end), top of the first row, height of every
     * row. */
    struct Geometry
    {
        QVector<int> columnEdges;
        int top = 0;
        int rowHeight = 0;

        int rowTop(int row) const { return top + row * rowHeight; }
        QRect cellRect(int row, int column, int columnSpan) const; ///< without its grid lines
    };

    /**
     * Paints rows first..last of a model in layers: backgrounds, grid lines, texts. One change of colour and
     * font per layer instead of several per cell keeps PDF files small and printing quick. A header cell that
     * spans columns covers those at its right; spans of the body do not count.
     */
    void paintRows(QPainter *painter, const KvStatisticsBaseTableWidgetModel &model, const Geometry &geometry,
                   int first, int last) const;

    /** Whether \a text is shortened in a cell of \a cellWidth pixels. */
    bool isShortened(const QString &text, const QFont &font, int cellWidth) const;

    /** \a width of a column, or as much more as it needs to show \a text whole; padding and grid line are
     * part of it. */
    int widthFor(const QString &text, const QFont &font, int width) const;

protected:
    bool helpEvent(QHelpEvent *event, QAbstractItemView *view, const QStyleOptionViewItem &option,
                   const QModelIndex &index) override;

private:
    const KvTextFit &textFit(const QFont &font) const;
    void paintGrid(QPainter *painter, const Geometry &geometry, int first, int last) const;
    void paintTexts(QPainter *painter, const KvStatisticsBaseTableWidgetModel &model,
                    const Geometry &geometry, int first, int last) const;
    void paintText(QPainter *painter, const KvTextFit &fit, const QRect &cell, const QString &text) const;

    const kvCharts::KvChartThemes *m_themes;
    mutable std::vector<std::unique_ptr<KvTextFit>> m_fits; ///< one per font in use
};
