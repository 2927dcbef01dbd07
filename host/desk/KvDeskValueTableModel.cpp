// SPDX-License-Identifier: MIT
#include "KvDeskValueTableModel.h"

#include "KvDeskTableView.h"
#include "kernel/ZtGsManipulator.h"
#include "kernel/ZtKernelData.h"
#include "measuring/ZtDrawnType.h"
#include "measuring/ZtImportedManipulator.h"

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

/// Reads the values of objects of one type, of which there may be many.
class KvDeskValueTableModel::Reader
{
public:
    explicit Reader(int type)
        : m_manipulator(kernel()->getGsManipulator(type))
        , m_measuring(dynamic_cast<const ZtMeasuringManipulator *>(m_manipulator))
    {}

    void read(int objectIndex, int id, const ZtKernelObjectData *data, Rows *rows)
    {
        if (!m_measuring) {
            readByName(objectIndex, id, data, rows);
            return;
        }
        m_values.clear();
        m_measuring->appendShownValues(data, &m_values);
        for (const ZtMeasuredValue &value : m_values)
            rows->push_back({value.value, objectIndex, value.position, value.kind});
    }

private:
    void readByName(int objectIndex, int id, const ZtKernelObjectData *data, Rows *rows) const
    {
        const QStringList shown = m_manipulator->valueSet(id);
        const QStringList names = m_manipulator->getValueNames();
        for (int i = 0; i < names.size(); ++i) {
            if (!m_manipulator->isValueShown(names.at(i), shown))
                continue;
            int kind = ZtGsManipulator::NoKind;
            const QVariant value = m_manipulator->value(names.at(i), data, kind);
            if (value.isValid())
                rows->push_back({value.toDouble(), objectIndex, i, kind});
        }
    }

    const ZtGsManipulator *m_manipulator;
    const ZtMeasuringManipulator *m_measuring; ///< null for types of others
    std::vector<ZtMeasuredValue> m_values;
};

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
    if (role == KvDeskTableView::CopyRole && index.column() == ValueColumn)
        return fullText(index.row());
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
    const KvDeskObjectId object = objectOf(index.row()).id;
    const QString name = value.toString().simplified();
    if (name != text(index.row(), ObjectColumn))
        emit signalRenamed(object.type, object.id, name);
    return true;
}

const KvDeskValueTableModel::Object &KvDeskValueTableModel::objectOf(int row) const
{
    return m_objects[static_cast<std::size_t>(m_rows[static_cast<std::size_t>(row)].objectIndex)];
}

KvDeskValueRow KvDeskValueTableModel::row(int row) const
{
    const Row &shown = m_rows[static_cast<std::size_t>(row)];
    return {objectOf(row).id, shown.objectIndex, shown.position, shown.kind, shown.value};
}

// Null when the object's type is gone before the change was announced.
KvDeskValueTableModel::Name *KvDeskValueTableModel::nameOf(const Object &object) const
{
    if (object.name)
        return object.name.get();
    const ZtGsManipulator *const manipulator = kernel()->getGsManipulator(object.id.type);
    if (manipulator)
        object.name = std::make_unique<Name>(Name{manipulator->getObjectName(object.id.id), std::nullopt});
    return object.name.get();
}

QString KvDeskValueTableModel::text(int row, int column) const
{
    const KvDeskValueRow shown = this->row(row);
    if (column == ObjectColumn) {
        const Name *const name = nameOf(objectOf(row));
        return name ? name->text : QString();
    }
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
    if (!data)
        return QString();
    const auto *const imported = dynamic_cast<const ZtImportedManipulator *>(manipulator);
    return imported ? imported->shortText(name, data) : manipulator->valueText(name, data);
}

QString KvDeskValueTableModel::fullText(int row) const
{
    const KvDeskValueRow shown = this->row(row);
    const ZtGsManipulator *const manipulator = kernel()->getGsManipulator(shown.object.type);
    const ZtKernelObjectData *const data = kernel()->object(shown.object.type, shown.object.id);
    if (!manipulator || !data)
        return QString();
    return manipulator->valueText(manipulator->getValueNames().value(shown.position), data);
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
        if (m_rows[static_cast<std::size_t>(row)].position == position)
            return row;
    }
    return -1;
}

const QCollatorSortKey &KvDeskValueTableModel::sortKey(const Object &object) const
{
    Name *name = nameOf(object);
    if (!name) {
        object.name = std::make_unique<Name>();
        name = object.name.get();
    }
    if (!name->sortKey)
        name->sortKey = m_collator.sortKey(name->text);
    return *name->sortKey;
}

