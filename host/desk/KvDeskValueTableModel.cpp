// SPDX-License-Identifier: MIT
#include "KvDeskValueTableModel.h"

#include "kernel/ZtGsManipulator.h"
#include "kernel/ZtKernelData.h"
#include "measuring/ZtDrawnType.h"

#include <algorithm>
#include <numeric>

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

const ZtKernelData *kernel()
{
    return ZtKernelData::getInstance();
}

// Null for types whose objects are no measurements.
const ZtGsManipulator *measuringManipulator(int type)
{
    const ZtGsManipulator *const manipulator = kernel()->getGsManipulator(type);
    const bool measures = manipulator && (manipulator->typeFlags(0) & ZtGsManipulator::MeasurementFlag);
    return measures ? manipulator : nullptr;
}

int objectCount(int type)
{
    const auto objects = kernel()->objects().constFind(type);
    return objects == kernel()->objects().constEnd() ? 0 : objects->size();
}

// Shares of a whole change with every object that is part of it.
bool haveShares(int type)
{
    const ZtDrawnType *const drawn = ZtDrawnType::find(type);
    return drawn && std::any_of(drawn->values.begin(), drawn->values.end(),
                                [](const ZtDrawnValue &value) { return !value.measure; });
}

QVector<int> allRows(std::size_t count)
{
    QVector<int> rows(static_cast<int>(count));
    std::iota(rows.begin(), rows.end(), 0);
    return rows;
}

} // namespace

KvDeskValueTableModel::KvDeskValueTableModel(QObject *parent)
    : QAbstractTableModel(parent)
{
    // The C locale compares bytes and cannot count.
    if (QLocale().language() == QLocale::C)
        m_collator.setLocale(QLocale(QLocale::English));
    m_collator.setNumericMode(true);
    m_collator.setCaseSensitivity(Qt::CaseInsensitive);
    connect(&m_changes, SIGNAL(signalChanged()), this, SLOT(slotRefresh()));
    readAll(&m_objects, &m_rows);
}

int KvDeskValueTableModel::rowCount(const QModelIndex &parent) const
{
    return parent.isValid() ? 0 : static_cast<int>(m_rows.size());
}

int KvDeskValueTableModel::columnCount(const QModelIndex &parent) const
{
    return parent.isValid() ? 0 : ColumnCount;
}

QVariant KvDeskValueTableModel::data(const QModelIndex &index, int role) const
{
    if (!checkIndex(index, CheckIndexOption::IndexIsValid | CheckIndexOption::ParentIsInvalid))
        return QVariant();
    if (role == Qt::DisplayRole || (role == Qt::EditRole && index.column() == ObjectColumn))
        return text(index.row(), index.column());
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
    // The tool tip has it where a narrow column cuts it.
    if (role != Qt::DisplayRole && role != Qt::ToolTipRole)
        return QVariant();
    const QString titles[ColumnCount] = {tr("Type"), tr("Object"), tr("Value name"), tr("Value")};
    return titles[section];
}

Qt::ItemFlags KvDeskValueTableModel::flags(const QModelIndex &index) const
{
    const Qt::ItemFlags flags = QAbstractTableModel::flags(index);
    return index.isValid() && index.column() == ObjectColumn ? flags | Qt::ItemIsEditable : flags;
}

bool KvDeskValueTableModel::setData(const QModelIndex &index, const QVariant &value, int role)
{
    if (!index.isValid() || role != Qt::EditRole || index.column() != ObjectColumn)
        return false;
    const KvDeskObjectId object = row(index.row()).object;
    const QString name = value.toString().simplified();
    if (name != text(index.row(), ObjectColumn))
        emit signalRenamed(object.type, object.id, name);
    return true;
}

QString KvDeskValueTableModel::text(int row, int column) const
{
    const KvDeskValueRow &shown = this->row(row);
    if (column == ObjectColumn)
        return m_objects[static_cast<std::size_t>(shown.objectIndex)].name;
    // Between a change of the kernel and its announcement, what a row stands for may be gone.
    const ZtGsManipulator *const manipulator = kernel()->getGsManipulator(shown.object.type);
    if (!manipulator)
        return QString();
    if (column == TypeColumn)
        return manipulator->objectTypeName(shown.object.id);
    const QString name = manipulator->getValueNames().value(shown.position);
    if (column == NameColumn)
        return name;
    const ZtKernelObjectData *const data = kernel()->object(shown.object.type, shown.object.id);
    return data ? manipulator->valueText(name, data) : QString();
}

