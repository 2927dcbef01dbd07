// SPDX-License-Identifier: MIT
#pragma once

#include "blocks/table/KvStatisticsBaseTableWidget.h"
#include "blocks/table/KvTableFonts.h"

/** A table block that holds whatever a test puts into its grid. */
class PlainTable : public KvStatisticsBaseTableWidget
{
public:
    explicit PlainTable(KvStatisticsThemedNodeCfg *cfg, QWidget *displayParent = nullptr)
        : KvStatisticsBaseTableWidget(displayParent, cfg)
    {
        setFonts(KvTableFonts::header(), KvTableFonts::body());
    }

    QString displayName() const override { return QStringLiteral("Plain"); }
    QWidget *createOptionsWidget(QWidget *, bool) override { return nullptr; }

    /** Fills the grid with one header row and \a rows body rows of \a columns columns, and shows it. */
    void showRows(int rows, int columns = 2)
    {
        clear();
        for (int column = 0; column < columns; ++column)
            setHeaderCell(0, column, QStringLiteral("H%1").arg(column), 1);
        for (int row = 0; row < rows; ++row) {
            for (int column = 0; column < columns; ++column)
                setCell(row, column, QStringLiteral("%1/%2").arg(row).arg(column), false, 1);
        }
        finishUpdate();
    }

    using KvStatisticsBaseTableWidget::announceConfigChanged;
    using KvStatisticsBaseTableWidget::finishUpdate;
    using KvStatisticsBaseTableWidget::setFonts;
    using KvStatisticsBaseTableWidget::updatePageSplit;
    using KvStatisticsBaseTableWidget::updatePlacement;

    int width = 75;
    Qt::Alignment place = Qt::AlignHCenter | Qt::AlignVCenter;

protected:
    int widthPercent() const override { return width; }
    Qt::Alignment alignment() const override { return place; }
};
