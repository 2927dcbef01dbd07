// SPDX-License-Identifier: MIT
#include "measuring/ZtJsonReader.h"

#include "support/StatReportTest.h"

#include <QJsonArray>
#include <QJsonDocument>
#include <QJsonObject>

#include <cmath>
#include <limits>
#include <random>

namespace {

std::string_view view(const QByteArray &bytes)
{
    return std::string_view(bytes.constData(), static_cast<std::size_t>(bytes.size()));
}

QJsonValue readValue(ZtJsonReader *json);

QJsonArray readList(ZtJsonReader *json)
{
    QJsonArray list;
    for (json->enter(); json->nextItem();)
        list.append(readValue(json));
    return list;
}

QJsonObject readObject(ZtJsonReader *json)
{
    QJsonObject object;
    std::string_view key;
    std::string buffer;
    json->enter();
    while (json->nextMember(&key, &buffer)) {
        const QString name = QString::fromUtf8(key.data(), static_cast<int>(key.size()));
        object.insert(name, readValue(json));
    }
    return object;
}

/// All of a value, as the peer gives it.
QJsonValue readValue(ZtJsonReader *json)
{
    switch (json->kind()) {
    case ZtJsonReader::Boolean:
        return json->boolean();
    case ZtJsonReader::Number:
        return json->number();
    case ZtJsonReader::Text:
        return json->text();
    case ZtJsonReader::List:
        return readList(json);
    case ZtJsonReader::Object:
        return readObject(json);
    case ZtJsonReader::Null:
        break;
    }
    json->skip();
    return QJsonValue();
}

QJsonValue read(const QByteArray &bytes)
{
    ZtJsonReader json(view(bytes));
    return json.check() ? readValue(&json) : QJsonValue(QJsonValue::Undefined);
}

/// The peer keeps whole numbers that no double holds: here they are doubles, too.
QJsonValue rounded(const QJsonValue &value)
{
    if (value.isDouble())
        return value.toDouble();
    if (value.isArray()) {
        QJsonArray list;
        for (const QJsonValue item : value.toArray())
            list.append(rounded(item));
        return list;
    }
    if (!value.isObject())
        return value;
    QJsonObject object = value.toObject();
    for (auto member = object.begin(); member != object.end(); ++member)
        member.value() = rounded(member.value());
    return object;
}

QJsonValue readByPeer(const QByteArray &bytes)
{
    QJsonParseError error;
    const QJsonDocument document = QJsonDocument::fromJson(bytes, &error);
    if (error.error != QJsonParseError::NoError)
        return QJsonValue(QJsonValue::Undefined);
    return rounded(document.isArray() ? QJsonValue(document.array()) : QJsonValue(document.object()));
}

/// Makes JSON with everything that is allowed, the same for the same seed. There are no characters from
/// U+E000 to U+FFFF: beside those beyond, the peer puts keys in an order in which it does not find them
/// again.
class RandomJson
{
public:
    explicit RandomJson(unsigned seed)
        : m_random(seed)
    {}

    QByteArray document() { return blank() + (chance(2) ? list(0) : object(0)) + blank(); }
    int number(int below) { return static_cast<int>(m_random() % static_cast<unsigned>(below)); }
    bool chance(int oneOf) { return number(oneOf) == 0; }

private:
    QByteArray blank()
    {
        static const char *const blanks[] = {"", "", "", "", " ", "\n", "\t", "\r\n  "};
        return blanks[number(8)];
    }

    QByteArray value(int level)
    {
        static const char *const words[] = {"null", "true", "false"};
        switch (number(level > 5 ? 6 : 8)) {
        case 0:
            return words[number(3)];
        case 1:
        case 2:
            return numberText();
        case 6:
            return list(level + 1);
        case 7:
            return object(level + 1);
        default:
            return text();
        }
    }

    QByteArray list(int level)
    {
        QByteArray items;
        for (int i = number(6); i > 0; --i)
            items += (items.isEmpty() ? "" : ",") + blank() + value(level) + blank();
        return '[' + (items.isEmpty() ? blank() : items) + ']';
    }

    QByteArray object(int level)
    {
        QByteArray members;
        for (int i = number(6); i > 0; --i)
            members += (members.isEmpty() ? "" : ",") + blank() + key() + blank() + ':' + blank() +
                       value(level) + blank();
        return '{' + (members.isEmpty() ? blank() : members) + '}';
    }

