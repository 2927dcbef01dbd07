// SPDX-License-Identifier: MIT
#include "measuring/ZtTableExport.h"

#include "kernel/ZtGsManipulator.h"
#include "kernel/ZtKernelData.h"
#include "measuring/ZtImportedManipulator.h"
#include "measuring/ZtImportedObjectData.h"
#include "measuring/ZtJsonText.h"
#include "measuring/ZtSafeFile.h"
#include "measuring/ZtTableNumber.h"
#include "measuring/ZtUnitSettings.h"

#include <algorithm>
#include <cmath>
#include <cstring>

namespace {

const char formulaStarts[] = "=+-@\t\r\n";

const ZtKernelData *kernel()
{
    return ZtKernelData::getInstance();
}

bool isMeasured(int typeId)
{
    const ZtGsManipulator *const manipulator = kernel()->getGsManipulator(typeId);
    return manipulator && (manipulator->typeFlags(0) & ZtGsManipulator::MeasurementFlag);
}

// The unit in which values of a kind are written.
ZtUnit unitOfKind(int kind)
{
    const ZtUnit chosen = ZtUnitSettings::getInstance()->chosenUnit(kind);
    if (!chosen.isEmpty())
        return chosen;
    switch (kind) {
    case ZtGsManipulator::Length:
        return ZtUnit::parse(QStringLiteral("um"));
    case ZtGsManipulator::Area:
        return ZtUnit::parse(QStringLiteral("um2"));
    case ZtGsManipulator::Angle:
        return ZtUnit::parse(QStringLiteral("deg"));
    case ZtGsManipulator::Count:
        return ZtUnit::parse(QStringLiteral("pcs"));
    case ZtGsManipulator::Percentage:
        return ZtUnit::parse(QStringLiteral("%"));
    default:
        return ZtUnit();
    }
}

// Of a kind without known units, the one that the text of the value ends with.
ZtUnit unitInText(const QString &text)
{
    const int blank = text.indexOf(QLatin1Char(' '));
    return ZtUnit(ZtGsManipulator::NoKind, 1.0, blank < 0 ? QString() : text.mid(blank + 1));
}

bool isDigit(char c)
{
    return c >= '0' && c <= '9';
}

// Whether a number is written in a way that every reader takes: no sign but a minus, digits on both sides of
// a point, no needless zero before others.
bool isPlainNumber(const QByteArray &text)
{
    const char *at = text.constData();
    const auto skipDigits = [&at] {
        const char *const first = at;
        while (isDigit(*at))
            ++at;
        return at != first;
    };
    if (*at == '-')
        ++at;
    if (*at == '0' && isDigit(at[1]))
        return false;
    if (!skipDigits())
        return false;
    if (*at == '.' && (++at, !skipDigits()))
        return false;
    if (*at == 'e' || *at == 'E') {
        ++at;
        if (*at == '+' || *at == '-')
            ++at;
        if (!skipDigits())
            return false;
    }
    return *at == '\0';
}

QByteArray jsonText(const QString &text)
{
    QByteArray result;
    ZtJsonText::append(&result, text);
    return result;
}

} // namespace

ZtTableExport::ZtTableExport(const Options &options)
    : m_options(options)
    , m_hasDecimalComma(!isJson() && options.locale.decimalPoint() == QLatin1Char(','))
{
    m_separator = m_hasDecimalComma ? ';' : ',';
    collectObjects();
    if (m_options.layout == WideCsv)
        collectColumns();
    writeHeader();
}

QByteArray ZtTableExport::toBytes(const Options &options)
{
    ZtTableExport table(options);
    table.advance(table.objectCount());
    return table.bytes();
}

bool ZtTableExport::writeFile(const QString &path, const Options &options, ZtFault *fault)
{
    return ZtSafeFile::write(path, toBytes(options), fault);
}

void ZtTableExport::collectObjects()
{
    if (m_options.isSelectionOnly) {
        m_objects = m_options.selection;
        std::sort(m_objects.begin(), m_objects.end());
        m_objects.erase(std::unique(m_objects.begin(), m_objects.end()), m_objects.end());
        const auto isOther = [](const ObjectId &object) { return !isMeasured(object.first); };
        m_objects.erase(std::remove_if(m_objects.begin(), m_objects.end(), isOther), m_objects.end());
        return;
    }
    const QMap<int, ZtObjectMap> &all = kernel()->objects();
    for (auto type = all.constBegin(); type != all.constEnd(); ++type) {
        if (!isMeasured(type.key()))
            continue;
        m_objects.reserve(m_objects.size() + type->size());
        for (auto it = type->constBegin(); it != type->constEnd(); ++it)
            m_objects.append({type.key(), it.key()});
    }
}

