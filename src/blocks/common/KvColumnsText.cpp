// SPDX-License-Identifier: MIT
#include "blocks/common/KvColumnsText.h"

namespace KvColumnsText {

QString join(const QSet<QString> &columns)
{
    return columns.values().join(QLatin1Char(';'));
}

QSet<QString> split(const QString &text)
{
    const QStringList parts = text.split(QLatin1Char(';'), Qt::SkipEmptyParts);
    return QSet<QString>(parts.begin(), parts.end());
}

QVector<int> indexes(const QStringList &names, const QSet<QString> &columns)
{
    QVector<int> found;
    for (int i = 0; i < names.size(); ++i) {
        if (columns.contains(names.at(i)))
            found.append(i);
    }
    return found;
}

} // namespace KvColumnsText