    // Some come twice.
    QByteArray key()
    {
        return chance(2) ? text() : '"' + QByteArray(1, static_cast<char>('a' + number(3))) + '"';
    }

    QByteArray text()
    {
        static const char *const parts[] = {"a",
                                            "Grain 7",
                                            " ",
                                            "\\\"",
                                            "\\\\",
                                            "\\/",
                                            "\\b",
                                            "\\f",
                                            "\\n",
                                            "\\r",
                                            "\\t",
                                            "\\u0041",
                                            "\\u00e9",
                                            "\\u05d0",
                                            "\\ud834\\udd1e",
                                            "\xC3\xA9",
                                            "\xE2\x82\xAC",
                                            "\xF0\x9D\x84\x9E",
                                            "\\u0000",
                                            "{",
                                            "]",
                                            ":"};
        QByteArray text = "\"";
        for (int i = number(8); i > 0; --i)
            text += parts[number(static_cast<int>(std::size(parts)))];
        return text + '"';
    }

    QByteArray digits(int most)
    {
        QByteArray text;
        for (int i = number(most); i >= 0; --i)
            text += static_cast<char>('0' + number(10));
        return text;
    }

    QByteArray numberText()
    {
        const bool isLong = chance(10);
        QByteArray text = chance(3) ? "-" : "";
        text += chance(4) ? QByteArray("0") : QByteArray::number(1 + number(9)) + digits(isLong ? 25 : 4);
        if (isLong || chance(2))
            text += '.' + digits(isLong ? 25 : 4);
        static const char *const exponents[] = {"e", "E", "e+", "e-"};
        if (chance(4))
            text += exponents[number(4)] + digits(2);
        return text;
    }

    std::mt19937 m_random;
};

} // namespace

class ZtJsonReaderTest : public StatReportTest
{
    Q_OBJECT
private slots:
    void readsTexts_data();
    void readsTexts();
    void textsWithoutEscapesAreNotCopied();
    void readsNumbers_data();
    void readsNumbers();
    void readsWords();
    void walks();
    void skips_data();
    void skips();
    void skipsLargePartsAtOnce();
    void comesBack();
    void lastOfEqualKeysCounts();
    void tellsLines();
    void agreesWithThePeer();
    void agreesWithThePeerOnFaults();
};

void ZtJsonReaderTest::readsTexts_data()
{
    QTest::addColumn<QByteArray>("json");
    QTest::addColumn<QString>("text");
    QTest::newRow("empty") << QByteArray(R"([""])") << "";
    QTest::newRow("plain") << QByteArray(R"(["a b"])") << "a b";
    QTest::newRow("escapes") << QByteArray(R"(["\"\\\/\b\f\n\r\t"])") << "\"\\/\b\f\n\r\t";
    QTest::newRow("escape in the middle") << QByteArray(R"(["ab\ncd\n"])") << "ab\ncd\n";
    QTest::newRow("one byte") << QByteArray(R"(["\u0041"])") << "A";
    QTest::newRow("two bytes") << QByteArray(R"(["\u00E9"])") << QString(QChar(0xE9));
    QTest::newRow("three bytes") << QByteArray(R"(["\u20ac"])") << QString(QChar(0x20AC));
    QTest::newRow("last code") << QByteArray(R"(["\uffff"])") << QString(QChar(0xFFFF));
    QTest::newRow("zero") << QByteArray(R"(["a\u0000b"])") << QStringLiteral("a") + QChar(0) + "b";
    QTest::newRow("pair") << QByteArray(R"(["\ud834\udd1E!"])") << QString::fromUtf8("\xF0\x9D\x84\x9E!");
    QTest::newRow("last pair") << QByteArray(R"(["\uDBFF\uDFFF"])") << QString::fromUtf8("\xF4\x8F\xBF\xBF");
    QTest::newRow("bytes") << QByteArray("[\"\xD7\xAA \xF0\x9D\x84\x9E\"]")
                           << QString::fromUtf8("\xD7\xAA \xF0\x9D\x84\x9E");
    QTest::newRow("escaped backslash before the end") << QByteArray(R"(["a\\"])") << "a\\";
}

void ZtJsonReaderTest::readsTexts()
{
    QFETCH(QByteArray, json);
    QFETCH(QString, text);
    const QJsonValue value = read(json);
    QCOMPARE(value.toArray().size(), 1);
    QCOMPARE(value.toArray().first().toString(), text);
    QCOMPARE(value, readByPeer(json));
}

