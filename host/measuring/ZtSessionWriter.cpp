// SPDX-License-Identifier: MIT
#include "measuring/ZtSessionWriter.h"

#include "measuring/ZtCalibrationJson.h"
#include "measuring/ZtDrawnType.h"
#include "measuring/ZtJsonText.h"
#include "measuring/ZtSession.h"
#include "measuring/ZtSessionFormat.h"

#include <QDir>
#include <QFileInfo>
#include <QJsonDocument>
#include <QJsonObject>

namespace Format = ZtSessionFormat;

namespace {

// Relative, so that a folder with session and image can move; absolute on another drive.
QString storedImagePath(const QString &imagePath, const QString &sessionPath)
{
    return QFileInfo(sessionPath).absoluteDir().relativeFilePath(imagePath);
}

// Starts the members of an object one after another.
class Members
{
public:
    explicit Members(QByteArray *json)
        : m_json(json)
    {
        *m_json += '{';
    }
    ~Members() { *m_json += '}'; }
    Q_DISABLE_COPY(Members)

    QByteArray *add(const QString &name)
    {
        separate();
        ZtJsonText::append(m_json, name);
        *m_json += ':';
        return m_json;
    }
    void add(const QString &name, const QString &text) { ZtJsonText::append(add(name), text); }
    void add(const QString &name, int number) { *add(name) += QByteArray::number(number); }

private:
    void separate()
    {
        if (!m_isFirst)
            *m_json += ',';
        m_isFirst = false;
    }

    QByteArray *m_json;
    bool m_isFirst = true;
};

/// Writes a list: \a write appends one item of it.
template <typename Items, typename Write>
void appendList(QByteArray *json, const Items &items, Write write)
{
    *json += '[';
    bool isFirst = true;
    for (const auto &item : items) {
        if (!isFirst)
            *json += ',';
        isFirst = false;
        write(item);
    }
    *json += ']';
}

void appendPoint(QByteArray *json, const QPointF &point)
{
    *json += '[';
    *json += ZtJsonText::number(point.x());
    *json += ',';
    *json += ZtJsonText::number(point.y());
    *json += ']';
}

void appendObject(QByteArray *json, const ZtSessionObject &object)
{
    Members members(json);
    if (!object.hiddenValues.isEmpty())
        appendList(members.add(Format::hidden), object.hiddenValues, [json, &object](int position) {
            const auto index = static_cast<std::size_t>(position);
            ZtJsonText::append(json, QLatin1String(object.type->values[index].name));
        });
    members.add(Format::id, object.id);
    if (!object.name.isEmpty())
        members.add(Format::name, object.name);
    appendList(members.add(Format::points), object.points,
               [json](const QPointF &point) { appendPoint(json, point); });
    if (!object.text.isEmpty())
        members.add(Format::text, object.text);
    members.add(Format::type, QLatin1String(object.type->key));
}

void appendValue(QByteArray *json, const ZtImportedValue &value)
{
    Members members(json);
    members.add(Format::name, value.name);
    if (!value.unit.isEmpty())
        members.add(Format::unit, value.unit.text());
}

void appendCell(QByteArray *json, const ZtImportedType &type, const ZtImportedCell &cell)
{
    const ZtUnit &unit = type.unit(cell);
    if (unit == type.values().at(cell.valueIndex).unit) {
        ZtJsonText::appendPlain(json, type.number(cell));
        return;
    }
    *json += '[';
    ZtJsonText::appendPlain(json, type.number(cell));
    *json += ',';
    ZtJsonText::append(json, unit.text());
    *json += ']';
}

void appendCells(QByteArray *json, const ZtImportedType &type, int row)
{
    const ZtImportedType::Row cells = type.row(row);
    const bool isSparse = (cells.last - cells.first) * 2 < type.values().size();
    *json += isSparse ? '{' : '[';
    int position = 0;
    for (const ZtImportedCell &cell : cells) {
        if (&cell != cells.first)
            *json += ',';
        if (isSparse) {
            *json += '"' + QByteArray::number(cell.valueIndex) + "\":";
        } else {
            for (; position < cell.valueIndex; ++position)
                *json += "null,";
            ++position;
        }
        appendCell(json, type, cell);
    }
    *json += isSparse ? '}' : ']';
}

void appendRow(QByteArray *json, const ZtImportedType &type, const ZtSessionRow &row)
{
    *json += '[';
    *json += QByteArray::number(row.id);
    *json += ',';
    if (row.name.isEmpty())
        *json += "null";
    else
        ZtJsonText::append(json, row.name);
    *json += ',';
    appendCells(json, type, row.row);
    if (!row.hiddenValues.isEmpty()) {
        *json += ',';
        appendList(json, row.hiddenValues, [json, &type](int position) {
            ZtJsonText::append(json, type.values().at(position).name);
        });
    }
    *json += ']';
}

void appendTable(QByteArray *json, const ZtSessionTable &table)
{
    Members members(json);
    members.add(Format::name, table.type->name());
    appendList(members.add(Format::rows), table.rows,
               [json, &table](const ZtSessionRow &row) { appendRow(json, *table.type, row); });
    appendList(members.add(Format::values), table.type->values(),
               [json](const ZtImportedValue &value) { appendValue(json, value); });
}

} // namespace

QByteArray ZtSessionWriter::toJson(const ZtSession &session, const QString &path)
{
    QByteArray json;
    {
        Members members(&json);
        if (session.calibration.isCalibrated())
            *members.add(Format::calibration) +=
                QJsonDocument(ZtCalibrationJson::toJson(session.calibration)).toJson(QJsonDocument::Compact);
        members.add(Format::format, Format::formatName);
        if (!session.imagePath.isEmpty())
            members.add(Format::image, storedImagePath(session.imagePath, path));
        appendList(members.add(Format::objects), session.objects,
                   [&json](const ZtSessionObject &object) { appendObject(&json, object); });
        appendList(members.add(Format::tables), session.tables,
                   [&json](const ZtSessionTable &table) { appendTable(&json, table); });
        members.add(Format::versionKey, Format::version);
    }
    return json;
}
