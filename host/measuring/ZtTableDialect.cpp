// SPDX-License-Identifier: MIT
#include "measuring/ZtTableDialect.h"

#include "measuring/ZtCsvReader.h"
#include "measuring/ZtTableNumber.h"

#include <algorithm>
#include <vector>

namespace {

constexpr int sampleRows = 20;

struct Candidate
{
    char separator = ',';
    double consistency = -1.0; ///< share of the sampled rows that have as many fields as the header
    std::size_t fields = 0;    ///< of the header
};

Candidate judge(std::string_view text, char separator)
{
    Candidate candidate;
    candidate.separator = separator;
    ZtCsvReader reader(text, separator);
    ZtCsvRow row;
    if (!reader.next(&row))
        return candidate;
    candidate.fields = row.fields.size();
    int rows = 0;
    int alike = 0;
    while (rows < sampleRows && reader.next(&row)) {
        ++rows;
        alike += row.fields.size() == candidate.fields ? 1 : 0;
    }
    candidate.consistency = rows > 0 ? static_cast<double>(alike) / rows : 1.0;
    return candidate;
}

bool isBetter(const Candidate &a, const Candidate &b)
{
    if ((a.fields > 1) != (b.fields > 1))
        return a.fields > 1;
    if (a.fields <= 1)
        return false;
    if (a.consistency != b.consistency)
        return a.consistency > b.consistency;
    // Commas may as well be decimal marks; the others hardly ever mean anything else.
    if ((a.separator == ',') != (b.separator == ','))
        return b.separator == ',';
    return a.fields > b.fields;
}

bool usesMark(std::string_view field, char mark)
{
    return field.find(mark) != std::string_view::npos &&
           ZtTableNumber::read(field, mark == ',').kind == ZtTableNumber::Number;
}

} // namespace

char ZtTableDialect::findSeparator(std::string_view text, bool decimalComma)
{
    const std::vector<char> separators =
        decimalComma ? std::vector<char>{';', '\t'} : std::vector<char>{',', ';', '\t'};
    Candidate best = judge(text, separators.front());
    for (std::size_t i = 1; i < separators.size(); ++i) {
        const Candidate candidate = judge(text, separators[i]);
        if (isBetter(candidate, best))
            best = candidate;
    }
    // Quoted numbers may have a decimal comma between separating commas.
    if (decimalComma && best.fields <= 1 && judge(text, ',').fields > 1)
        return ',';
    return best.separator;
}

bool ZtTableDialect::hasDecimalComma(ZtCsvReader *reader)
{
    if (reader->separator() == ',')
        return false;
    bool hasComma = false;
    bool hasPoint = false;
    ZtCsvRow row;
    reader->rewind();
    while (!hasPoint && reader->next(&row)) {
        for (const std::string_view field : row.fields) {
            hasComma = hasComma || usesMark(field, ',');
            hasPoint = hasPoint || usesMark(field, '.');
        }
    }
    reader->rewind();
    return hasComma && !hasPoint;
}
