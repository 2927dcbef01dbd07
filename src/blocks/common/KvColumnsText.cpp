// SPDX-License-Identifier: MIT
#include "blocks/common/KvColumnsText.h"

#include <QStringList>

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

} // namespace KvColumnsText