const ZtTableExport::Type &ZtTableExport::type(int typeId)
{
    Type &type = m_types[typeId];
    const ZtGsManipulator *const manipulator = kernel()->getGsManipulator(typeId);
    if (type.manipulator == manipulator)
        return type;
    type.manipulator = manipulator;
    type.imported = dynamic_cast<const ZtImportedManipulator *>(manipulator);
    type.name = field(manipulator->objectTypeName(0));
    for (const QString &name : manipulator->getValueNames())
        type.values.push_back({field(name), -1});
    return type;
}

// A value has one column in all types where it is in the same unit.
void ZtTableExport::collectColumns()
{
    QHash<QPair<QString, QString>, int> places;
    int lastType = 0;
    for (const ObjectId &object : qAsConst(m_objects)) {
        if (object.first == lastType)
            continue;
        lastType = object.first;
        type(lastType);
        Type &first = m_types[lastType];
        for (std::size_t i = 0; i < first.values.size(); ++i) {
            const int value = static_cast<int>(i);
            const QPair<QString, QString> column(first.manipulator->getValueNames().at(value),
                                                 columnUnit(first, object, value).text());
            if (!places.contains(column)) {
                places.insert(column, m_columns.size());
                m_columns.append(column);
            }
            first.values[i].column = places.value(column);
        }
    }
}

ZtUnit ZtTableExport::columnUnit(const Type &type, const ObjectId &object, int value) const
{
    if (type.imported)
        return type.imported->type().values().at(value).unit;
    const QString name = type.manipulator->getValueNames().at(value);
    const ZtKernelObjectData *const data = kernel()->object(object.first, object.second);
    int kind = ZtGsManipulator::NoKind;
    type.manipulator->value(name, data, kind);
    return kind == ZtGsManipulator::NoKind ? unitInText(type.manipulator->valueText(name, data))
                                           : unitOfKind(kind);
}

void ZtTableExport::writeHeader()
{
    if (isJson()) {
        m_bytes = "{\"format\":\"statreport-values\",\"version\":1,\"objects\":[";
        return;
    }
    if (m_options.hasByteOrderMark)
        m_bytes = "\xEF\xBB\xBF";
    QList<QByteArray> names{"object_type", "object_index", "object_name"};
    if (m_options.layout == TidyCsv)
        names << "value_name"
              << "unit"
              << "value";
    for (const QPair<QString, QString> &column : qAsConst(m_columns)) {
        const bool hasUnit = !column.second.isEmpty();
        names << csvField(hasUnit ? column.first + QStringLiteral(" [%1]").arg(column.second) : column.first);
    }
    m_bytes += names.join(m_separator) + '\n';
}

void ZtTableExport::advance(int objects)
{
    const int end = m_done + qMin(objects, m_objects.size() - m_done);
    for (; m_done < end; ++m_done)
        writeObject(m_objects.at(m_done));
    if (m_done == m_objects.size() && !m_isClosed)
        writeEnd();
}

void ZtTableExport::writeEnd()
{
    m_isClosed = true;
    if (isJson())
        m_bytes += "\n]}\n";
}

void ZtTableExport::writeObject(const ObjectId &object)
{
    if (!isMeasured(object.first) || !kernel()->object(object.first, object.second))
        return;
    const Type &written = type(object.first);
    readCells(object, written);
    switch (m_options.layout) {
    case TidyCsv:
        writeTidyRows(object, written);
        break;
    case WideCsv:
        writeWideRow(object, written);
        break;
    case Json:
        writeJsonObject(object, written);
        break;
    }
}

void ZtTableExport::readCells(const ObjectId &object, const Type &type)
{
    m_cells.clear();
    const ZtKernelObjectData *const data = kernel()->object(object.first, object.second);
    const QStringList shown = type.manipulator->valueSet(object.second);
    const QStringList names = type.manipulator->getValueNames();
    for (int i = 0; i < names.size(); ++i) {
        if (!type.manipulator->isValueShown(names.at(i), shown))
            continue;
        if (type.imported)
            readImportedCell(type, data, i);
        else
            readCell(type, data, i);
    }
}

void ZtTableExport::readImportedCell(const Type &type, const ZtKernelObjectData *data, int value)
{
    const ZtImportedType &table = type.imported->type();
    const ZtImportedCell *const cell =
        table.cell(static_cast<const ZtImportedObjectData *>(data)->row(), value);
    if (!cell)
        return;
    // One column has one unit.
    const ZtUnit &unit = m_options.layout == WideCsv ? table.values().at(value).unit : table.unit(*cell);
    m_cells.push_back({value, unitField(unit.text()), importedNumber(*type.imported, *cell, unit)});
}

