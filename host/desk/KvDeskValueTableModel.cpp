// SPDX-License-Identifier: MIT
#include "KvDeskValueTableModel.h"

#include "kernel/ZtGsManipulator.h"
#include "kernel/ZtKernelData.h"

#include <QSet>

#include <algorithm>

namespace {

// Where the unit of a value's text begins, its blank included; the text's size when it has none.
int unitStart(const QString &text)
{
    const int blank = text.indexOf(QLatin1Char(' '));
    if (blank <= 0)
        return text.size();
    bool isNumber = false;
    text.leftRef(blank).toDouble(&isNumber);
    return isNumber ? blank : text.size();
}

// Numbers stand below each other in every language.
int alignmentOf(int column)
{
    const int numbers = Qt::AlignRight | Qt::AlignAbsolute;
    return Qt::AlignVCenter | (column == KvDeskValueTableModel::ValueColumn ? numbers : Qt::AlignLeft);
}

} // namespace

KvDeskValueTableModel::KvDeskValueTableModel(QObject *parent)
    : QAbstractTableModel(parent)
{
    connect(&m_changes, SIGNAL(signalChanged()), this, SLOT(slotRefresh()));
    slotRefresh();
}

int KvDeskValueTableModel::rowCount(const QModelIndex &parent) const
{
    return parent.isValid() ? 0 : m_rows.size();
}

int KvDeskValueTableModel::columnCount(const QModelIndex &parent) const
{
    return parent.isValid() ? 0 : ColumnCount;
}

QVariant KvDeskValueTableModel::data(const QModelIndex &index, int role) const
{
    if (!checkIndex(index, CheckIndexOption::IndexIsValid | CheckIndexOption::ParentIsInvalid))
        return QVariant();
    if (role == Qt::DisplayRole)
        return text(m_rows.at(index.row()), index.column());
    if (role == Qt::TextAlignmentRole)
        return alignmentOf(index.column());
    return QVariant();
}

QVariant KvDeskValueTableModel::headerData(int section, Qt::Orientation orientation, int role) const
{
    if (orientation != Qt::Horizontal || section < 0 || section >= ColumnCount)
        return QVariant();
    if (role == Qt::TextAlignmentRole)
        return alignmentOf(section);
    if (role != Qt::DisplayRole)
        return QVariant();
    const QString titles[ColumnCount] = {tr("Type"), tr("Object"), tr("Value name"), tr("Value")};
    return titles[section];
}

QString KvDeskValueTableModel::text(const KvDeskValueRow &row, int column) const
{
    switch (column) {
    case TypeColumn:
        return row.typeName;
    case ObjectColumn:
        return row.objectName;
    case NameColumn:
        return row.valueName;
    default:
        return row.text;
    }
}

QVector<int> KvDeskValueTableModel::rowsOf(const KvDeskObjectId &object) const
{
    QVector<int> found;
    for (int i = 0; i < m_rows.size(); ++i) {
        if (m_rows.at(i).object == object)
            found.append(i);
    }
    return found;
}

QString KvDeskValueTableModel::numberOf(const QString &text)
{
    return text.left(unitStart(text));
}

QString KvDeskValueTableModel::unitOf(const QString &text)
{
    return text.mid(unitStart(text) + 1);
}

void KvDeskValueTableModel::slotRefresh()
{
    QVector<KvDeskValueRow> rows = readRows();
    if (hasSameValues(rows)) {
        // Selection and scroll position stay.
        setRows(std::move(rows));
        if (!m_rows.isEmpty())
            emit dataChanged(index(0, 0), index(m_rows.size() - 1, ColumnCount - 1));
        return;
    }
    beginResetModel();
    setRows(std::move(rows));
    endResetModel();
}

void KvDeskValueTableModel::setRows(QVector<KvDeskValueRow> rows)
{
    m_rows = std::move(rows);
    QSet<QString> units;
    m_longestNumber.clear();
    for (const KvDeskValueRow &row : qAsConst(m_rows)) {
        const int start = unitStart(row.text);
        units.insert(row.text.mid(start + 1));
        if (start > m_longestNumber.size())
            m_longestNumber = row.text.left(start);
    }
    units.remove(QString());
    m_units = units.values();
}

bool KvDeskValueTableModel::hasSameValues(const QVector<KvDeskValueRow> &rows) const
{
    const auto isSame = [](const KvDeskValueRow &a, const KvDeskValueRow &b) { return a.isSameValue(b); };
    return std::equal(rows.begin(), rows.end(), m_rows.begin(), m_rows.end(), isSame);
}

QVector<KvDeskValueRow> KvDeskValueTableModel::readRows()
{
    const ZtKernelData *const kernel = ZtKernelData::getInstance();
    const QMap<int, ZtObjectMap> &all = kernel->objects();
    QVector<KvDeskValueRow> rows;
    for (auto type = all.constBegin(); type != all.constEnd(); ++type) {
        const ZtGsManipulator *const manipulator = kernel->getGsManipulator(type.key());
        if (!manipulator || !(manipulator->typeFlags(0) & ZtGsManipulator::MeasurementFlag))
            continue;
        for (auto object = type->constBegin(); object != type->constEnd(); ++object)
            readObject(*manipulator, {type.key(), object.key()}, object.value(), &rows);
    }
    return rows;
}

void KvDeskValueTableModel::readObject(const ZtGsManipulator &manipulator, const KvDeskObjectId &object,
                                       const ZtKernelObjectData *data, QVector<KvDeskValueRow> *rows)
{
    KvDeskValueRow row;
    row.object = object;
    row.typeName = manipulator.objectTypeName(object.id);
    row.objectName = manipulator.getObjectName(object.id);
    const QStringList shown = manipulator.valueSet(object.id);
    const QStringList names = manipulator.getValueNames();
    for (const QString &name : names) {
        if (!manipulator.isValueShown(name, shown))
            continue;
        row.valueName = name;
        row.text = manipulator.valueText(name, data);
        row.value = manipulator.value(name, data, row.kind).toDouble();
        if (!row.text.isEmpty())
            rows->append(row);
    }
}
