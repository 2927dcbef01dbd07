// SPDX-License-Identifier: MIT
#include "measuring/ZtSessionReader.h"

#include "measuring/ZtCalibrationJson.h"
#include "measuring/ZtDrawnType.h"
#include "measuring/ZtImportedTypeBuilder.h"
#include "measuring/ZtJsonMembers.h"
#include "measuring/ZtJsonReader.h"
#include "measuring/ZtJsonValues.h"
#include "measuring/ZtProgress.h"
#include "measuring/ZtSessionFormat.h"
#include "measuring/ZtTableNumber.h"

#include <QDir>
#include <QFileInfo>
#include <QJsonDocument>
#include <QJsonObject>
#include <QMap>
#include <QSet>

#include <charconv>
#include <cmath>
#include <limits>

namespace Format = ZtSessionFormat;

namespace {

// Keys of foreign files may be of any length.
constexpr int longestPlace = 40;

QStringList englishValueNames(const ZtDrawnType &type)
{
    QStringList names;
    for (const ZtDrawnValue &value : type.values)
        names.append(QLatin1String(value.name));
    return names;
}

// The position that a key of a cell stands for, as the writer writes it; -1 for any other text.
int positionOf(std::string_view key)
{
    int position = -1;
    const char *const end = key.data() + key.size();
    const auto result = std::from_chars(key.data(), end, position);
    const bool isPosition = result.ec == std::errc() && result.ptr == end && position >= 0;
    return isPosition && (key.size() == 1 || key.front() != '0') ? position : -1;
}

// Whether the keys of the cells are positions, each larger than that before: then none comes twice.
bool haveRisingKeys(ZtJsonReader *json)
{
    const std::size_t begin = json->position();
    std::string_view key;
    std::string buffer;
    int last = -1;
    bool areRising = true;
    for (json->enter(); areRising && json->nextMember(&key, &buffer); json->skip()) {
        const int position = positionOf(key);
        areRising = position > last;
        last = position;
    }
    json->seek(begin);
    return areRising;
}

} // namespace

ZtSessionReader::ZtSessionReader(ZtJsonReader *json, const QString &path, ZtProgress *progress)
    : m_json(json)
    , m_path(path)
    , m_progress(progress)
{}

bool ZtSessionReader::fail(const QString &place, const QString &message)
{
    m_fault.place = place;
    m_fault.message = message;
    return false;
}

bool ZtSessionReader::inside(const QString &place)
{
    const bool isIndex = m_fault.place.startsWith(QLatin1Char('['));
    const QString separator = m_fault.place.isEmpty() || isIndex ? QString() : QStringLiteral(".");
    m_fault.place = place + separator + m_fault.place;
    return false;
}

bool ZtSessionReader::inside(const QString &place, int index)
{
    return inside(QStringLiteral("%1[%2]").arg(place).arg(index));
}

bool ZtSessionReader::enterList(const ZtJsonMembers &members, const QString &key, bool *isThere)
{
    *isThere = members.goTo(key);
    if (!*isThere)
        return true;
    if (m_json->kind() != ZtJsonReader::List)
        return fail(key, tr("This must be a list"));
    m_json->enter();
    return true;
}

bool ZtSessionReader::readText(const ZtJsonMembers &members, const QString &key, QString *text)
{
    if (!members.goTo(key))
        return true;
    if (m_json->kind() != ZtJsonReader::Text)
        return fail(key, tr("This must be a text"));
    *text = m_json->text();
    return true;
}

bool ZtSessionReader::goOn(int done)
{
    if (m_progress && done % ZtProgress::stride == 0)
        m_progress->setDone(static_cast<double>(m_json->position()) / static_cast<double>(m_json->size()));
    return ZtProgress::look(m_progress, done, 0) || fail(QString(), tr("Reading was cancelled"));
}

bool ZtSessionReader::readId(int *id)
{
    const double number = m_json->kind() == ZtJsonReader::Number ? m_json->number() : 0.0;
    if (!(number >= 1.0 && number <= std::numeric_limits<int>::max()) || number != std::floor(number))
        return fail(QString(), tr("This must be a whole number from 1"));
    *id = static_cast<int>(number);
    return true;
}

