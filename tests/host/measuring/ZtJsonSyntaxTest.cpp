// SPDX-License-Identifier: MIT
#include "measuring/ZtJsonSyntax.h"

#include "measuring/ZtProgress.h"
#include "support/StatReportTest.h"

#include <QJsonDocument>

namespace {

std::string_view view(const QByteArray &bytes)
{
    return std::string_view(bytes.constData(), static_cast<std::size_t>(bytes.size()));
}

QJsonParseError errorOf(const QByteArray &bytes)
{
    ZtJsonSyntax syntax(view(bytes));
    syntax.check();
    return syntax.error();
}

QByteArray nested(int levels)
{
    return QByteArray(levels, '[') + QByteArray(levels, ']');
}

} // namespace

class ZtJsonSyntaxTest : public StatReportTest
{
    Q_OBJECT
private slots:
    void accepts_data();
    void accepts();
    void refuses_data();
    void refuses();
    void refusesEveryBeginning();
    void refusesNulBytes();
    void limitsNesting();
    void remembersLargeParts();
    void tellsProgress();
    void endsWhenCancelled();
};

void ZtJsonSyntaxTest::accepts_data()
{
    QTest::addColumn<QByteArray>("bytes");
    QTest::newRow("list") << QByteArray("[]");
    QTest::newRow("object") << QByteArray("{}");
    QTest::newRow("blanks") << QByteArray(" \t\r\n{ \"a\" :\n[ 1 ,\t2 ] } \n");
    QTest::newRow("byte order mark") << QByteArray("\xEF\xBB\xBF[]");
    QTest::newRow("words") << QByteArray("[true,false,null]");
    QTest::newRow("escapes") << QByteArray(R"(["\"\\\/\b\f\n\r\t\u0000\u00fF\uD834\uDD1E"])");
    QTest::newRow("characters") << QByteArray(
        "[\"\x7F \xC2\x80 \xDF\xBF \xE0\xA0\x80 \xED\x9F\xBF "
        "\xEE\x80\x80 \xEF\xBF\xBF \xF0\x90\x80\x80 \xF4\x8F\xBF\xBF\"]");
    QTest::newRow("numbers") << QByteArray(
        "[0,-0,1,-12.5,1e5,1E+05,1e-5,0.0e999,1.7976931348623157e308,5e-324]");
    QTest::newRow("long number") << "[0." + QByteArray(5000, '1') + "]";
    QTest::newRow("key twice") << QByteArray(R"({"a":1,"a":2,"":3})");
}

void ZtJsonSyntaxTest::accepts()
{
    QFETCH(QByteArray, bytes);
    const QJsonParseError error = errorOf(bytes);
    QVERIFY2(error.error == QJsonParseError::NoError,
             qPrintable(QStringLiteral("%1 at %2").arg(error.errorString()).arg(error.offset)));
    QJsonParseError peer;
    QJsonDocument::fromJson(bytes, &peer);
    QCOMPARE(peer.error, QJsonParseError::NoError);
}