std::size_t KvDeskValueTableModel::lowerBound(const KvDeskObjectId &id) const
{
    const auto isBefore = [](const Object &object, const KvDeskObjectId &wanted) {
        return object.id < wanted;
    };
    const auto found = std::lower_bound(m_objects.begin(), m_objects.end(), id, isBefore);
    return static_cast<std::size_t>(found - m_objects.begin());
}

bool KvDeskValueTableModel::isKnown(const KvDeskObjectId &id) const
{
    const std::size_t index = lowerBound(id);
    return index < m_objects.size() && m_objects[index].id == id;
}

int KvDeskValueTableModel::knownCount(int type) const
{
    return static_cast<int>(lowerBound({type + 1, 0}) - lowerBound({type, 0}));
}

KvDeskValueTableModel::Range KvDeskValueTableModel::rowsAt(std::size_t object) const
{
    const int first = m_objects[object].firstRow;
    const int end = object + 1 < m_objects.size() ? m_objects[object + 1].firstRow : rowCount();
    return {first, end - first};
}

KvDeskValueTableModel::Range KvDeskValueTableModel::rowsOf(const KvDeskObjectId &object) const
{
    return isKnown(object) ? rowsAt(lowerBound(object)) : Range();
}

int KvDeskValueTableModel::rowOf(const KvDeskObjectId &object, int position) const
{
    const Range rows = rowsOf(object);
    for (int row = rows.first; row < rows.first + rows.count; ++row) {
        if (this->row(row).position == position)
            return row;
    }
    return -1;
}

const QCollatorSortKey &KvDeskValueTableModel::sortKey(int row, int column) const
{
    const KvDeskValueRow &shown = this->row(row);
    if (column == ObjectColumn) {
        const Object &object = m_objects[static_cast<std::size_t>(shown.objectIndex)];
        if (!object.sortKey)
            object.sortKey = m_collator.sortKey(object.name);
        return *object.sortKey;
    }
    if (column == TypeColumn) {
        auto found = m_typeKeys.constFind(shown.object.type);
        if (found == m_typeKeys.constEnd())
            found = m_typeKeys.insert(shown.object.type, m_collator.sortKey(text(row, column)));
        return *found;
    }
    const QPair<int, int> name(shown.object.type, shown.position);
    auto found = m_nameKeys.constFind(name);
    if (found == m_nameKeys.constEnd())
        found = m_nameKeys.insert(name, m_collator.sortKey(text(row, column)));
    return *found;
}

int KvDeskValueTableModel::compareTexts(int left, int right, int column) const
{
    return sortKey(left, column).compare(sortKey(right, column));
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
    const KvDeskObjectChanges::Batch &batch = m_changes.batch();
    Moves moves;
    if (!sortOut(batch, &moves))
        reset();
    else if (batch.isReadingChanged)
        readAgain();
    else
        apply(moves);
}

// False when the batch does not tell all that happened, or when it is quicker to read everything.
bool KvDeskValueTableModel::sortOut(const KvDeskObjectChanges::Batch &batch, Moves *moves) const
{
    const auto isShown = [this](int type) { return measuringManipulator(type) || knownCount(type) > 0; };
    if (std::any_of(batch.emptiedTypes.begin(), batch.emptiedTypes.end(), isShown))
        return false;
    for (const KvDeskObjectId &id : batch.objects) {
        const bool isThere = measuringManipulator(id.type) && kernel()->object(id.type, id.id);
        if (isKnown(id))
            (isThere ? moves->changed : moves->went).append(id);
        else if (isThere)
            moves->came.append(id);
    }
    if (moves->came.size() + moves->went.size() > maximumMoves || !isInStep(*moves))
        return false;
    addDependent(batch.objects, moves);
    return true;
}

