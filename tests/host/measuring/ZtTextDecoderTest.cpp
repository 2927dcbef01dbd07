// SPDX-License-Identifier: MIT
#include "support/StatReportTest.h"

#include "measuring/ZtFault.h"
#include "measuring/ZtTextDecoder.h"

#include <QTextCodec>

namespace {

QByteArray utf16(const QString &text, const char *codec)
{
    QTextCodec::ConverterState withoutMark(QTextCodec::IgnoreHeader);
    return QTextCodec::codecForName(codec)->fromUnicode(text.constData(), text.size(), &withoutMark);
}

} // namespace

class ZtTextDecoderTest : public StatReportTest
{
    Q_OBJECT
private slots:
    void decodes_data();
    void decodes();
    void refuses_data();
    void refuses();
    void findsInvalidBytes_data();
    void findsInvalidBytes();
};

void ZtTextDecoderTest::decodes_data()
{
    QTest::addColumn<QByteArray>("bytes");
    QTest::addColumn<QByteArray>("utf8");
    const QString text = QStringLiteral("\u00B5m,\u05D0,\u7D30\n");
    const QByteArray utf8 = text.toUtf8();
    QTest::newRow("nothing") << QByteArray() << QByteArray();
    QTest::newRow("UTF-8") << utf8 << utf8;
    QTest::newRow("UTF-8 with a mark") << "\xEF\xBB\xBF" + utf8 << utf8;
    QTest::newRow("mark alone") << QByteArray("\xEF\xBB\xBF") << QByteArray();
    QTest::newRow("UTF-16, little endian") << "\xFF\xFE" + utf16(text, "UTF-16LE") << utf8;
    QTest::newRow("UTF-16, big endian") << "\xFE\xFF" + utf16(text, "UTF-16BE") << utf8;
    QTest::newRow("UTF-16 mark alone") << QByteArray("\xFF\xFE") << QByteArray();
    QTest::newRow("surrogate pair") << QByteArray("\xFF\xFE\x3D\xD8\x00\xDE", 6)
                                    << QByteArray("\xF0\x9F\x98\x80");
}

void ZtTextDecoderTest::decodes()
{
    QFETCH(QByteArray, bytes);
    QByteArray utf8;
    ZtFault fault;
    QVERIFY2(ZtTextDecoder::toUtf8(bytes, &utf8, &fault), qPrintable(fault.text()));
    QTEST(utf8, "utf8");
}

void ZtTextDecoderTest::refuses_data()
{
    QTest::addColumn<QByteArray>("bytes");
    QTest::addColumn<int>("line");
    QTest::addColumn<QString>("message");
    const QString notUtf8 = QStringLiteral("The text is not valid UTF-8");
    const QString notUtf16 = QStringLiteral("The file is not valid UTF-16 text");
    const QString nul = QStringLiteral("The file is not a text file: it holds a NUL character");
    QTest::newRow("Latin-1") << QByteArray("a\nb\r\nc\rL\xE4nge\n") << 4 << notUtf8;
    QTest::newRow("cut off") << QByteArray("a\n\xC2") << 2 << notUtf8;
    QTest::newRow("NUL") << QByteArray("a\nb\0c", 5) << 2 << nul;
    QTest::newRow("UTF-16 without a mark") << utf16(QStringLiteral("ab"), "UTF-16LE") << 1 << nul;
    QTest::newRow("UTF-16, half a character") << QByteArray("\xFF\xFE\x41\x00\x42", 5) << 0 << notUtf16;
    QTest::newRow("UTF-16, half a pair") << QByteArray("\xFF\xFE\x3D\xD8\x41\x00", 6) << 0 << notUtf16;
    QTest::newRow("UTF-32") << QByteArray("\xFF\xFE\0\0a\0\0\0", 8) << 1 << nul;
}

void ZtTextDecoderTest::refuses()
{
    QFETCH(QByteArray, bytes);
    QByteArray utf8;
    ZtFault fault;
    QVERIFY(!ZtTextDecoder::toUtf8(bytes, &utf8, &fault));
    QTEST(fault.line, "line");
    QTEST(fault.message, "message");
}

void ZtTextDecoderTest::findsInvalidBytes_data()
{
    QTest::addColumn<QByteArray>("bytes");
    QTest::addColumn<int>("position");
    QTest::newRow("none") << QByteArray("a\xC3\xA4\xE2\x82\xAC\xF0\x9F\x98\x80") << -1;
    QTest::newRow("continuation alone") << QByteArray("ab\x80") << 2;
    QTest::newRow("overlong, two bytes") << QByteArray("a\xC0\xAF") << 1;
    QTest::newRow("overlong, three bytes") << QByteArray("\xE0\x80\xAF") << 0;
    QTest::newRow("overlong, four bytes") << QByteArray("\xF0\x80\x80\xAF") << 0;
    QTest::newRow("surrogate") << QByteArray("\xED\xA0\x80") << 0;
    QTest::newRow("beyond Unicode") << QByteArray("\xF4\x90\x80\x80") << 0;
    QTest::newRow("impossible lead") << QByteArray("\xFF") << 0;
    QTest::newRow("cut off") << QByteArray("a\xE2\x82") << 1;
    QTest::newRow("third byte wrong") << QByteArray("\xE2\x82"
                                                    "a")
                                      << 0;
}

void ZtTextDecoderTest::findsInvalidBytes()
{
    QFETCH(QByteArray, bytes);
    QTEST(ZtTextDecoder::firstInvalidByte(bytes), "position");
}

STATREPORT_TEST_MAIN(ZtTextDecoderTest)
#include "ZtTextDecoderTest.moc"