void ZtJsonSyntaxTest::refuses_data()
{
    QTest::addColumn<QByteArray>("bytes");
    QTest::addColumn<int>("error");
    QTest::addColumn<int>("offset");
    const auto add = [](const char *name, const QByteArray &bytes, QJsonParseError::ParseError error,
                        int offset) { QTest::newRow(name) << bytes << static_cast<int>(error) << offset; };
    add("nothing", "", QJsonParseError::IllegalValue, 0);
    add("blank", " \n", QJsonParseError::IllegalValue, 2);
    add("number alone", "1", QJsonParseError::IllegalValue, 0);
    add("text alone", "\"a\"", QJsonParseError::IllegalValue, 0);
    add("two marks", "\xEF\xBB\xBF\xEF\xBB\xBF[]", QJsonParseError::IllegalValue, 3);
    add("another encoding", QByteArray("[\0]\0", 4), QJsonParseError::IllegalNumber, 1);
    add("garbage", "[] x", QJsonParseError::GarbageAtEnd, 3);
    add("two documents", "{}{}", QJsonParseError::GarbageAtEnd, 2);
    add("no end", "[", QJsonParseError::UnterminatedArray, 1);
    add("no end after an item", "[1 ", QJsonParseError::UnterminatedArray, 3);
    add("no end after a comma", "[1, ", QJsonParseError::UnterminatedArray, 4);
    add("wrong end", "[1}", QJsonParseError::MissingValueSeparator, 2);
    add("no comma", "[1 2]", QJsonParseError::MissingValueSeparator, 3);
    add("comma at the end", "[1,]", QJsonParseError::MissingObject, 3);
    add("comma first", "[,1]", QJsonParseError::IllegalValue, 1);
    add("object without an end", "{", QJsonParseError::UnterminatedObject, 1);
    add("member without an end", "{\"a\":1", QJsonParseError::TerminationByNumber, 6);
    add("key without quotes", "{a:1}", QJsonParseError::UnterminatedObject, 1);
    add("no colon", "{\"a\" 1}", QJsonParseError::MissingNameSeparator, 5);
    add("no value", "{\"a\":}", QJsonParseError::MissingObject, 5);
    add("comma for a value", "{\"a\":,}", QJsonParseError::IllegalValue, 5);
    add("comma after members", "{\"a\":1,}", QJsonParseError::MissingObject, 7);
    add("no quote", "[\"a]", QJsonParseError::UnterminatedString, 4);
    add("line break in a text", "[\"a\nb\"]", QJsonParseError::UnterminatedString, 3);
    add("control character", "[\"\x01\"]", QJsonParseError::UnterminatedString, 2);
    add("unknown escape", R"(["\x"])", QJsonParseError::IllegalEscapeSequence, 3);
    add("escape without an end", "[\"\\", QJsonParseError::IllegalEscapeSequence, 3);
    add("short code", R"(["\u12"])", QJsonParseError::IllegalEscapeSequence, 6);
    add("code of no digits", R"(["\u12G4"])", QJsonParseError::IllegalEscapeSequence, 6);
    add("high surrogate alone", R"(["\uD834"])", QJsonParseError::IllegalEscapeSequence, 8);
    add("high surrogate and another", R"(["\uD834\n"])", QJsonParseError::IllegalEscapeSequence, 8);
    add("high surrogate twice", R"(["\uD834\uD834"])", QJsonParseError::IllegalEscapeSequence, 14);
    add("low surrogate", R"(["\uDD1E"])", QJsonParseError::IllegalEscapeSequence, 8);
    add("byte that follows nothing", "[\"\x80\"]", QJsonParseError::IllegalUTF8String, 2);
    add("byte that is never used", "[\"\xFF\"]", QJsonParseError::IllegalUTF8String, 2);
    add("cut character", "[\"\xE2\x82\"]", QJsonParseError::IllegalUTF8String, 2);
    add("cut at the end", "[\"\xE2\x82", QJsonParseError::IllegalUTF8String, 2);
    add("longer than needed", "[\"\xC0\xAF\"]", QJsonParseError::IllegalUTF8String, 2);
    add("longer than needed, 3", "[\"\xE0\x80\xAF\"]", QJsonParseError::IllegalUTF8String, 2);
    add("longer than needed, 4", "[\"\xF0\x8F\xBF\xBF\"]", QJsonParseError::IllegalUTF8String, 2);
    add("surrogate in bytes", "[\"\xED\xA0\x80\"]", QJsonParseError::IllegalUTF8String, 2);
    add("beyond Unicode", "[\"\xF4\x90\x80\x80\"]", QJsonParseError::IllegalUTF8String, 2);
    add("too large", "[1e400]", QJsonParseError::IllegalNumber, 6);
    add("too large, negative", "[-1e309]", QJsonParseError::IllegalNumber, 7);
    add("too small", "[1e-400]", QJsonParseError::IllegalNumber, 7);
    add("too large without an exponent", "[1" + QByteArray(400, '0') + "]", QJsonParseError::IllegalNumber,
        402);
    add("zero before", "[01]", QJsonParseError::MissingValueSeparator, 2);
    add("plus", "[+1]", QJsonParseError::IllegalNumber, 1);
    add("sign alone", "[-]", QJsonParseError::IllegalNumber, 2);
    add("point first", "[.5]", QJsonParseError::IllegalNumber, 1);
    add("point last", "[5.]", QJsonParseError::IllegalNumber, 3);
    add("exponent without digits", "[5e]", QJsonParseError::IllegalNumber, 3);
    add("exponent of a sign", "[5e+]", QJsonParseError::IllegalNumber, 4);
    add("hexadecimal", "[0x10]", QJsonParseError::MissingValueSeparator, 2);
    add("not a number", "[NaN]", QJsonParseError::IllegalNumber, 1);
    add("upper case", "[True]", QJsonParseError::IllegalNumber, 1);
    add("cut word", "[nul]", QJsonParseError::IllegalValue, 1);
    add("longer word", "[nulls]", QJsonParseError::MissingValueSeparator, 5);
    add("comment", "[/**/]", QJsonParseError::IllegalNumber, 1);
    add("nested", nested(ZtJsonSyntax::mostLevels + 1), QJsonParseError::DeepNesting,
        ZtJsonSyntax::mostLevels);
}

