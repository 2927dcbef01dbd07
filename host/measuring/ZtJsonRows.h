// SPDX-License-Identifier: MIT
#pragma once

#include "measuring/ZtFault.h"
#include "measuring/ZtJsonReader.h"
#include "measuring/ZtMeasuringGlobal.h"
#include "measuring/ZtTableRows.h"

#include <QCoreApplication>

#include <deque>
#include <initializer_list>
#include <memory>
#include <string>
#include <string_view>
#include <vector>

class ZtProgress;

/** Base of the tables in JSON: the first row has the names of the columns, the fields of the others are texts
 * as those of separated values are. Null and what is left out make empty fields. */
class ZT_MEASURING_EXPORT ZtJsonRows : public ZtTableRows
{
    Q_DECLARE_TR_FUNCTIONS(ZtTableImport)
public:
    /** Whether a text in UTF-8 is one list or object in JSON, if anything: by its first character. */
    static bool recognizes(std::string_view text);

    /** The rows of a text, which has to outlive them; null with a fault for one that is no table. */
    static std::unique_ptr<ZtJsonRows> open(std::string_view text, ZtProgress *progress, ZtFault *fault);

    void rewind() override;
    bool next(ZtCsvRow *row) override;
    const ZtFault &fault() const override { return m_fault; }
    void beginPass(double from, double to) override;

    /** A fault that a reader found in a field of the row that was read last, with its place instead of the
     * field's number. */
    ZtFault located(ZtFault fault) const;

protected:
    ZtJsonRows(const ZtJsonReader &json, ZtProgress *progress);

    /** Finds the list of records, and the columns where the records name them; false with a fault. */
    virtual bool prepare() = 0;
    virtual bool nextRecord(ZtCsvRow *row) = 0;
    /** Where a field of the record that was read last is. */
    virtual QString placeOf(int column) const = 0;
    virtual void rewindRecords() {}

    ZtJsonReader &json() { return m_json; }
    std::vector<std::string> &columns() { return m_columns; }
    const std::vector<std::string> &columns() const { return m_columns; }
    /** The reader stands at the list of records. */
    bool setList(const QString &place);
    /** Goes to the next record; false behind the last, and after a fault. */
    bool nextItem();
    /** Index of the record that was read last. */
    int item() const { return m_item; }
    /** The line where the reader stands. */
    int line();
    bool fail(const QString &place, const QString &message);
    bool failTwice(const QString &place);

    /** The positions of the members of the object where the reader stands, 0 for missing ones; moves behind
     * it.
     */
    bool findMembers(const QString &place, std::initializer_list<std::string_view> keys,
                     std::vector<std::size_t> *positions);
    /** Reads a text, number, truth value or null; \a texts take what has no piece of the file to point to. */
    bool readField(const QString &place, std::deque<std::string> *texts, std::string_view *field);
    /** What is wrong in a structured file, in the words that sessions have for it. */
    static QString reason(const char *text);
    static QString toPlace(std::string_view key);

private:
    static std::unique_ptr<ZtJsonRows> make(ZtJsonReader *json, ZtProgress *progress, ZtFault *fault);

    ZtJsonReader m_json;
    ZtProgress *m_progress;
    std::vector<std::string> m_columns;
    std::size_t m_list = 0;
    std::size_t m_linePosition = 0;
    int m_line = 1;
    int m_item = -1;
    bool m_isHeaderRead = false;
    bool m_isAtEnd = false;
    ZtFault m_fault;
};
