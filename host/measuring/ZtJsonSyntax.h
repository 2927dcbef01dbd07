// SPDX-License-Identifier: MIT
#pragma once

#include "measuring/ZtMeasuringGlobal.h"

#include <QJsonParseError>

#include <cstddef>
#include <string_view>
#include <vector>

class ZtProgress;

/**
 * Checks that bytes are one list or object in JSON, strictly: UTF-8 without control characters in texts, no
 * half surrogate pairs, no unknown escapes, no numbers that a double cannot hold. A byte order mark before it
 * is allowed.
 *
 * Builds nothing of what it reads, so that it takes little more than looking at every byte once.
 */
class ZT_MEASURING_EXPORT ZtJsonSyntax
{
public:
    /** Lists and objects inside each other; more are refused. */
    static constexpr int mostLevels = 1024;
    /** Bytes from which a list or object is remembered as large. */
    static constexpr std::size_t largeSize = 4096;

    /** Where a list or object begins, and the byte behind it. */
    struct Part
    {
        std::size_t begin;
        std::size_t end;
    };

    /** \a bytes have to outlive this. */
    explicit ZtJsonSyntax(std::string_view bytes, ZtProgress *progress = nullptr);

    /** False for bytes that are no JSON, and when it was cancelled: then there is no error(). */
    bool check();
    /** What is wrong, and the byte where that shows, from 0. */
    const QJsonParseError &error() const { return m_error; }

    /** The first byte of the list or object. */
    std::size_t begin() const { return m_begin; }
    /** The large lists and objects in the order in which they begin, for who wants to pass them over. */
    std::vector<Part> takeLargeParts() { return std::move(m_largeParts); }

private:
    bool checkValue(int level);
    bool checkList(int level);
    bool checkObject(int level);
    bool checkMember(int level);
    bool checkText();
    bool checkEscape();
    bool checkUnicodeEscape();
    bool checkCharacter();
    bool checkNumber();
    bool checkWord(std::string_view word);
    bool readHex(unsigned *code);
    bool isHeld(std::size_t begin) const;
    bool skipDigits();
    void skipBlanks();
    bool take(char wanted);
    char current() const { return m_at < m_bytes.size() ? m_bytes[m_at] : '\0'; }
    bool goOn();
    bool enter(int level);
    bool leave(std::size_t begin);
    bool fail(QJsonParseError::ParseError error);

    std::string_view m_bytes;
    ZtProgress *m_progress;
    std::size_t m_at = 0;
    std::size_t m_begin = 0;
    std::size_t m_nextLook = 0; ///< where to tell about progress next
    std::vector<Part> m_largeParts;
    QJsonParseError m_error;
};
