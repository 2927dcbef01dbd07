// SPDX-License-Identifier: MIT
#include "measuring/ZtSessionReader.h"

#include "measuring/ZtCalibrationJson.h"
#include "measuring/ZtDrawnType.h"
#include "measuring/ZtImportedTypeBuilder.h"
#include "measuring/ZtProgress.h"
#include "measuring/ZtSessionFormat.h"
#include "measuring/ZtTableNumber.h"

#include <QDir>
#include <QFileInfo>
#include <QJsonArray>

#include <cmath>
#include <limits>

namespace Format = ZtSessionFormat;

namespace {

// Keys of foreign files may be of any length.
constexpr int longestPlace = 40;

bool readPoint(const QJsonValue &json, QPointF *point)
{
    const QJsonArray pair = json.toArray();
    if (pair.size() != 2 || !pair.at(0).isDouble() || !pair.at(1).isDouble())
        return false;
    *point = QPointF(pair.at(0).toDouble(), pair.at(1).toDouble());
    return ZtDrawnType::isCoordinatePair(*point);
}

QStringList englishValueNames(const ZtDrawnType &type)
{
    QStringList names;
    for (const ZtDrawnValue &value : type.values)
        names.append(QLatin1String(value.name));
    return names;
}

} // namespace

ZtSessionReader::ZtSessionReader(const QString &path, ZtProgress *progress)
    : m_path(path)
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

bool ZtSessionReader::readArray(const QJsonObject &json, const QString &key, QJsonArray *array)
{
    const QJsonValue value = json.value(key);
    if (!value.isArray() && !value.isUndefined())
        return fail(key, tr("This must be a list"));
    *array = value.toArray();
    return true;
}

bool ZtSessionReader::readText(const QJsonObject &json, const QString &key, QString *text)
{
    const QJsonValue value = json.value(key);
    if (!value.isString() && !value.isUndefined())
        return fail(key, tr("This must be a text"));
    *text = value.toString();
    return true;
}

bool ZtSessionReader::goOn(int done, int count)
{
    return ZtProgress::look(m_progress, done, count) || fail(QString(), tr("Reading was cancelled"));
}

bool ZtSessionReader::readId(const QJsonValue &json, int *id)
{
    const double number = json.toDouble(0.0);
    if (!(number >= 1.0 && number <= std::numeric_limits<int>::max()) || number != std::floor(number))
        return fail(QString(), tr("This must be a whole number from 1"));
    *id = static_cast<int>(number);
    return true;
}

bool ZtSessionReader::read(const QJsonObject &json, ZtSession *session)
{
    ZtSession result;
    if (!readVersion(json) || !readImage(json, &result) || !readCalibration(json, &result) ||
        !readObjects(json, &result) || !readTables(json, &result))
        return false;
    *session = result;
    return true;
}

bool ZtSessionReader::readVersion(const QJsonObject &json)
{
    if (json.value(Format::format) != QJsonValue(Format::formatName))
        return fail(Format::format, tr("The file is not a session"));
    const QJsonValue version = json.value(Format::versionKey);
    if (!version.isDouble())
        return fail(Format::versionKey, tr("This must be a number"));
    if (version.toDouble() > Format::version)
        return fail(Format::versionKey,
                    tr("The session is of the newer version %1; this program reads versions up to %2")
                        .arg(version.toDouble())
                        .arg(Format::version));
    m_version = version.toInt();
    if (m_version < Format::firstVersion)
        return fail(Format::versionKey,
                    tr("Sessions of version %1 are not known; this program reads versions %2 to %3")
                        .arg(version.toDouble())
                        .arg(Format::firstVersion)
                        .arg(Format::version));
    return true;
}

bool ZtSessionReader::readImage(const QJsonObject &json, ZtSession *session)
{
    QString stored;
    if (!readText(json, Format::image, &stored))
        return false;
    if (!stored.isEmpty())
        session->imagePath = QDir::cleanPath(QFileInfo(m_path).absoluteDir().absoluteFilePath(stored));
    return true;
}

bool ZtSessionReader::readCalibration(const QJsonObject &json, ZtSession *session)
{
    if (m_version == Format::firstVersion)
        return readPixelSize(json, session);
    const QJsonValue value = json.value(Format::calibration);
    if (value.isUndefined())
        return true;
    if (!value.isObject())
        return fail(Format::calibration, tr("This must be an object"));
    return ZtCalibrationJson::read(value.toObject(), &session->calibration, &m_fault) ||
           inside(Format::calibration);
}