bool ZtSessionReader::read(ZtSession *session)
{
    ZtSession result;
    const ZtJsonMembers members(m_json,
                                {&Format::format, &Format::versionKey, &Format::image, &Format::calibration,
                                 &Format::micrometresPerPixel, &Format::objects, &Format::tables});
    if (!readVersion(members) || !readImage(members, &result) || !readCalibration(members, &result) ||
        !readObjects(members, &result) || !readTables(members, &result))
        return false;
    *session = std::move(result);
    return true;
}

bool ZtSessionReader::readVersion(const ZtJsonMembers &members)
{
    const bool hasFormat = members.goTo(Format::format) && m_json->kind() == ZtJsonReader::Text;
    const QString format = hasFormat ? m_json->text() : QString();
    if (format == QLatin1String(ZtJsonValues::formatName))
        return fail(Format::format, tr("This file is a table of values; import it"));
    if (format != Format::formatName)
        return fail(Format::format, tr("The file is not a session"));
    if (!members.goTo(Format::versionKey) || m_json->kind() != ZtJsonReader::Number)
        return fail(Format::versionKey, tr("This must be a number"));
    const double version = m_json->number();
    if (version > Format::version)
        return fail(Format::versionKey,
                    tr("The session is of the newer version %1; this program reads versions up to %2")
                        .arg(version)
                        .arg(Format::version));
    if (version < Format::firstVersion || version != std::floor(version))
        return fail(Format::versionKey,
                    tr("Sessions of version %1 are not known; this program reads versions %2 to %3")
                        .arg(version)
                        .arg(Format::firstVersion)
                        .arg(Format::version));
    m_version = static_cast<int>(version);
    return true;
}

bool ZtSessionReader::readImage(const ZtJsonMembers &members, ZtSession *session)
{
    QString stored;
    if (!readText(members, Format::image, &stored))
        return false;
    if (!stored.isEmpty())
        session->imagePath = QDir::cleanPath(QFileInfo(m_path).absoluteDir().absoluteFilePath(stored));
    return true;
}

bool ZtSessionReader::readCalibration(const ZtJsonMembers &members, ZtSession *session)
{
    if (m_version == Format::firstVersion)
        return readPixelSize(members, session);
    if (!members.goTo(Format::calibration))
        return true;
    if (m_json->kind() != ZtJsonReader::Object)
        return fail(Format::calibration, tr("This must be an object"));
    const std::size_t begin = m_json->position();
    m_json->skip();
    const std::string_view bytes = m_json->bytesFrom(begin);
    const QJsonDocument json =
        QJsonDocument::fromJson(QByteArray::fromRawData(bytes.data(), static_cast<int>(bytes.size())));
    return ZtCalibrationJson::read(json.object(), &session->calibration, &m_fault) ||
           inside(Format::calibration);
}

bool ZtSessionReader::readPixelSize(const ZtJsonMembers &members, ZtSession *session)
{
    if (!members.goTo(Format::micrometresPerPixel))
        return true;
    const double size = m_json->kind() == ZtJsonReader::Number ? m_json->number() : 0.0;
    if (!ZtCalibration::isValidPixelSize(size))
        return fail(Format::micrometresPerPixel, tr("This must be a number greater than 0"));
    session->calibration = ZtCalibration(size);
    return true;
}

bool ZtSessionReader::readObjects(const ZtJsonMembers &members, ZtSession *session)
{
    bool isThere = false;
    if (!enterList(members, Format::objects, &isThere))
        return false;
    QSet<QPair<int, int>> taken;
    for (int i = 0; isThere && m_json->nextItem(); ++i) {
        ZtSessionObject object;
        if (!goOn(i) || !readObject(&object))
            return inside(Format::objects, i);
        const QPair<int, int> key(object.type->id, object.id);
        if (taken.contains(key)) {
            fail(Format::id, tr("Another object of this type has the same number"));
            return inside(Format::objects, i);
        }
        taken.insert(key);
        session->objects.append(std::move(object));
    }
    return true;
}

