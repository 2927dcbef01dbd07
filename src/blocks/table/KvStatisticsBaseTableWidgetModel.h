// SPDX-License-Identifier: MIT
#pragma once

#include <QAbstractTableModel>

#include <memory>

struct KvTableCell;
struct KvTableContents;
class QFont;

/**
 * Model of one page piece of a table: all header rows, followed by a run of body rows.
 *
 * Shows a part of the block's contents without copying them. A cell has a text (display role), a font, an
 * alignment, a text colour and a background colour; the last two are invalid colours where the theme decides.
 */
class KvStatisticsBaseTableWidgetModel : public QAbstractTableModel
{
    Q_OBJECT
public:
    /** Every cell is aligned left and centred vertically. */
    static constexpr int CellAlignment = 129;

    explicit KvStatisticsBaseTableWidgetModel(QObject *parent = nullptr);
    ~KvStatisticsBaseTableWidgetModel() override;

    /** Shows the header of \a contents and \a bodyRows of its body rows from \a firstBodyRow on; resets the
     * model. */
    void setPart(std::shared_ptr<const KvTableContents> contents, int firstBodyRow, int bodyRows);
    /** Shows nothing; resets the model unless it is empty already. */
    void clear();

    int rowCount(const QModelIndex &parent = QModelIndex()) const override;
    int columnCount(const QModelIndex &parent = QModelIndex()) const override;
    QVariant data(const QModelIndex &index, int role = Qt::DisplayRole) const override;

    int headerRowCount() const { return m_headerRows; }
    /** Index in the whole body of the first row shown. */
    int firstBodyRow() const { return m_firstBodyRow; }
    bool hasHeaderSpans() const;
    /** The cell at a position, or null; quicker than data() where many cells are drawn. */
    const KvTableCell *cell(int row, int column) const;
    const QFont &rowFont(int row) const;
    /** Left edges of the columns, and the right end of the last one, in a table of \a width pixels. */
    QVector<int> columnEdges(int left, int width) const;

private:
    std::shared_ptr<const KvTableContents> m_contents;
    int m_headerRows = 0;
    int m_firstBodyRow = 0;
    int m_bodyRows = 0;
    int m_columns = 0;
};
