// SPDX-License-Identifier: MIT
#include "KvDeskFileKind.h"

#include "DeskFiles.h"

class KvDeskFileKindTest : public StatReportTest
{
    Q_OBJECT

private slots:
    void kinds_data();
    void kinds();
    void known_data();
    void known();
    void patterns();
};

void KvDeskFileKindTest::kinds_data()
{
    QTest::addColumn<QString>("path");
    QTest::addColumn<int>("kind");
    const auto row = [](const char *name, const QString &path, KvDeskFileKind::Kind kind) {
        QTest::newRow(name) << path << static_cast<int>(kind);
    };
    row("session", QStringLiteral("/none/a.json"), KvDeskFileKind::Session);
    row("session in capitals", QStringLiteral("/none/a.JSON"), KvDeskFileKind::Session);
    row("picture", QStringLiteral("/none/a.png"), KvDeskFileKind::Image);
    row("picture in capitals", QStringLiteral("/none/a.JPG"), KvDeskFileKind::Image);
    row("table", QStringLiteral("/none/a.csv"), KvDeskFileKind::Table);
    row("results table", QStringLiteral("/none/a.xls"), KvDeskFileKind::Table);
    row("nothing known", QStringLiteral("/none/a"), KvDeskFileKind::Table);
    const QString png = DeskFiles::image(QStringLiteral("p.png"));
    row("picture without a suffix", DeskFiles::text(QStringLiteral("picture"), DeskFiles::bytes(png)),
        KvDeskFileKind::Image);
    row("session without a suffix", DeskFiles::text(QStringLiteral("session"), " \n{}"),
        KvDeskFileKind::Session);
    row("table without a suffix", DeskFiles::text(QStringLiteral("data"), "a,b\n"), KvDeskFileKind::Table);
    const auto json = [&row](const char *name, const QByteArray &bytes, KvDeskFileKind::Kind kind) {
        row(name, DeskFiles::text(QString::fromLatin1(name) + QStringLiteral(".json"), bytes), kind);
        const QByteArray bare = QByteArray(name) + " without a suffix";
        row(bare.constData(), DeskFiles::text(QString::fromLatin1(bare), bytes), kind);
    };
    json("exported values", "\xEF\xBB\xBF {\n \"format\": \"statreport-values\",\"objects\":[]}",
         KvDeskFileKind::Table);
    json("records", "\n [{\"a\":1}]", KvDeskFileKind::Table);
    json("empty list", "[ ]", KvDeskFileKind::Session);
    json("saved session", DeskFiles::bytes(DeskFiles::demoSession()), KvDeskFileKind::Session);
    json("session of a name", R"({"format":"statreport-session","name":"statreport-values"})",
         KvDeskFileKind::Session);
}

void KvDeskFileKindTest::kinds()
{
    QFETCH(QString, path);
    QFETCH(int, kind);
    QCOMPARE(static_cast<int>(KvDeskFileKind::of(path)), kind);
}

void KvDeskFileKindTest::known_data()
{
    QTest::addColumn<QString>("path");
    QTest::addColumn<bool>("isKnown");
    QTest::newRow("none") << QStringLiteral("/none/a.json") << false;
    QTest::newRow("folder") << QDir::tempPath() << false;
    QTest::newRow("session") << DeskFiles::demoSession() << true;
    QTest::newRow("image") << DeskFiles::image(QStringLiteral("known.png")) << true;
    QTest::newRow("table") << DeskFiles::table(QStringLiteral("known.csv")) << true;
    QTest::newRow("records") << DeskFiles::text(QStringLiteral("known.json"), "[{\"a\":1}]") << true;
    QTest::newRow("broken image") << DeskFiles::text(QStringLiteral("broken.png"), "") << true;
    QTest::newRow("text") << DeskFiles::text(QStringLiteral("values"), "a;b\r\n1\t2\n") << true;
    QTest::newRow("accents") << DeskFiles::text(QStringLiteral("values.dat"), "L\xC3\xA4nge\n1\n") << true;
    QTest::newRow("UTF-16") << DeskFiles::text(QStringLiteral("values.16"), QByteArray("\xFF\xFE"
                                                                                       "a\0",
                                                                                       4))
                            << true;
    QTest::newRow("document") << DeskFiles::text(QStringLiteral("a.pdf"), QByteArray("%PDF\n\0\1\2", 8))
                              << false;
    QTest::newRow("program") << QStringLiteral("/proc/self/exe") << false;
    QTest::newRow("empty") << DeskFiles::text(QStringLiteral("empty"), "") << false;
}

void KvDeskFileKindTest::known()
{
    QFETCH(QString, path);
    QFETCH(bool, isKnown);
    QCOMPARE(KvDeskFileKind::isKnown(path), isKnown);
}

void KvDeskFileKindTest::patterns()
{
    QVERIFY(KvDeskFileKind::imagePatterns().contains(QStringLiteral("*.png")));
    QVERIFY(KvDeskFileKind::imagePatterns().contains(QStringLiteral("*.jpg")));
    QVERIFY(KvDeskFileKind::tablePatterns().contains(QStringLiteral("*.csv")));
    QVERIFY(KvDeskFileKind::tablePatterns().contains(QStringLiteral("*.json")));
}

STATREPORT_TEST_MAIN(KvDeskFileKindTest)
#include "KvDeskFileKindTest.moc"
