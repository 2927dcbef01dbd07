// SPDX-License-Identifier: MIT
#include "measuring/ZtImportedType.h"

#include "measuring/ZtMeasureFormat.h"

#include <algorithm>

QStringList ZtImportedType::valueNames() const
{
    QStringList names;
    names.reserve(m_values.size());
    for (const ZtImportedValue &value : m_values)
        names.append(value.name);
    return names;
}

int ZtImportedType::valueIndex(const QString &valueName) const
{
    for (int i = 0; i < m_values.size(); ++i) {
        if (m_values.at(i).name == valueName)
            return i;
    }
    return -1;
}

ZtImportedType::Row ZtImportedType::row(int row) const
{
    const auto index = static_cast<std::size_t>(row);
    const ZtImportedCell *cells = m_cells.data();
    return {cells + m_rowStarts[index], cells + m_rowStarts[index + 1]};
}

const ZtImportedCell *ZtImportedType::cell(int row, int valueIndex) const
{
    const Row cells = this->row(row);
    // In a row without gaps a cell stands at the place of its value.
    if (cells.last - cells.first == m_values.size())
        return cells.first + valueIndex;
    const auto isBefore = [](const ZtImportedCell &cell, int index) { return cell.valueIndex < index; };
    const ZtImportedCell *found = std::lower_bound(cells.first, cells.last, valueIndex, isBefore);
    return found != cells.last && found->valueIndex == valueIndex ? found : nullptr;
}

QString ZtImportedType::numberText(const ZtImportedCell &cell) const
{
    const std::string_view written = number(cell);
    return QString::fromLatin1(written.data(), static_cast<int>(written.size()));
}

QString ZtImportedType::text(const ZtImportedCell &cell) const
{
    m_texts.resize(m_cells.size());
    QString &text = m_texts[static_cast<std::size_t>(&cell - m_cells.data())];
    if (text.isNull())
        text = ZtMeasureFormat::withUnit(numberText(cell), unit(cell).text());
    return text;
}
