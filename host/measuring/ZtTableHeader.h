// SPDX-License-Identifier: MIT
#pragma once

#include "measuring/ZtMeasuringGlobal.h"

#include <QString>
#include <QStringList>
#include <QVector>

/** The heading of one column, taken apart. */
struct ZT_MEASURING_EXPORT ZtTableHeader
{
    QString written;  ///< as in the file, without blanks around it
    QString name;     ///< display name of the column's values; empty when the file gives none
    QString unitText; ///< unit that the heading states; empty when it states none

    /**
     * Takes a heading apart: "Area [mm²]", "Length (mm)", "Length / mm" and "bill_length_mm" state a unit. A
     * suffix after an underscore is a unit only when it is a well-known one; remaining underscores stand for
     * blanks.
     */
    static ZtTableHeader parse(const QString &text);

    /** Lower case, with underscores for blanks and hyphens: for comparing headings. */
    QString key() const;

    /**
     * Position of the column that the user means by \a name: as written, by its display name, or by either in
     * another letter case, in this order; -1 when there is none.
     */
    static int find(const QVector<ZtTableHeader> &headers, const QString &name);

    /** Position of the first of \a keys that any heading but that of column \a except has; -1 when there is
     * none. */
    static int findKey(const QVector<ZtTableHeader> &headers, const QStringList &keys, int except = -1);
};