QByteArray ZtTableExport::importedNumber(const ZtImportedManipulator &manipulator, const ZtImportedCell &cell,
                                         const ZtUnit &unit) const
{
    const ZtImportedType &table = manipulator.type();
    if (unit != table.unit(cell))
        return number(unit.fromBase(cell.value));
    const std::string_view text = table.number(cell);
    QByteArray written(text.data(), static_cast<int>(text.size()));
    if (!isPlainNumber(written))
        return number(ZtTableNumber::read(text, false).value);
    return m_hasDecimalComma ? written.replace('.', ',') : written;
}

void ZtTableExport::readCell(const Type &type, const ZtKernelObjectData *data, int value)
{
    const QString name = type.manipulator->getValueNames().at(value);
    int kind = ZtGsManipulator::NoKind;
    const QVariant measured = type.manipulator->value(name, data, kind);
    const double base = measured.toDouble();
    if (!measured.isValid() || !std::isfinite(base))
        return;
    const bool isOther = kind == ZtGsManipulator::NoKind;
    const ZtUnit unit = isOther ? unitInText(type.manipulator->valueText(name, data)) : unitOfKind(kind);
    m_cells.push_back({value, unitField(unit.text()), number(unit.fromBase(base))});
}

void ZtTableExport::writeTidyRows(const ObjectId &object, const Type &type)
{
    const QByteArray start = type.name + m_separator + QByteArray::number(object.second) + m_separator +
                             field(type.manipulator->getObjectName(object.second)) + m_separator;
    for (const Cell &cell : m_cells) {
        m_bytes += start;
        m_bytes += type.values[static_cast<std::size_t>(cell.value)].name;
        m_bytes += m_separator;
        m_bytes += cell.unit;
        m_bytes += m_separator;
        m_bytes += cell.number;
        m_bytes += '\n';
    }
}

void ZtTableExport::writeWideRow(const ObjectId &object, const Type &type)
{
    m_bytes += type.name + m_separator + QByteArray::number(object.second) + m_separator +
               field(type.manipulator->getObjectName(object.second));
    const auto column = [&type](const Cell &cell) {
        return type.values[static_cast<std::size_t>(cell.value)].column;
    };
    // Types share columns, so their values need not come in the order of these.
    std::sort(m_cells.begin(), m_cells.end(),
              [&column](const Cell &a, const Cell &b) { return column(a) < column(b); });
    auto cell = m_cells.begin();
    for (int i = 0; i < m_columns.size(); ++i) {
        m_bytes += m_separator;
        if (cell != m_cells.end() && column(*cell) == i)
            m_bytes += (cell++)->number;
    }
    m_bytes += '\n';
}

void ZtTableExport::writeJsonObject(const ObjectId &object, const Type &type)
{
    m_bytes += m_bytes.endsWith('[') ? "\n" : ",\n";
    m_bytes += "{\"type\":" + type.name + ",\"index\":" + QByteArray::number(object.second) +
               ",\"name\":" + field(type.manipulator->getObjectName(object.second)) + ",\"values\":[";
    const char *separator = "";
    for (const Cell &cell : m_cells) {
        m_bytes += separator;
        m_bytes += "{\"name\":" + type.values[static_cast<std::size_t>(cell.value)].name +
                   ",\"unit\":" + cell.unit + ",\"value\":" + cell.number + '}';
        separator = ",";
    }
    m_bytes += "]}";
}

QByteArray ZtTableExport::number(double value) const
{
    QByteArray text = ZtJsonText::number(value);
    return m_hasDecimalComma ? text.replace('.', ',') : text;
}

QByteArray ZtTableExport::unitField(const QString &unit)
{
    auto found = m_unitFields.constFind(unit);
    if (found == m_unitFields.constEnd())
        found = m_unitFields.insert(unit, field(unit));
    return *found;
}

QByteArray ZtTableExport::field(const QString &text) const
{
    return isJson() ? jsonText(text) : csvField(text);
}

QByteArray ZtTableExport::csvField(const QString &text) const
{
    QByteArray bytes = text.toUtf8();
    if (m_options.guardsFormulas && !bytes.isEmpty() && std::strchr(formulaStarts, bytes.at(0)))
        bytes.prepend('\'');
    const bool hasBlankEnd = bytes.startsWith(' ') || bytes.endsWith(' ');
    const char special[] = {m_separator, '"', '\n', '\r', '\t', '\0'};
    if (!hasBlankEnd && !std::strpbrk(bytes.constData(), special))
        return bytes;
    return '"' + bytes.replace('"', "\"\"") + '"';
}