bool ZtSessionReader::readPixelSize(const QJsonObject &json, ZtSession *session)
{
    const QJsonValue value = json.value(Format::micrometresPerPixel);
    if (value.isUndefined())
        return true;
    if (!value.isDouble() || !ZtCalibration::isValidPixelSize(value.toDouble()))
        return fail(Format::micrometresPerPixel, tr("This must be a number greater than 0"));
    session->calibration = ZtCalibration(value.toDouble());
    return true;
}

bool ZtSessionReader::readObjects(const QJsonObject &json, ZtSession *session)
{
    QJsonArray array;
    if (!readArray(json, Format::objects, &array))
        return false;
    QSet<QPair<int, int>> taken;
    for (int i = 0; i < array.size(); ++i) {
        ZtSessionObject object;
        if (!goOn(i, array.size()) || !readObject(array.at(i), &object))
            return inside(Format::objects, i);
        const QPair<int, int> key(object.type->id, object.id);
        if (taken.contains(key)) {
            fail(Format::id, tr("Another object of this type has the same number"));
            return inside(Format::objects, i);
        }
        taken.insert(key);
        session->objects.append(object);
    }
    return true;
}

bool ZtSessionReader::readObject(const QJsonValue &json, ZtSessionObject *object)
{
    if (!json.isObject())
        return fail(QString(), tr("This must be an object"));
    const QJsonObject members = json.toObject();
    if (!readObjectType(members, object))
        return false;
    if (!readId(members.value(Format::id), &object->id))
        return inside(Format::id);
    if (!readText(members, Format::name, &object->name) || !readText(members, Format::text, &object->text) ||
        !readPoints(members, object))
        return false;
    return readHidden(members.value(Format::hidden), englishValueNames(*object->type),
                      &object->hiddenValues) ||
           inside(Format::hidden);
}

bool ZtSessionReader::readObjectType(const QJsonObject &json, ZtSessionObject *object)
{
    const QString key = json.value(Format::type).toString();
    object->type = ZtDrawnType::findKey(key);
    if (object->type)
        return true;
    return fail(Format::type, tr("\"%1\" is not a type of objects").arg(key.left(40)));
}

bool ZtSessionReader::readPoints(const QJsonObject &json, ZtSessionObject *object)
{
    QJsonArray array;
    if (!readArray(json, Format::points, &array))
        return false;
    if (!object->type->acceptsPointCount(array.size()))
        return fail(Format::points, tr("An object of type \"%1\" cannot have this number of points (%2)")
                                        .arg(QLatin1String(object->type->key))
                                        .arg(array.size()));
    for (int i = 0; i < array.size(); ++i) {
        QPointF point;
        if (!readPoint(array.at(i), &point)) {
            fail(QString(), tr("A point must be a list of two numbers between -1e9 and 1e9"));
            return inside(Format::points, i);
        }
        object->points.append(point);
    }
    return true;
}

bool ZtSessionReader::readHidden(const QJsonValue &json, const QStringList &names, QVector<int> *positions)
{
    if (json.isUndefined())
        return true;
    if (!json.isArray())
        return fail(QString(), tr("This must be a list"));
    const QJsonArray array = json.toArray();
    for (int i = 0; i < array.size(); ++i) {
        const int position = array.at(i).isString() ? names.indexOf(array.at(i).toString()) : -1;
        if (position < 0) {
            fail(QString(), tr("This must be the name of a value"));
            return inside(QString(), i);
        }
        if (!positions->contains(position))
            positions->append(position);
    }
    return true;
}

bool ZtSessionReader::readTables(const QJsonObject &json, ZtSession *session)
{
    QJsonArray array;
    if (!readArray(json, Format::tables, &array))
        return false;
    for (int i = 0; i < array.size(); ++i) {
        ZtSessionTable table;
        if (!readTable(array.at(i), &table))
            return inside(Format::tables, i);
        session->tables.append(table);
    }
    return true;
}

bool ZtSessionReader::readTable(const QJsonValue &json, ZtSessionTable *table)
{
    if (!json.isObject())
        return fail(QString(), tr("This must be an object"));
    const QJsonObject members = json.toObject();
    QString name;
    if (!readText(members, Format::name, &name))
        return false;
    if (name.isEmpty())
        return fail(Format::name, tr("The type has no name"));
    ZtImportedTypeBuilder builder(name);
    if (!readValues(members, &builder, &m_valueNames) || !readRows(members, &builder, table))
        return false;
    table->type = builder.build(&m_fault);
    return table->type != nullptr;
}