bool ZtSessionReader::readObject(ZtSessionObject *object)
{
    if (m_json->kind() != ZtJsonReader::Object)
        return fail(QString(), tr("This must be an object"));
    const ZtJsonMembers members(
        m_json, {&Format::type, &Format::id, &Format::name, &Format::text, &Format::points, &Format::hidden});
    if (!readObjectType(members, object))
        return false;
    if (!members.goTo(Format::id))
        return fail(Format::id, tr("This must be a whole number from 1"));
    if (!readId(&object->id))
        return inside(Format::id);
    if (!readText(members, Format::name, &object->name) || !readText(members, Format::text, &object->text) ||
        !readPoints(members, object))
        return false;
    if (members.goTo(Format::hidden) && !readHidden(englishValueNames(*object->type), &object->hiddenValues))
        return inside(Format::hidden);
    members.leave();
    return true;
}

bool ZtSessionReader::readObjectType(const ZtJsonMembers &members, ZtSessionObject *object)
{
    QString key;
    if (members.goTo(Format::type) && m_json->kind() == ZtJsonReader::Text)
        key = m_json->text();
    object->type = ZtDrawnType::findKey(key);
    if (object->type)
        return true;
    return fail(Format::type, tr("\"%1\" is not a type of objects").arg(key.left(longestPlace)));
}

bool ZtSessionReader::readPoints(const ZtJsonMembers &members, ZtSessionObject *object)
{
    bool isThere = false;
    if (!enterList(members, Format::points, &isThere))
        return false;
    const bool areRead = !isThere || readPointItems(&object->points);
    if (!areRead && ZtProgress::isCancelled(m_progress))
        return false;
    // A wrong number of points is told first.
    int count = object->points.size();
    if (!areRead) {
        members.goTo(Format::points);
        count = m_json->countItems();
    }
    if (object->type->acceptsPointCount(count))
        return areRead;
    return fail(Format::points, tr("An object of type \"%1\" cannot have this number of points (%2)")
                                    .arg(QLatin1String(object->type->key))
                                    .arg(count));
}

bool ZtSessionReader::readPointItems(QPolygonF *points)
{
    for (int i = 0; m_json->nextItem(); ++i) {
        QPointF point;
        if (!goOn(i) || !readPoint(&point))
            return inside(Format::points, i);
        points->append(point);
    }
    return true;
}

bool ZtSessionReader::readPoint(QPointF *point)
{
    double x = 0.0;
    double y = 0.0;
    if (m_json->kind() == ZtJsonReader::List) {
        m_json->enter();
        if (readCoordinate(&x) && readCoordinate(&y) && !m_json->nextItem()) {
            *point = QPointF(x, y);
            if (ZtDrawnType::isCoordinatePair(*point))
                return true;
        }
    }
    return fail(QString(), tr("A point must be a list of two numbers between -1e9 and 1e9"));
}

bool ZtSessionReader::readCoordinate(double *coordinate)
{
    if (!m_json->nextItem() || m_json->kind() != ZtJsonReader::Number)
        return false;
    *coordinate = m_json->number();
    return true;
}

bool ZtSessionReader::readHidden(const QStringList &names, QVector<int> *positions)
{
    if (m_json->kind() != ZtJsonReader::List)
        return fail(QString(), tr("This must be a list"));
    m_json->enter();
    for (int i = 0; m_json->nextItem(); ++i) {
        const int position = m_json->kind() == ZtJsonReader::Text ? names.indexOf(m_json->text()) : -1;
        if (position < 0) {
            fail(QString(), tr("This must be the name of a value"));
            return inside(QString(), i);
        }
        if (!positions->contains(position))
            positions->append(position);
    }
    return true;
}

bool ZtSessionReader::readTables(const ZtJsonMembers &members, ZtSession *session)
{
    bool isThere = false;
    if (!enterList(members, Format::tables, &isThere))
        return false;
    for (int i = 0; isThere && m_json->nextItem(); ++i) {
        ZtSessionTable table;
        if (!readTable(&table))
            return inside(Format::tables, i);
        session->tables.append(std::move(table));
    }
    return true;
}

