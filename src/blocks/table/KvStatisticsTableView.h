// SPDX-License-Identifier: MIT
#pragma once

#include "blocks/table/KvBaseTableItemDelegate.h"

#include <QTableView>

class KvStatisticsBaseTableWidgetModel;

/**
 * The QTableView of a table piece: hidden headers, rows of one height, columns that share the width.
 *
 * Header rows of the report table are ordinary cells: a header view painted through a graphics proxy would
 * end up as a bitmap in the PDF.
 */
class KvStatisticsTableView : public QTableView
{
    Q_OBJECT
public:
    /** Neither \a model nor \a delegate is owned. */
    KvStatisticsTableView(KvStatisticsBaseTableWidgetModel *model, KvBaseTableItemDelegate *delegate,
                          QWidget *parent = nullptr);

    /** Divides the width among the columns as the model says. */
    void shareWidth();

protected:
    void paintEvent(QPaintEvent *event) override;
    void resizeEvent(QResizeEvent *event) override;

private:
    KvBaseTableItemDelegate::Geometry cellGeometry() const;

    KvStatisticsBaseTableWidgetModel *m_model;
    KvBaseTableItemDelegate *m_delegate;
};