void ZtJsonReaderTest::textsWithoutEscapesAreNotCopied()
{
    const QByteArray bytes = R"(["12.5","\n"])";
    ZtJsonReader json(view(bytes));
    QVERIFY(json.check());
    std::string buffer;
    json.enter();
    QVERIFY(json.nextItem());
    QVERIFY(json.utf8(&buffer).data() == bytes.constData() + 2);
    QVERIFY(json.nextItem());
    QVERIFY(json.utf8(&buffer).data() == buffer.data());
    QVERIFY(!json.nextItem());
}

void ZtJsonReaderTest::readsNumbers_data()
{
    QTest::addColumn<QByteArray>("json");
    QTest::addColumn<double>("number");
    QTest::newRow("0") << QByteArray("[0]") << 0.0;
    QTest::newRow("negative") << QByteArray("[-12]") << -12.0;
    QTest::newRow("fraction") << QByteArray("[0.1]") << 0.1;
    QTest::newRow("exponent") << QByteArray("[1E+05]") << 1e5;
    QTest::newRow("small exponent") << QByteArray("[125e-3]") << 0.125;
    QTest::newRow("largest") << QByteArray("[1.7976931348623157e308]") << std::numeric_limits<double>::max();
    QTest::newRow("smallest") << QByteArray("[5e-324]") << std::numeric_limits<double>::denorm_min();
    QTest::newRow("2^53 and 1") << QByteArray("[9007199254740993]") << 9007199254740992.0;
    QTest::newRow("beyond 64 bits") << QByteArray("[18446744073709551617]") << 18446744073709551616.0;
    QTest::newRow("zero to any power") << QByteArray("[0e999]") << 0.0;
}

void ZtJsonReaderTest::readsNumbers()
{
    QFETCH(QByteArray, json);
    QFETCH(double, number);
    QVERIFY(read(json).toArray().at(0).toDouble() == number);
    QVERIFY(readByPeer(json).toArray().at(0).toDouble() == number);
}

void ZtJsonReaderTest::readsWords()
{
    const QJsonArray words = read(" [ true , false , null ] ").toArray();
    QCOMPARE(words, (QJsonArray{true, false, QJsonValue()}));
}

void ZtJsonReaderTest::walks()
{
    const QByteArray bytes = "\xEF\xBB\xBF { \"a\" : [ 1 , 2 ] , \"b\" : { } , \"\\u0063\" : \"x\" } ";
    ZtJsonReader json(view(bytes));
    QVERIFY(json.check());
    QCOMPARE(json.kind(), ZtJsonReader::Object);
    std::string_view key;
    std::string buffer;
    json.enter();
    QVERIFY(json.nextMember(&key, &buffer));
    QVERIFY(key == "a");
    QCOMPARE(json.countItems(), 2);
    QVERIFY(json.nextMember(&key, &buffer));
    QVERIFY(key == "b");
    QCOMPARE(json.kind(), ZtJsonReader::Object);
    const std::size_t begin = json.position();
    json.skip();
    QVERIFY(json.bytesFrom(begin) == "{ }");
    QVERIFY(json.nextMember(&key, &buffer));
    QVERIFY(key == "c");
    QCOMPARE(json.text(), QStringLiteral("x"));
    QVERIFY(!json.nextMember(&key, &buffer));
    QCOMPARE(json.position(), static_cast<std::size_t>(bytes.size() - 1));
}

void ZtJsonReaderTest::skips_data()
{
    QTest::addColumn<QByteArray>("value");
    for (const char *value : {"null", "true", "-1.5e3", "\"\"", "\"a]}\\\"\\\\\"", "[]", "{}", "[[],[[]],{}]",
                              "{\"]\":\"}\",\"a\":[{\"\\\"\":\"[\"}]}"})
        QTest::newRow(value) << QByteArray(value);
    QTest::newRow("large") << "[" + QByteArray("\"]\",{},").repeated(2000) + "0]";
}

