// SPDX-License-Identifier: MIT
#include "measuring/ZtSessionWriter.h"

#include "measuring/ZtDrawnType.h"
#include "measuring/ZtSession.h"
#include "measuring/ZtSessionFormat.h"

#include <QDir>
#include <QFileInfo>
#include <QJsonArray>

namespace Format = ZtSessionFormat;

namespace {

// Relative, so that a folder with session and image can move; absolute on another drive.
QString storedImagePath(const QString &imagePath, const QString &sessionPath)
{
    return QFileInfo(sessionPath).absoluteDir().relativeFilePath(imagePath);
}

QJsonArray pointsToJson(const QPolygonF &points)
{
    QJsonArray array;
    for (const QPointF &point : points)
        array.append(QJsonArray{point.x(), point.y()});
    return array;
}

QJsonObject objectToJson(const ZtSessionObject &object)
{
    QJsonObject json{{Format::type, QLatin1String(object.type->key)},
                     {Format::id, object.id},
                     {Format::points, pointsToJson(object.points)}};
    if (!object.name.isEmpty())
        json.insert(Format::name, object.name);
    if (!object.text.isEmpty())
        json.insert(Format::text, object.text);
    QJsonArray hidden;
    for (const int position : object.hiddenValues)
        hidden.append(QLatin1String(object.type->values[static_cast<std::size_t>(position)].name));
    if (!hidden.isEmpty())
        json.insert(Format::hidden, hidden);
    return json;
}

QJsonArray valuesToJson(const ZtImportedType &type)
{
    QJsonArray array;
    for (const ZtImportedValue &value : type.values()) {
        QJsonObject json{{Format::name, value.name}};
        if (!value.unit.isEmpty())
            json.insert(Format::unit, value.unit.text());
        array.append(json);
    }
    return array;
}

QJsonValue cellToJson(const ZtImportedType &type, const ZtImportedCell &cell)
{
    const QString number = type.numberText(cell);
    const ZtUnit &unit = type.unit(cell);
    if (unit == type.values().at(cell.valueIndex).unit)
        return number;
    return QJsonArray{number, unit.text()};
}

QJsonValue cellsToJson(const ZtImportedType &type, int row)
{
    const ZtImportedType::Row cells = type.row(row);
    const bool isSparse = (cells.last - cells.first) * 2 < type.values().size();
    QJsonObject object;
    QJsonArray array;
    for (const ZtImportedCell &cell : cells) {
        if (isSparse) {
            object.insert(QString::number(cell.valueIndex), cellToJson(type, cell));
            continue;
        }
        while (array.size() < cell.valueIndex)
            array.append(QJsonValue());
        array.append(cellToJson(type, cell));
    }
    return isSparse ? QJsonValue(object) : QJsonValue(array);
}

QJsonArray rowToJson(const ZtImportedType &type, const ZtSessionRow &row)
{
    const QJsonValue name = row.name.isEmpty() ? QJsonValue() : QJsonValue(row.name);
    QJsonArray array{row.id, name, cellsToJson(type, row.row)};
    QJsonArray hidden;
    for (const int position : row.hiddenValues)
        hidden.append(type.values().at(position).name);
    if (!hidden.isEmpty())
        array.append(hidden);
    return array;
}

QJsonObject tableToJson(const ZtSessionTable &table)
{
    QJsonArray rows;
    for (const ZtSessionRow &row : table.rows)
        rows.append(rowToJson(*table.type, row));
    return {{Format::name, table.type->name()},
            {Format::values, valuesToJson(*table.type)},
            {Format::rows, rows}};
}

} // namespace

QJsonObject ZtSessionWriter::toJson(const ZtSession &session, const QString &path)
{
    QJsonArray objects;
    for (const ZtSessionObject &object : session.objects)
        objects.append(objectToJson(object));
    QJsonArray tables;
    for (const ZtSessionTable &table : session.tables)
        tables.append(tableToJson(table));

    QJsonObject json{{Format::format, Format::formatName},
                     {Format::versionKey, Format::version},
                     {Format::objects, objects},
                     {Format::tables, tables}};
    if (!session.imagePath.isEmpty())
        json.insert(Format::image, storedImagePath(session.imagePath, path));
    if (session.calibration.isCalibrated())
        json.insert(Format::micrometresPerPixel, session.calibration.micrometresPerPixel());
    return json;
}