// One announcement may stand for all objects of a type, after many came silently.
bool KvDeskValueTableModel::isInStep(const Moves &moves) const
{
    QHash<int, int> counts;
    for (const KvDeskObjectId &id : moves.changed) {
        if (!counts.contains(id.type))
            counts.insert(id.type, knownCount(id.type));
    }
    for (const KvDeskObjectId &id : moves.came + moves.went) {
        if (!counts.contains(id.type))
            counts.insert(id.type, knownCount(id.type));
        counts[id.type] += isKnown(id) ? -1 : 1;
    }
    for (auto it = counts.constBegin(); it != counts.constEnd(); ++it) {
        if (it.value() != objectCount(it.key()))
            return false;
    }
    return true;
}

void KvDeskValueTableModel::addDependent(const QSet<KvDeskObjectId> &touched, Moves *moves) const
{
    QSet<int> types;
    for (const KvDeskObjectId &id : touched) {
        if (haveShares(id.type))
            types.insert(id.type);
    }
    for (const int type : qAsConst(types)) {
        for (std::size_t i = lowerBound({type, 0}); i < m_objects.size() && m_objects[i].id.type == type;
             ++i) {
            if (!touched.contains(m_objects[i].id))
                moves->changed.append(m_objects[i].id);
        }
    }
}

void KvDeskValueTableModel::reset()
{
    beginResetModel();
    m_objects.clear();
    m_rows.clear();
    m_typeKeys.clear();
    m_nameKeys.clear();
    readAll(&m_objects, &m_rows);
    endResetModel();
}

// Selection and scroll position stay where the rows do.
void KvDeskValueTableModel::readAgain()
{
    Objects objects;
    Rows rows;
    readAll(&objects, &rows);
    const auto isSame = [](const KvDeskValueRow &a, const KvDeskValueRow &b) { return a.isSameValue(b); };
    if (!std::equal(rows.begin(), rows.end(), m_rows.begin(), m_rows.end(), isSame)) {
        reset();
        return;
    }
    m_objects = std::move(objects);
    m_rows = std::move(rows);
    announceRows(allRows(m_rows.size()), true);
}

void KvDeskValueTableModel::apply(const Moves &moves)
{
    for (const KvDeskObjectId &id : moves.went)
        removeObject(id);
    for (const KvDeskObjectId &id : moves.came)
        insertObject(id);
    QVector<KvDeskObjectId> changed = moves.changed;
    std::sort(changed.begin(), changed.end());
    changeObjects(changed);
}

void KvDeskValueTableModel::insertObject(const KvDeskObjectId &id)
{
    const std::size_t index = lowerBound(id);
    Object object;
    object.id = id;
    object.firstRow = index < m_objects.size() ? m_objects[index].firstRow : rowCount();
    m_objects.insert(m_objects.begin() + static_cast<std::ptrdiff_t>(index), object);
    for (auto row = m_rows.begin() + object.firstRow; row != m_rows.end(); ++row)
        ++row->objectIndex;
    Rows rows;
    readObject(&m_objects[index], &rows);
    replaceRows(index, rows);
}

void KvDeskValueTableModel::removeObject(const KvDeskObjectId &id)
{
    const std::size_t index = lowerBound(id);
    const int firstRow = m_objects[index].firstRow;
    replaceRows(index, Rows());
    m_objects.erase(m_objects.begin() + static_cast<std::ptrdiff_t>(index));
    for (auto row = m_rows.begin() + firstRow; row != m_rows.end(); ++row)
        --row->objectIndex;
}

// Puts rows in the place of those that an object has.
void KvDeskValueTableModel::replaceRows(std::size_t index, Rows rows)
{
    const Range old = rowsAt(index);
    const int count = static_cast<int>(rows.size());
    for (KvDeskValueRow &row : rows)
        row.objectIndex = static_cast<int>(index);
    if (old.count > 0) {
        beginRemoveRows(QModelIndex(), old.first, old.first + old.count - 1);
        m_rows.erase(m_rows.begin() + old.first, m_rows.begin() + old.first + old.count);
        shiftRows(index + 1, -old.count);
        endRemoveRows();
    }
    if (count > 0) {
        beginInsertRows(QModelIndex(), old.first, old.first + count - 1);
        m_rows.insert(m_rows.begin() + old.first, rows.begin(), rows.end());
        shiftRows(index + 1, count);
        endInsertRows();
    }
}