bool ZtSessionReader::readTable(ZtSessionTable *table)
{
    if (m_json->kind() != ZtJsonReader::Object)
        return fail(QString(), tr("This must be an object"));
    const ZtJsonMembers members(m_json, {&Format::name, &Format::values, &Format::rows});
    QString name;
    if (!readText(members, Format::name, &name))
        return false;
    if (name.isEmpty())
        return fail(Format::name, tr("The type has no name"));
    ZtImportedTypeBuilder builder(name);
    if (!readValues(members, &builder) || !readRows(members, &builder, table))
        return false;
    members.leave();
    table->type = builder.build(&m_fault);
    return table->type != nullptr;
}

bool ZtSessionReader::readValues(const ZtJsonMembers &members, ZtImportedTypeBuilder *builder)
{
    bool isThere = false;
    if (!enterList(members, Format::values, &isThere))
        return false;
    m_valueNames.clear();
    QSet<QString> taken;
    for (int i = 0; isThere && m_json->nextItem(); ++i) {
        QString name;
        QString unit;
        if (!goOn(i) || !readValue(&name, &unit))
            return inside(Format::values, i);
        if (name.isEmpty() || taken.contains(name)) {
            fail(Format::name, tr("A value must have a name of its own"));
            return inside(Format::values, i);
        }
        taken.insert(name);
        m_valueNames.append(name);
        builder->appendValue(name, ZtUnit::parse(unit));
    }
    return true;
}

// What is no object has no name.
bool ZtSessionReader::readValue(QString *name, QString *unit)
{
    if (m_json->kind() != ZtJsonReader::Object)
        return true;
    const ZtJsonMembers members(m_json, {&Format::name, &Format::unit});
    if (!readText(members, Format::name, name) || !readText(members, Format::unit, unit))
        return false;
    members.leave();
    return true;
}

bool ZtSessionReader::readRows(const ZtJsonMembers &members, ZtImportedTypeBuilder *builder,
                               ZtSessionTable *table)
{
    bool isThere = false;
    if (!enterList(members, Format::rows, &isThere))
        return false;
    int lastId = 0;
    for (int i = 0; isThere && m_json->nextItem(); ++i) {
        ZtSessionRow row;
        if (!goOn(i) || !readRow(builder, &row))
            return inside(Format::rows, i);
        if (row.id <= lastId) {
            fail(QStringLiteral("[0]"), tr("The numbers of the rows must rise"));
            return inside(Format::rows, i);
        }
        lastId = row.id;
        table->rows.append(std::move(row));
    }
    return true;
}

bool ZtSessionReader::readRow(ZtImportedTypeBuilder *builder, ZtSessionRow *row)
{
    const std::size_t begin = m_json->position();
    const bool isList = m_json->kind() == ZtJsonReader::List;
    if (isList && readRowItems(builder, row))
        return true;
    // What is no row at all is told before what is wrong inside of it.
    m_json->seek(begin);
    const int count = isList ? m_json->countItems() : 0;
    if (count < Format::RowHidden || count > Format::RowMaximum)
        return fail(QString(), tr("A row must be a list of number, name and values"));
    return false;
}

// False without a fault when there are too few items or too many.
bool ZtSessionReader::readRowItems(ZtImportedTypeBuilder *builder, ZtSessionRow *row)
{
    m_json->enter();
    if (!m_json->nextItem())
        return false;
    if (!readId(&row->id))
        return inside(QString(), Format::RowId);
    if (!m_json->nextItem())
        return false;
    if (!readRowName(&row->name))
        return inside(QString(), Format::RowName);
    if (!m_json->nextItem())
        return false;
    row->row = builder->addRow(row->name);
    if (!readCells(builder, row->row))
        return inside(QString(), Format::RowCells);
    if (!m_json->nextItem())
        return true;
    if (!readHidden(m_valueNames, &row->hiddenValues))
        return inside(QString(), Format::RowHidden);
    return !m_json->nextItem();
}

bool ZtSessionReader::readRowName(QString *name)
{
    switch (m_json->kind()) {
    case ZtJsonReader::Text:
        *name = m_json->text();
        return true;
    case ZtJsonReader::Null:
        m_json->skip();
        return true;
    default:
        return fail(QString(), tr("This must be a text or null"));
    }
}

