// SPDX-License-Identifier: MIT
#include "measuring/ZtTableReader.h"

#include "measuring/ZtImportedTypeBuilder.h"
#include "measuring/ZtTableNumber.h"

#include <QSet>

#include <cmath>

namespace {

constexpr int longestQuote = 40;

QString toText(std::string_view field)
{
    return QString::fromUtf8(field.data(), static_cast<int>(field.size()));
}

} // namespace

ZtTableReader::ZtTableReader(ZtTableRows *rows, const ZtTableImportOptions &options, bool decimalComma)
    : m_rows(rows)
    , m_options(options)
    , m_decimalComma(decimalComma)
    , m_units(options.units)
{}

ZtTableReader::~ZtTableReader() = default;

QString ZtTableReader::quoted(std::string_view field)
{
    // Ten times as many bytes are enough for the longest quote in any script.
    QString text = toText(field.substr(0, longestQuote * 10)).simplified();
    if (text.size() > longestQuote)
        text = text.left(longestQuote - 1) + QChar(0x2026);
    return QLatin1Char('"') + text + QLatin1Char('"');
}

QString ZtTableReader::quoted(const QStringList &texts)
{
    QStringList result;
    for (const QString &text : texts)
        result.append(quoted(text.toStdString()));
    return result.join(QStringLiteral(", "));
}

bool ZtTableReader::read(ZtImportedTable *table)
{
    m_rows->rewind();
    if (!readTable() || hasFault() || !checkUnits())
        return false;
    if (m_builders.empty())
        addNote(tr("The table has no rows"));
    return build(table);
}

bool ZtTableReader::readHeader()
{
    ZtCsvRow row;
    if (!nextRow(&row))
        return false;
    m_headerLine = row.line;
    m_headers.clear();
    for (const std::string_view field : row.fields)
        m_headers.append(ZtTableHeader::parse(toText(field)));
    return true;
}

void ZtTableReader::rewindToFirstRow()
{
    ZtCsvRow header;
    m_rows->rewind();
    m_rows->next(&header);
}

bool ZtTableReader::nextRow(ZtCsvRow *row)
{
    if (m_rows->next(row))
        return true;
    m_fault = m_rows->fault();
    return false;
}

bool ZtTableReader::nextRowLikeHeader(ZtCsvRow *row)
{
    if (!nextRow(row))
        return false;
    const int count = static_cast<int>(row->fields.size());
    if (count == m_headers.size())
        return true;
    return fail(row->line, qMin(count, m_headers.size()) + 1,
                tr("The row and the header differ in their number of fields (%1 and %2)")
                    .arg(count)
                    .arg(m_headers.size()));
}

bool ZtTableReader::fail(int line, int column, const QString &message)
{
    m_fault.line = line;
    m_fault.column = column;
    m_fault.message = message;
    return false;
}

bool ZtTableReader::failNumber(const ZtCsvRow &row, int column, bool isInfinite)
{
    const QString text = quoted(row.fields[static_cast<std::size_t>(column)]);
    return fail(row.line, column + 1,
                isInfinite ? tr("%1 is not a finite number").arg(text) : tr("%1 is not a number").arg(text));
}

bool ZtTableReader::failUnit(const ZtCsvRow &row, int column, const Target &target, const ZtUnit &unit)
{
    const ZtImportedTypeBuilder &type = builder(target.type);
    const ZtImportedValue &value = type.value(target.valueIndex);
    return fail(row.line, (unitColumn() < 0 ? column : unitColumn()) + 1,
                tr("\"%1\" of \"%2\" is given in \"%3\" here, but in \"%4\" before")
                    .arg(value.name, type.name(), unit.text(), value.unit.text()));
}

bool ZtTableReader::addNumber(const ZtCsvRow &row, int column, const Target &target, const ZtUnit &unit)
{
    const std::string_view field = row.fields[static_cast<std::size_t>(column)];
    const ZtTableNumber number = ZtTableNumber::read(field, m_decimalComma);
    if (number.kind == ZtTableNumber::Missing)
        return true;
    // A large number of a large unit may be none in base units.
    const bool isInfinite =
        number.kind == ZtTableNumber::Infinite || !std::isfinite(unit.toBase(number.value));
    if (number.kind != ZtTableNumber::Number || isInfinite)
        return failNumber(row, column, isInfinite);
    const bool isAdded = builder(target.type)
                             .addCell(target.object, target.valueIndex, number.value,
                                      ZtTableNumber::textOf(field, m_decimalComma, &m_numberText), unit,
                                      {row.line, column + 1});
    return isAdded || failUnit(row, column, target, unit);
}

bool ZtTableReader::findColumnOption(const QString &name, int *column)
{
    if (name.isEmpty())
        return true;
    *column = ZtTableHeader::find(m_headers, name);
    if (*column >= 0)
        return true;
    QStringList names;
    for (const ZtTableHeader &header : qAsConst(m_headers))
        names.append(header.written);
    return fail(
        m_headerLine, 0,
        tr("There is no column %1; the columns are %2").arg(quoted(name.toStdString()), quoted(names)));
}

int ZtTableReader::typeIndex(std::string_view name)
{
    const std::string_view text = ZtTableNumber::trimmed(name);
    const auto key = QByteArray::fromRawData(text.data(), static_cast<int>(text.size()));
    const auto found = m_typeIndexes.constFind(key);
    if (found != m_typeIndexes.constEnd())
        return *found;
    // Cells without a type and those of a type of that very name make one type.
    const bool isMissing = ZtTableNumber::read(text, false).kind == ZtTableNumber::Missing;
    QString display = isMissing ? QString() : toText(text).simplified();
    if (display.isEmpty())
        display = tr("Object");
    const int index = m_typesByName.value(display, typeCount());
    if (index == typeCount()) {
        m_builders.push_back(std::make_unique<ZtImportedTypeBuilder>(display));
        m_typesByName.insert(display, index);
    }
    m_typeIndexes.insert(QByteArray(text.data(), static_cast<int>(text.size())), index);
    return index;
}

int ZtTableReader::addObject(int typeIndex, std::string_view key)
{
    ZtImportedTypeBuilder &type = builder(typeIndex);
    const ZtTableNumber number = ZtTableNumber::read(key, false);
    if (number.kind == ZtTableNumber::Missing)
        return type.addRow();
    const QString text = toText(ZtTableNumber::trimmed(key)).simplified();
    if (number.kind != ZtTableNumber::Number)
        return type.addRow(text.isEmpty() ? QString() : text);
    const bool isDefault = text == QString::number(type.rowCount() + 1);
    return type.addRow(isDefault ? QString() : type.name() + QLatin1Char(' ') + text);
}

bool ZtTableReader::checkUnits()
{
    const QStringList unused = m_units.unusedNames();
    if (unused.isEmpty() || m_builders.empty())
        return true;
    QStringList names;
    QSet<QString> seen;
    for (const auto &type : m_builders) {
        for (int i = 0; i < type->valueCount(); ++i) {
            if (!seen.contains(type->value(i).name))
                names.append(type->value(i).name);
            seen.insert(type->value(i).name);
        }
    }
    return fail(0, 0,
                tr("There is no value %1 to give a unit; the values are %2")
                    .arg(quoted(unused.first().toStdString()), quoted(names)));
}

bool ZtTableReader::build(ZtImportedTable *table)
{
    ZtImportedTable result;
    for (const auto &type : m_builders) {
        result.types.append(type->build(&m_fault));
        if (hasFault())
            return false;
    }
    result.notes = m_notes;
    *table = result;
    return true;
}
