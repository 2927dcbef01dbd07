// SPDX-License-Identifier: MIT
#include "measuring/ZtFault.h"

#include "kernel/ZtLeftToRight.h"

QString ZtFault::text() const
{
    if (isNull())
        return QString();
    QString where = file;
    if (line > 0) {
        where += QLatin1Char(':') + QString::number(line);
        if (column > 0)
            where += QLatin1Char(':') + QString::number(column);
    }
    const QString separator = QStringLiteral(": ");
    if (!place.isEmpty())
        where += (where.isEmpty() ? QString() : separator) + place;
    return where.isEmpty() ? message : ZtLeftToRight::isolated(where) + separator + message;
}
