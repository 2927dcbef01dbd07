// SPDX-License-Identifier: MIT
#pragma once

#include "measuring/ZtJsonRows.h"

/** The values that ZtTableExport writes as JSON, one row for each; an object without values has one row
 * without any. */
class ZtJsonValues : public ZtJsonRows
{
    Q_DECLARE_TR_FUNCTIONS(ZtTableImport)
public:
    static constexpr char formatName[] = "statreport-values";
    static constexpr int version = 1;

    /** What an object, where the reader stands, says about its format; empty when it does not. */
    static QString formatOf(ZtJsonReader json);

    /** \a json was checked and stands at an object of this format. */
    ZtJsonValues(const ZtJsonReader &json, ZtProgress *progress);

protected:
    bool prepare() override;
    bool nextRecord(ZtCsvRow *row) override;
    QString placeOf(int column) const override;
    void rewindRecords() override { m_value = -1; }

private:
    bool checkVersion(std::size_t position);
    bool readObject();
    bool enterValues(std::size_t position);
    bool readMember(int column, std::size_t position, std::deque<std::string> *texts,
                    std::string_view *field);
    bool readValue(ZtCsvRow *row);
    void nameObject();
    void leaveObject();

    std::vector<std::size_t> m_positions;
    std::deque<std::string> m_texts; ///< that the fields of the object point to
    std::string_view m_type;
    std::string_view m_key; ///< tells the object from all others
    std::string_view m_name;
    std::size_t m_objectEnd = 0;
    int m_value = -1; ///< index of the value that was read last; -1 outside of an object
};
