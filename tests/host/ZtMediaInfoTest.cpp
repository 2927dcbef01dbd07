// SPDX-License-Identifier: MIT
#include "support/StatReportTest.h"

#include "kernel/ZtMediaInfo.h"

class ZtMediaInfoTest : public StatReportTest
{
    Q_OBJECT

private slots:
    void suffixes_data();
    void suffixes();
    void formatsOnlyHaveATypeAsTheyAreFound_data();
    void formatsOnlyHaveATypeAsTheyAreFound();
    void listsWhatItKnows();
};

void ZtMediaInfoTest::suffixes_data()
{
    QTest::addColumn<QString>("suffix");
    QTest::addColumn<QString>("format");
    QTest::addColumn<int>("type");
    const auto row = [](const char *suffix, const char *format, int type) {
        QTest::newRow(suffix) << QString::fromLatin1(suffix) << QString::fromLatin1(format) << type;
    };
    row("png", "png", 0);
    row("PNG", "png", 0);
    row("jpg", "jpeg", 0);
    row("JpEg", "jpeg", 0);
    row("tif", "tiff", 0);
    row("TIFF", "tiff", 0);
    row("bmp", "bmp", 0);
    row("gif", "gif", 0);
    row("avi", "avi", 1);
    row("MP4", "mp4", 1);
    row("mov", "mov", 1);
    row("mkv", "mkv", 1);
    row("wmv", "wmv", 1);
    row("", "", -1);
    row("txt", "", -1);
    row(".png", "", -1);
    row("pngx", "", -1);
    row("pdf", "", -1);
}

void ZtMediaInfoTest::suffixes()
{
    QFETCH(QString, suffix);
    QFETCH(int, type);
    const QString found = ZtMediaInfo::findMediaFileFormat(suffix);
    QTEST(found, "format");
    QCOMPARE(ZtMediaInfo::findMediaType(found), type);
}

void ZtMediaInfoTest::formatsOnlyHaveATypeAsTheyAreFound_data()
{
    QTest::addColumn<QString>("format");
    QTest::newRow("a suffix is no format") << QStringLiteral("jpg");
    QTest::newRow("letter case") << QStringLiteral("PNG");
    QTest::newRow("empty") << QString();
}

void ZtMediaInfoTest::formatsOnlyHaveATypeAsTheyAreFound()
{
    QFETCH(QString, format);
    QCOMPARE(ZtMediaInfo::findMediaType(format), int(ZtMediaInfo::UnknownMedia));
}

void ZtMediaInfoTest::listsWhatItKnows()
{
    for (const ZtMediaInfo::MediaType type : {ZtMediaInfo::Image, ZtMediaInfo::Video}) {
        const QStringList suffixes = ZtMediaInfo::suffixes(type);
        QVERIFY(!suffixes.isEmpty());
        for (const QString &suffix : suffixes)
            QCOMPARE(ZtMediaInfo::findMediaType(ZtMediaInfo::findMediaFileFormat(suffix)), int(type));
    }
    QCOMPARE(ZtMediaInfo::suffixes(ZtMediaInfo::UnknownMedia), QStringList());
}

STATREPORT_TEST_MAIN(ZtMediaInfoTest)
#include "ZtMediaInfoTest.moc"