const QCollatorSortKey &KvDeskValueTableModel::sortKey(int row, int column) const
{
    if (column == ObjectColumn)
        return sortKey(objectOf(row));
    const KvDeskValueRow shown = this->row(row);
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

// Rows with the same text for sure: the number of the group of each row, and the first row of each group.
void KvDeskValueTableModel::group(int column, std::vector<int> *groups, std::vector<int> *firstRows) const
{
    QHash<QPair<int, int>, int> known; // by type and position
    groups->reserve(m_rows.size());
    for (std::size_t row = 0; row < m_rows.size(); ++row) {
        const Row &shown = m_rows[row];
        const bool isSameObject = row > 0 && m_rows[row - 1].objectIndex == shown.objectIndex;
        if (isSameObject && column != NameColumn) {
            groups->push_back(groups->back());
            continue;
        }
        int group = static_cast<int>(firstRows->size());
        if (column != ObjectColumn) {
            const int type = m_objects[static_cast<std::size_t>(shown.objectIndex)].id.type;
            const QPair<int, int> text(type, column == NameColumn ? shown.position : 0);
            const auto found = known.constFind(text);
            group = found == known.constEnd() ? *known.insert(text, group) : *found;
        }
        if (group == static_cast<int>(firstRows->size()))
            firstRows->push_back(static_cast<int>(row));
        groups->push_back(group);
    }
}

std::vector<int> KvDeskValueTableModel::ranks(int column) const
{
    std::vector<int> result;
    std::vector<int> firstRows;
    group(column, &result, &firstRows);
    std::vector<int> order(firstRows.size());
    std::iota(order.begin(), order.end(), 0);
    const auto compare = [&](int a, int b) {
        return compareTexts(firstRows[static_cast<std::size_t>(a)], firstRows[static_cast<std::size_t>(b)],
                            column);
    };
    std::sort(order.begin(), order.end(), [&compare](int a, int b) { return compare(a, b) < 0; });
    std::vector<int> rankOfGroup(order.size());
    int rank = 0;
    for (std::size_t i = 0; i < order.size(); ++i) {
        rank += i > 0 && compare(order[i - 1], order[i]) != 0 ? 1 : 0;
        rankOfGroup[static_cast<std::size_t>(order[i])] = rank;
    }
    for (int &place : result)
        place = rankOfGroup[static_cast<std::size_t>(place)];
    return result;
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
    const auto isSameObject = [](const Object &a, const Object &b) { return a.id == b.id; };
    const auto isSameRow = [](const Row &a, const Row &b) {
        return a.objectIndex == b.objectIndex && a.position == b.position;
    };
    if (!std::equal(objects.begin(), objects.end(), m_objects.begin(), m_objects.end(), isSameObject) ||
        !std::equal(rows.begin(), rows.end(), m_rows.begin(), m_rows.end(), isSameRow)) {
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
    for (auto row = m_rows.begin() + object.firstRow; row != m_rows.end(); ++row)
        ++row->objectIndex;
    m_objects.insert(m_objects.begin() + static_cast<std::ptrdiff_t>(index), std::move(object));
    replaceRows(index, readObject(index, id));
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
void KvDeskValueTableModel::replaceRows(std::size_t index, const Rows &rows)
{
    const Range old = rowsAt(index);
    const int count = static_cast<int>(rows.size());
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
        const Rows rows = readObject(index, id);
        if (!hasRows(index, rows)) {
            reshaped.append(id);
            continue;
        }
        namesChanged = rename(index) || namesChanged;
        const Range range = rowsAt(index);
        std::copy(rows.begin(), rows.end(), m_rows.begin() + range.first);
        for (int i = 0; i < range.count; ++i)
            changedRows.append(range.first + i);
    }
    announceRows(changedRows, namesChanged);
    // One by one: whoever sorts the rows needs all but the coming ones in their order.
    for (const KvDeskObjectId &id : qAsConst(reshaped))
        reshapeObject(lowerBound(id));
}

void KvDeskValueTableModel::reshapeObject(std::size_t index)
{
    const Rows rows = readObject(index, m_objects[index].id);
    replaceRows(index, Rows());
    rename(index);
    replaceRows(index, rows);
}

// False for a name that nobody asked for, too: nobody shows it or put it in its place.
bool KvDeskValueTableModel::rename(std::size_t index)
{
    const std::unique_ptr<Name> old = std::move(m_objects[index].name);
    return old && nameOf(m_objects[index])->text != old->text;
}

// Whether an object has just these rows, with whatever values.
bool KvDeskValueTableModel::hasRows(std::size_t index, const Rows &rows) const
{
    const Range range = rowsAt(index);
    const auto first = m_rows.begin() + range.first;
    const auto isSame = [](const Row &a, const Row &b) { return a.position == b.position; };
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
    constexpr int sample = 1024; // objects that tell how many rows the others have
    const QMap<int, ZtObjectMap> &all = kernel()->objects();
    for (auto type = all.constBegin(); type != all.constEnd(); ++type) {
        if (!measuringManipulator(type.key()))
            continue;
        const std::size_t rowsBefore = rows->size();
        const auto count = static_cast<std::size_t>(type->size());
        objects->reserve(objects->size() + count);
        Reader reader(type.key());
        int done = 0;
        for (auto it = type->constBegin(); it != type->constEnd(); ++it) {
            Object object;
            object.id = {type.key(), it.key()};
            object.firstRow = static_cast<int>(rows->size());
            reader.read(static_cast<int>(objects->size()), it.key(), it.value(), rows);
            objects->push_back(std::move(object));
            if (++done == sample)
                rows->reserve(rowsBefore + (rows->size() - rowsBefore) * count / sample + sample);
        }
    }
}

KvDeskValueTableModel::Rows KvDeskValueTableModel::readObject(std::size_t index, const KvDeskObjectId &id)
{
    Rows rows;
    Reader(id.type).read(static_cast<int>(index), id.id, kernel()->object(id.type, id.id), &rows);
    return rows;
}
