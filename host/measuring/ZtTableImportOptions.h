// SPDX-License-Identifier: MIT
#pragma once

#include <QString>
#include <QStringList>

/** What the user knows about a table that the table does not say. */
struct ZtTableImportOptions
{
    enum DecimalMark { DetectMark, Point, Comma };

    /**
     * Units: "mm" for all values that state none, or "Area=mm2" for one value, whatever the table says about
     * it. The last one wins.
     */
    QStringList units;
    QString typeColumn; ///< heading of the column with the object types; empty to find it
    QString nameColumn; ///< heading of the column with the object names; empty to find it
    DecimalMark decimalMark = DetectMark;
    qint64 maximumBytes = 512LL * 1024 * 1024; ///< larger tables are refused
};