void KvDeskValueTableModel::shiftRows(std::size_t fromObject, int count)
{
    for (std::size_t i = fromObject; i < m_objects.size(); ++i)
        m_objects[i].firstRow += count;
}

void KvDeskValueTableModel::changeObjects(const QVector<KvDeskObjectId> &ids)
{
    QVector<int> changedRows;
    QVector<KvDeskObjectId> reshaped;
    bool namesChanged = false;
    for (const KvDeskObjectId &id : ids) {
        const std::size_t index = lowerBound(id);
        Object object;
        object.id = id;
        Rows rows;
        readObject(&object, &rows);
        if (!hasRows(index, rows)) {
            reshaped.append(id);
            continue;
        }
        namesChanged = rename(index, object.name) || namesChanged;
        const Range range = rowsAt(index);
        for (int i = 0; i < range.count; ++i) {
            KvDeskValueRow &row = rows[static_cast<std::size_t>(i)];
            row.objectIndex = static_cast<int>(index);
            m_rows[static_cast<std::size_t>(range.first + i)] = row;
            changedRows.append(range.first + i);
        }
    }
    announceRows(changedRows, namesChanged);
    // One by one: whoever sorts the rows needs all but the coming ones in their order.
    for (const KvDeskObjectId &id : qAsConst(reshaped))
        reshapeObject(lowerBound(id));
}

void KvDeskValueTableModel::reshapeObject(std::size_t index)
{
    Object object;
    object.id = m_objects[index].id;
    Rows rows;
    readObject(&object, &rows);
    replaceRows(index, Rows());
    rename(index, object.name);
    replaceRows(index, rows);
}

bool KvDeskValueTableModel::rename(std::size_t index, const QString &name)
{
    if (m_objects[index].name == name)
        return false;
    m_objects[index].name = name;
    m_objects[index].sortKey.reset();
    return true;
}

// Whether an object has just these rows, with whatever values.
bool KvDeskValueTableModel::hasRows(std::size_t index, const Rows &rows) const
{
    const Range range = rowsAt(index);
    const auto first = m_rows.begin() + range.first;
    const auto isSame = [](const KvDeskValueRow &a, const KvDeskValueRow &b) { return a.isSameValue(b); };
    return std::equal(first, first + range.count, rows.begin(), rows.end(), isSame);
}

void KvDeskValueTableModel::announceRows(const QVector<int> &rows, bool namesChanged)
{
    if (rows.isEmpty())
        return;
    emit signalRowsChanged(rows, namesChanged);
    const int column = namesChanged ? 0 : static_cast<int>(ValueColumn);
    emit dataChanged(index(rows.first(), column), index(rows.last(), ValueColumn));
}

void KvDeskValueTableModel::readAll(Objects *objects, Rows *rows)
{
    const QMap<int, ZtObjectMap> &all = kernel()->objects();
    for (auto type = all.constBegin(); type != all.constEnd(); ++type) {
        if (!measuringManipulator(type.key()))
            continue;
        objects->reserve(objects->size() + static_cast<std::size_t>(type->size()));
        for (auto it = type->constBegin(); it != type->constEnd(); ++it) {
            Object object;
            object.id = {type.key(), it.key()};
            object.firstRow = static_cast<int>(rows->size());
            readObject(&object, rows);
            for (auto row = rows->begin() + object.firstRow; row != rows->end(); ++row)
                row->objectIndex = static_cast<int>(objects->size());
            objects->push_back(std::move(object));
        }
    }
}

void KvDeskValueTableModel::readObject(Object *object, Rows *rows)
{
    const KvDeskObjectId &id = object->id;
    const ZtGsManipulator *const manipulator = kernel()->getGsManipulator(id.type);
    const ZtKernelObjectData *const data = kernel()->object(id.type, id.id);
    object->name = manipulator->getObjectName(id.id);
    const QStringList shown = manipulator->valueSet(id.id);
    const QStringList names = manipulator->getValueNames();
    KvDeskValueRow row;
    row.object = id;
    for (int i = 0; i < names.size(); ++i) {
        if (!manipulator->isValueShown(names.at(i), shown))
            continue;
        const QVariant value = manipulator->value(names.at(i), data, row.kind);
        row.position = i;
        row.value = value.toDouble();
        if (value.isValid())
            rows->push_back(row);
    }
}