void ZtJsonSyntaxTest::refuses()
{
    QFETCH(QByteArray, bytes);
    QFETCH(int, error);
    QFETCH(int, offset);
    const QJsonParseError found = errorOf(bytes);
    QCOMPARE(static_cast<int>(found.error), error);
    QCOMPARE(found.offset, offset);
    QVERIFY(!found.errorString().isEmpty());
}

void ZtJsonSyntaxTest::refusesEveryBeginning()
{
    const QByteArray whole =
        "\xEF\xBB\xBF{\"a\":[1,-2.5e-3,\"\\u00e9\\n\xC3\xA9\",true,false,null,{}],\"b\":{\"c\":[]}}";
    QCOMPARE(errorOf(whole).error, QJsonParseError::NoError);
    for (int size = 0; size < whole.size(); ++size) {
        const QJsonParseError error = errorOf(whole.left(size));
        QVERIFY2(error.error != QJsonParseError::NoError, qPrintable(QString::number(size)));
        QVERIFY(error.offset >= 0 && error.offset <= size);
    }
}

void ZtJsonSyntaxTest::refusesNulBytes()
{
    for (const QByteArray &whole : {QByteArray("[1,\"a\\n\",true]"), QByteArray("{\"a\":1.5e3}")}) {
        for (int at = 0; at <= whole.size(); ++at) {
            QByteArray bytes = whole;
            bytes.insert(at, '\0');
            QVERIFY2(errorOf(bytes).error != QJsonParseError::NoError, qPrintable(QString::number(at)));
        }
    }
}

void ZtJsonSyntaxTest::limitsNesting()
{
    QCOMPARE(errorOf(nested(ZtJsonSyntax::mostLevels)).error, QJsonParseError::NoError);
    const QByteArray objects = QByteArray("{\"a\":").repeated(ZtJsonSyntax::mostLevels) + "1" +
                               QByteArray(ZtJsonSyntax::mostLevels, '}');
    QCOMPARE(errorOf(objects).error, QJsonParseError::NoError);
    QCOMPARE(errorOf("[" + objects + "]").error, QJsonParseError::DeepNesting);
    QCOMPARE(errorOf(QByteArray(10000000, '[')).error, QJsonParseError::DeepNesting);
}

void ZtJsonSyntaxTest::remembersLargeParts()
{
    const QByteArray large = "[" + QByteArray(static_cast<int>(ZtJsonSyntax::largeSize), ' ') + "]";
    const QByteArray bytes = "{\"small\":[1],\"large\":" + large + "}";
    ZtJsonSyntax syntax(view(bytes));
    QVERIFY(syntax.check());
    const std::vector<ZtJsonSyntax::Part> parts = syntax.takeLargeParts();
    QCOMPARE(parts.size(), std::size_t(2));
    QCOMPARE(parts[0].begin, std::size_t(0));
    QCOMPARE(parts[0].end, static_cast<std::size_t>(bytes.size()));
    QCOMPARE(parts[1].begin, static_cast<std::size_t>(bytes.indexOf(large)));
    QCOMPARE(parts[1].end, static_cast<std::size_t>(bytes.size() - 1));
}

void ZtJsonSyntaxTest::tellsProgress()
{
    const QByteArray bytes = "[" + QByteArray("1,").repeated(200000) + "1]";
    ZtProgress progress;
    ZtJsonSyntax syntax(view(bytes), &progress);
    QVERIFY(syntax.check());
    QVERIFY(progress.fraction() > 0.8);
}

void ZtJsonSyntaxTest::endsWhenCancelled()
{
    const QByteArray bytes = "[" + QByteArray("{\"a\":1},").repeated(100000) + "]]";
    ZtProgress progress;
    progress.cancel();
    ZtJsonSyntax syntax(view(bytes), &progress);
    QVERIFY(!syntax.check());
    // It did not get to the fault.
    QCOMPARE(syntax.error().error, QJsonParseError::NoError);
}

STATREPORT_TEST_MAIN(ZtJsonSyntaxTest)
#include "ZtJsonSyntaxTest.moc"