void ZtJsonReaderTest::skips()
{
    QFETCH(QByteArray, value);
    for (const QByteArray &between : {QByteArray(), QByteArray(" \n")}) {
        const QByteArray bytes = "[" + value + between + "," + between + value + between + ",7]";
        ZtJsonReader json(view(bytes));
        QVERIFY(json.check());
        json.enter();
        for (int i = 0; i < 2; ++i) {
            QVERIFY(json.nextItem());
            const std::size_t begin = json.position();
            json.skip();
            QVERIFY(json.bytesFrom(begin) == view(value));
        }
        QVERIFY(json.nextItem());
        QCOMPARE(json.number(), 7.0);
        QVERIFY(!json.nextItem());
    }
}

void ZtJsonReaderTest::skipsLargePartsAtOnce()
{
    // Looking through them again at each level would take minutes.
    constexpr int levels = 1000;
    const QByteArray text = '"' + QByteArray(4 * 1024 * 1024, 'a') + '"';
    const QByteArray bytes = QByteArray("{\"a\":").repeated(levels) + text + QByteArray(levels, '}');
    ZtJsonReader json(view(bytes));
    QVERIFY(json.check());
    std::string_view key;
    std::string buffer;
    QElapsedTimer clock;
    clock.start();
    for (int level = 0; level < levels; ++level) {
        const std::size_t begin = json.position();
        json.skip();
        QCOMPARE(json.position(), static_cast<std::size_t>(bytes.size() - level));
        json.seek(begin);
        json.enter();
        QVERIFY(json.nextMember(&key, &buffer));
    }
    QVERIFY2(clock.elapsed() < 1000, qPrintable(QString::number(clock.elapsed())));
}

void ZtJsonReaderTest::comesBack()
{
    const QByteArray bytes = "[[1,2],3]";
    ZtJsonReader json(view(bytes));
    QVERIFY(json.check());
    json.enter();
    QVERIFY(json.nextItem());
    const std::size_t position = json.position();
    json.skip();
    QVERIFY(json.nextItem());
    QCOMPARE(json.number(), 3.0);
    json.seek(position);
    QCOMPARE(json.countItems(), 2);
}

void ZtJsonReaderTest::lastOfEqualKeysCounts()
{
    const QByteArray bytes = R"({"a":1,"b":2,"\u0061":{"c":3},"b":4})";
    QCOMPARE(read(bytes), readByPeer(bytes));
    QCOMPARE(readByPeer(bytes).toObject().value(QStringLiteral("b")).toInt(), 4);
}

void ZtJsonReaderTest::tellsLines()
{
    const QByteArray bytes = "{\n\"a\":\r\n1,\n x}\n";
    ZtJsonReader json(view(bytes));
    QVERIFY(!json.check());
    QCOMPARE(json.error().offset, bytes.indexOf('x'));
    QCOMPARE(json.lineOf(json.error().offset), 4);
    QCOMPARE(json.lineOf(0), 1);
    QCOMPARE(json.lineOf(bytes.size()), 5);
}

void ZtJsonReaderTest::agreesWithThePeer()
{
    for (unsigned seed = 0; seed < 3000; ++seed) {
        const QByteArray bytes = RandomJson(seed).document();
        const QJsonValue expected = readByPeer(bytes);
        QVERIFY2(!expected.isUndefined(), bytes.constData());
        QVERIFY2(read(bytes) == expected, bytes.constData());
    }
}

// What it refuses the peer may accept, such as control characters in texts, but not the other way round.
void ZtJsonReaderTest::agreesWithThePeerOnFaults()
{
    static const char bytesToPut[] = "\"\\{}[],:0-.eEtn \n/u\x01\x80\xC3\xF4";
    int refused = 0;
    for (unsigned seed = 0; seed < 6000; ++seed) {
        RandomJson random(seed);
        QByteArray bytes = random.document();
        for (int i = random.number(3); i >= 0 && !bytes.isEmpty(); --i) {
            const int at = random.number(bytes.size());
            const char put = bytesToPut[random.number(static_cast<int>(sizeof(bytesToPut)) - 1)];
            switch (random.number(3)) {
            case 0:
                bytes.remove(at, 1);
                break;
            case 1:
                bytes.insert(at, put);
                break;
            default:
                bytes[at] = put;
            }
        }
        const QJsonValue found = read(bytes);
        if (found.isUndefined())
            ++refused;
        else
            QVERIFY2(found == readByPeer(bytes), bytes.constData());
    }
    QVERIFY(refused > 1000);
}

STATREPORT_TEST_MAIN(ZtJsonReaderTest)
#include "ZtJsonReaderTest.moc"
