// SPDX-License-Identifier: MIT
#include "templates/KvPageSectionsCfg.h"
#include "support/StatReportTest.h"
#include "templates/KvTemplateContext.h"

#include <QJsonObject>

class KvPageSectionsCfgTest : public StatReportTest
{
    Q_OBJECT

private slots:
    void startsDisabledAndEmpty();
    void tellsWhetherTheStateChanged();
    void writesTextAndState();
    void reads_data();
    void reads();
    void roundTrip_data();
    void roundTrip();
};

void KvPageSectionsCfgTest::startsDisabledAndEmpty()
{
    KvTemplateContext context(nullptr);
    const KvPageSectionsCfg section(&context);
    QVERIFY(section.inherits("KvTextDocumentNodeCfg"));
    QVERIFY(section.inherits("KvBaseEditorNodeCfg"));
    QCOMPARE(section.context(), &context);
    QCOMPARE(section.isEnabled(), false);
    QCOMPARE(section.text(), QString());
}

void KvPageSectionsCfgTest::tellsWhetherTheStateChanged()
{
    KvPageSectionsCfg section(nullptr);
    QCOMPARE(section.setEnabled(false), false);
    QCOMPARE(section.setEnabled(true), true);
    QCOMPARE(section.isEnabled(), true);
    QCOMPARE(section.setEnabled(true), false);
    QCOMPARE(section.setEnabled(false), true);
    QCOMPARE(section.isEnabled(), false);
}

void KvPageSectionsCfgTest::writesTextAndState()
{
    KvPageSectionsCfg section(nullptr);
    QJsonObject written;
    QVERIFY(section.toJson(written));
    QCOMPARE(written, QJsonObject({{QStringLiteral("text"), QString()}, {QStringLiteral("enabled"), false}}));
    section.setEnabled(true);
    section.setText(QStringLiteral("<b>Title</b>"));
    QVERIFY(section.toJson(written));
    QCOMPARE(written, QJsonObject({{QStringLiteral("text"), QStringLiteral("<b>Title</b>")},
                                   {QStringLiteral("enabled"), true}}));
}

void KvPageSectionsCfgTest::reads_data()
{
    QTest::addColumn<QJsonObject>("config");
    QTest::addColumn<bool>("enabled");
    QTest::addColumn<QString>("text");

    const QString enabled = QStringLiteral("enabled");
    const QString text = QStringLiteral("text");
    const QJsonValue isNull(QJsonValue::Null);
    const QString old = QStringLiteral("old");
    const QString fresh = QStringLiteral("new");

    QTest::newRow("on") << QJsonObject{{enabled, true}, {text, fresh}} << true << fresh;
    QTest::newRow("off") << QJsonObject{{enabled, false}, {text, fresh}} << false << fresh;
    QTest::newRow("on, empty text") << QJsonObject{{enabled, true}, {text, QString()}} << true << QString();
    QTest::newRow("on without a text") << QJsonObject{{enabled, true}} << false << old;
    QTest::newRow("on, the text a number") << QJsonObject{{enabled, true}, {text, 5}} << false << old;
    QTest::newRow("on, the text null") << QJsonObject{{enabled, true}, {text, isNull}} << false << old;
    QTest::newRow("1 is not true") << QJsonObject{{enabled, 1}, {text, fresh}} << false << fresh;
    QTest::newRow("\"true\" is not true")
        << QJsonObject{{enabled, QStringLiteral("true")}, {text, fresh}} << false << fresh;
    QTest::newRow("null is not true") << QJsonObject{{enabled, isNull}, {text, fresh}} << false << fresh;
    QTest::newRow("no state") << QJsonObject{{text, fresh}} << false << fresh;
    QTest::newRow("nothing") << QJsonObject() << false << old;
    QTest::newRow("other case") << QJsonObject{{QStringLiteral("Enabled"), true}, {text, fresh}} << false
                                << fresh;
}

void KvPageSectionsCfgTest::reads()
{
    QFETCH(QJsonObject, config);
    KvPageSectionsCfg section(nullptr);
    section.setText(QStringLiteral("old"));
    section.setEnabled(true);
    QVERIFY(section.fromJson(config));
    QTEST(section.isEnabled(), "enabled");
    QTEST(section.text(), "text");
}

void KvPageSectionsCfgTest::roundTrip_data()
{
    QTest::addColumn<bool>("enabled");
    QTest::addColumn<QString>("text");
    QTest::newRow("empty") << false << QString();
    QTest::newRow("html") << true
                          << QStringLiteral("<p style=\"color:red\">${CREATION_TIME} \"quoted\" \\ \n</p>");
    QTest::newRow("letters of all the world") << true << QStringLiteral("Größe 大きさ حجم 😀");
}

void KvPageSectionsCfgTest::roundTrip()
{
    QFETCH(bool, enabled);
    QFETCH(QString, text);
    KvPageSectionsCfg written(nullptr);
    written.setEnabled(enabled);
    written.setText(text);
    QJsonObject config;
    QVERIFY(written.toJson(config));

    KvPageSectionsCfg read(nullptr);
    QVERIFY(read.fromJson(config));
    QCOMPARE(read.isEnabled(), enabled);
    QCOMPARE(read.text(), text);
}

STATREPORT_TEST_MAIN(KvPageSectionsCfgTest)
#include "KvPageSectionsCfgTest.moc"
