// SPDX-License-Identifier: MIT
#pragma once

#include "measuring/ZtJsonSyntax.h"
#include "measuring/ZtMeasuringGlobal.h"

#include <QString>

#include <string>
#include <string_view>
#include <vector>

class ZtProgress;
struct ZtFault;

/**
 * Takes one value after another from JSON, without building a tree of all of it.
 *
 * The reader stands at a value, and each call that takes the value moves it behind. Inside a list or object
 * nextItem() or nextMember() moves it on to the value that follows. A call for another kind of value than
 * kind() tells is an error of the caller.
 */
class ZT_MEASURING_EXPORT ZtJsonReader
{
public:
    enum Kind { Null, Boolean, Number, Text, List, Object };

    /** \a bytes have to outlive the reader. */
    explicit ZtJsonReader(std::string_view bytes);

    /**
     * Checks all of the bytes, and stands at their list or object then. To be called first: the others rely
     * on JSON without faults. False as ZtJsonSyntax::check().
     */
    bool check(ZtProgress *progress = nullptr);
    const QJsonParseError &error() const { return m_error; }
    /** The same for the user, with its line. */
    ZtFault fault() const;
    /** Line of a byte, from 1. */
    int lineOf(int offset) const;

    Kind kind() const;
    double number();
    bool boolean();
    QString text();
    /** A text in UTF-8: a piece of the bytes where that is possible, else put into \a buffer. */
    std::string_view utf8(std::string *buffer);
    /** Passes over a value of any kind. */
    void skip();

    /** Goes into a list or object. */
    void enter();
    /** False behind the last item; then the reader stands behind the list. */
    bool nextItem();
    /** The same for an object; \a key as utf8() gives it. A key may come twice: then the last one counts. */
    bool nextMember(std::string_view *key, std::string *buffer);
    /** How many items the list has that the reader stands at; passes over it. */
    int countItems();

    /** The byte where the reader stands, to come back with seek(). */
    std::size_t position() const { return m_at; }
    void seek(std::size_t position) { m_at = position; }
    /** The bytes from \a begin to where the reader stands. */
    std::string_view bytesFrom(std::size_t begin) const { return m_bytes.substr(begin, m_at - begin); }
    std::size_t size() const { return m_bytes.size(); }

private:
    void skipBlanks();
    void skipText();
    void skipNested();
    bool next(char end);

    std::string_view m_bytes;
    std::size_t m_at = 0;
    QJsonParseError m_error;
    std::vector<ZtJsonSyntax::Part> m_largeParts; ///< that need not be looked through to be passed over
};