bool ZtSessionReader::readValues(const QJsonObject &json, ZtImportedTypeBuilder *builder, QStringList *names)
{
    QJsonArray array;
    if (!readArray(json, Format::values, &array))
        return false;
    names->clear();
    QSet<QString> taken;
    for (int i = 0; i < array.size(); ++i) {
        const QJsonObject value = array.at(i).toObject();
        QString name;
        QString unit;
        if (!readText(value, Format::name, &name) || !readText(value, Format::unit, &unit))
            return inside(Format::values, i);
        if (name.isEmpty() || taken.contains(name)) {
            fail(Format::name, tr("A value must have a name of its own"));
            return inside(Format::values, i);
        }
        taken.insert(name);
        names->append(name);
        builder->appendValue(name, ZtUnit::parse(unit));
    }
    return true;
}

bool ZtSessionReader::readRows(const QJsonObject &json, ZtImportedTypeBuilder *builder, ZtSessionTable *table)
{
    QJsonArray array;
    if (!readArray(json, Format::rows, &array))
        return false;
    table->rows.reserve(array.size());
    int lastId = 0;
    for (int i = 0; i < array.size(); ++i) {
        ZtSessionRow row;
        if (!goOn(i, array.size()) || !readRow(array.at(i).toArray(), builder, &row))
            return inside(Format::rows, i);
        if (row.id <= lastId) {
            fail(QStringLiteral("[0]"), tr("The numbers of the rows must rise"));
            return inside(Format::rows, i);
        }
        lastId = row.id;
        table->rows.append(row);
    }
    return true;
}

bool ZtSessionReader::readRow(const QJsonArray &json, ZtImportedTypeBuilder *builder, ZtSessionRow *row)
{
    if (json.size() < Format::RowHidden || json.size() > Format::RowMaximum)
        return fail(QString(), tr("A row must be a list of number, name and values"));
    if (!readId(json.at(Format::RowId), &row->id))
        return inside(QString(), Format::RowId);
    const QJsonValue name = json.at(Format::RowName);
    if (!name.isString() && !name.isNull()) {
        fail(QString(), tr("This must be a text or null"));
        return inside(QString(), Format::RowName);
    }
    row->name = name.toString();
    row->row = builder->addRow(row->name);
    if (!readCells(json.at(Format::RowCells), builder, row->row))
        return inside(QString(), Format::RowCells);
    const QJsonValue hidden =
        json.size() > Format::RowHidden ? json.at(Format::RowHidden) : QJsonValue(QJsonValue::Undefined);
    return readHidden(hidden, m_valueNames, &row->hiddenValues) || inside(QString(), Format::RowHidden);
}

bool ZtSessionReader::readCells(const QJsonValue &json, ZtImportedTypeBuilder *builder, int row)
{
    if (json.isArray()) {
        const QJsonArray array = json.toArray();
        for (int i = 0; i < array.size(); ++i) {
            if (!readCell(array.at(i), builder, row, i))
                return inside(QString(), i);
        }
        return true;
    }
    if (!json.isObject())
        return fail(QString(), tr("This must be a list or an object"));
    const QJsonObject object = json.toObject();
    for (auto it = object.constBegin(); it != object.constEnd(); ++it) {
        const int index = it.key().toInt();
        const bool isIndex = it.key() == QString::number(index);
        if (!readCell(it.value(), builder, row, isIndex ? index : -1))
            return inside(QStringLiteral("[%1]").arg(it.key().left(longestPlace)));
    }
    return true;
}

bool ZtSessionReader::readCell(const QJsonValue &json, ZtImportedTypeBuilder *builder, int row,
                               int valueIndex)
{
    if (valueIndex < 0 || valueIndex >= builder->valueCount())
        return fail(QString(), tr("The table has no such value"));
    if (json.isNull())
        return true;
    const QJsonArray pair = json.isArray() ? json.toArray() : QJsonArray();
    const bool hasUnit = pair.size() == 2 && pair.at(1).isString();
    const QJsonValue text = hasUnit ? pair.at(0) : json;
    const ZtUnit unit = hasUnit ? ZtUnit::parse(pair.at(1).toString()) : builder->value(valueIndex).unit;
    // Numbers are ASCII; any other character is replaced by one that no number has.
    const QByteArray bytes = text.toString().toLatin1();
    const auto field = std::string_view(bytes.constData(), static_cast<std::size_t>(bytes.size()));
    const ZtTableNumber number = ZtTableNumber::read(field, false);
    if (number.kind != ZtTableNumber::Number || !std::isfinite(unit.toBase(number.value)))
        return fail(QString(), tr("This must be the text of a number"));
    if (builder->addCell(row, valueIndex, number.value, ZtTableNumber::trimmed(field), unit))
        return true;
    return fail(QString(), tr("The unit does not fit that of the value"));
}