bool ZtSessionReader::readCells(ZtImportedTypeBuilder *builder, int row)
{
    if (m_json->kind() == ZtJsonReader::List)
        return readCellList(builder, row);
    if (m_json->kind() != ZtJsonReader::Object)
        return fail(QString(), tr("This must be a list or an object"));
    return haveRisingKeys(m_json) ? readRisingCells(builder, row) : readMixedCells(builder, row);
}

bool ZtSessionReader::readCellList(ZtImportedTypeBuilder *builder, int row)
{
    m_json->enter();
    for (int i = 0; m_json->nextItem(); ++i) {
        if (!readCell(builder, row, i))
            return inside(QString(), i);
    }
    return true;
}

bool ZtSessionReader::readRisingCells(ZtImportedTypeBuilder *builder, int row)
{
    std::string_view key;
    std::string buffer;
    m_json->enter();
    while (m_json->nextMember(&key, &buffer)) {
        const int position = positionOf(key);
        if (!readCell(builder, row, position))
            return inside(QString(), position);
    }
    return true;
}

// Of a key that comes twice, the last counts.
bool ZtSessionReader::readMixedCells(ZtImportedTypeBuilder *builder, int row)
{
    std::string_view key;
    std::string buffer;
    QMap<QString, std::size_t> cells;
    for (m_json->enter(); m_json->nextMember(&key, &buffer); m_json->skip())
        cells.insert(QString::fromUtf8(key.data(), static_cast<int>(key.size())), m_json->position());
    const std::size_t end = m_json->position();
    for (auto cell = cells.constBegin(); cell != cells.constEnd(); ++cell) {
        m_json->seek(cell.value());
        if (!readCell(builder, row, positionOf(cell.key().toStdString())))
            return inside(QStringLiteral("[%1]").arg(cell.key().left(longestPlace)));
    }
    m_json->seek(end);
    return true;
}

bool ZtSessionReader::readCell(ZtImportedTypeBuilder *builder, int row, int valueIndex)
{
    if (valueIndex < 0 || valueIndex >= builder->valueCount())
        return fail(QString(), tr("The table has no such value"));
    switch (m_json->kind()) {
    case ZtJsonReader::Null:
        m_json->skip();
        return true;
    case ZtJsonReader::Text:
        return addCell(builder, row, valueIndex, m_json->utf8(&m_buffer), builder->value(valueIndex).unit);
    case ZtJsonReader::List:
        return readCellWithUnit(builder, row, valueIndex);
    default:
        return fail(QString(), tr("This must be the text of a number"));
    }
}

bool ZtSessionReader::readCellWithUnit(ZtImportedTypeBuilder *builder, int row, int valueIndex)
{
    const auto isAtText = [this]() { return m_json->nextItem() && m_json->kind() == ZtJsonReader::Text; };
    m_json->enter();
    if (isAtText()) {
        const std::string_view number = m_json->utf8(&m_buffer);
        std::string buffer;
        if (isAtText()) {
            const std::string_view text = m_json->utf8(&buffer);
            if (!m_json->nextItem())
                return addCell(builder, row, valueIndex, number, unit(text));
        }
    }
    return fail(QString(), tr("This must be the text of a number"));
}

const ZtUnit &ZtSessionReader::unit(std::string_view text)
{
    if (m_unitText != text) {
        m_unitText = text;
        m_unit = ZtUnit::parse(QString::fromUtf8(text.data(), static_cast<int>(text.size())));
    }
    return m_unit;
}

bool ZtSessionReader::addCell(ZtImportedTypeBuilder *builder, int row, int valueIndex,
                              std::string_view number, const ZtUnit &unit)
{
    const ZtTableNumber read = ZtTableNumber::read(number, false);
    if (read.kind != ZtTableNumber::Number || !std::isfinite(unit.toBase(read.value)))
        return fail(QString(), tr("This must be the text of a number"));
    if (builder->addCell(row, valueIndex, read.value, ZtTableNumber::trimmed(number), unit))
        return true;
    return fail(QString(), tr("The unit does not fit that of the value"));
}
