// SPDX-License-Identifier: MIT
#include "blocks/measurementstable/KvMeasurementsOrder.h"

#include <algorithm>
#include <cmath>
#include <numeric>

namespace {

// A value prepared for comparing. QVariant's own operators give no strict weak order for NaN and for texts.
struct ValueKey
{
    enum Rank { Number, NotANumber, Text };

    Rank rank = Number;
    double number = 0.0;
    QString text;

    bool operator<(const ValueKey &other) const
    {
        if (rank != other.rank)
            return rank < other.rank;
        return rank == Number ? number < other.number : text < other.text;
    }
};

ValueKey keyOf(const QVariant &value)
{
    ValueKey key;
    if (value.userType() == QMetaType::QString || !value.canConvert<double>()) {
        key.rank = ValueKey::Text;
        key.text = value.toString();
        return key;
    }
    key.number = value.toDouble();
    if (std::isnan(key.number)) {
        key.rank = ValueKey::NotANumber;
        key.number = 0.0;
    }
    return key;
}

template <typename Key>
void sortByKeys(QVector<int> &order, const QVector<Key> &keys, bool ascending)
{
    if (ascending)
        std::sort(order.begin(), order.end(), [&keys](int a, int b) { return keys.at(a) < keys.at(b); });
    else
        std::sort(order.begin(), order.end(), [&keys](int a, int b) { return keys.at(b) < keys.at(a); });
}

QVector<ValueKey> valueKeys(const QVector<KvMeasuredValue> &records)
{
    QVector<ValueKey> keys;
    keys.reserve(records.size());
    for (const KvMeasuredValue &record : records)
        keys.append(keyOf(record.value));
    return keys;
}

QVector<QString> textKeys(const QVector<KvMeasuredValue> &records, QString KvMeasuredValue::*member)
{
    QVector<QString> keys;
    keys.reserve(records.size());
    for (const KvMeasuredValue &record : records)
        keys.append(record.*member);
    return keys;
}

} // namespace

namespace KvMeasurementsOrder {

QVector<int> sorted(const QVector<KvMeasuredValue> &records, const QString &column, bool ascending)
{
    QVector<int> order(records.size());
    std::iota(order.begin(), order.end(), 0);
    if (column == QLatin1String("Object Name"))
        sortByKeys(order, textKeys(records, &KvMeasuredValue::objectName), ascending);
    else if (column == QLatin1String("Object Type"))
        sortByKeys(order, textKeys(records, &KvMeasuredValue::objectTypeName), ascending);
    else if (column == QLatin1String("Value Name"))
        sortByKeys(order, textKeys(records, &KvMeasuredValue::valueName), ascending);
    else if (column == QLatin1String("Value"))
        sortByKeys(order, valueKeys(records), ascending);
    return order;
}

} // namespace KvMeasurementsOrder
