// SPDX-License-Identifier: MIT
#pragma once

#include "measuring/ZtFault.h"
#include "measuring/ZtMeasuringGlobal.h"
#include "measuring/ZtTableRows.h"

#include <deque>
#include <string>
#include <string_view>
#include <vector>

class ZtProgress;

/** One row of a table, as separated values or as another file has it; its fields point into the reader's text
 * and into the row itself. */
struct ZtCsvRow
{
    int line = 0;                         ///< where the row begins, from 1
    std::vector<std::string_view> fields; ///< UTF-8; blanks around unquoted fields are dropped
    std::deque<std::string> unescaped;    ///< quoted fields that held doubled quotes
};

/**
 * Reads separated values row by row, in any number of passes.
 *
 * Fields may be quoted with ", then they may hold separators, line ends and, doubled, quotes. Lines end with
 * LF, CR LF or CR. Lines of nothing but blanks and separators are no rows.
 */
class ZT_MEASURING_EXPORT ZtCsvReader : public ZtTableRows
{
public:
    /** \a text has to outlive the reader. */
    ZtCsvReader(std::string_view text, char separator);

    /** Rows are counted for \a progress from now on; reading ends with a fault when it is cancelled. */
    void setProgress(ZtProgress *progress) { m_progress = progress; }
    void beginPass(double from, double to) override;
    void rewind() override;
    bool next(ZtCsvRow *row) override;
    const ZtFault &fault() const override { return m_fault; }
    char separator() const { return m_separator; }

private:
    bool goOn();
    bool readRow(ZtCsvRow *row);
    bool readField(ZtCsvRow *row);
    bool readQuotedField(ZtCsvRow *row);
    void readPlainField(ZtCsvRow *row);
    void skipBlanks();
    bool skipLineEnd();
    bool isFieldEnd() const;
    bool fail(int line, std::size_t field, const QString &message);

    std::string_view m_text;
    char m_separator;
    std::size_t m_position = 0;
    int m_line = 1;
    ZtProgress *m_progress = nullptr;
    qint64 m_rowsUntilLook = 0;
    ZtFault m_fault;
};
