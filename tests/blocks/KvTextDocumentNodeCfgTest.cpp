// SPDX-License-Identifier: MIT
#include "support/StatReportTest.h"

#include "blocks/textdocument/KvTextDocumentNodeCfg.h"
#include "templates/KvTemplateContext.h"

#include <QJsonArray>
#include <QJsonDocument>
#include <QJsonObject>

class KvTextDocumentNodeCfgTest : public StatReportTest
{
    Q_OBJECT

private slots:
    void isEmptyAtFirst();
    void savesItsText();
    void readsItsText();
    void requiresText_data();
    void requiresText();
    void settingTellsWhetherItChanged();
    void comesBackFromItsOwnFile_data();
    void comesBackFromItsOwnFile();
    void knowsItsContext();
};

void KvTextDocumentNodeCfgTest::isEmptyAtFirst()
{
    QCOMPARE(KvTextDocumentNodeCfg(nullptr).text(), QString());
}

void KvTextDocumentNodeCfgTest::savesItsText()
{
    KvTextDocumentNodeCfg cfg(nullptr);
    QJsonObject config;
    QVERIFY(cfg.toJson(config));
    QCOMPARE(config.keys(), QStringList{"text"});
    QVERIFY(config["text"].isString());
    QCOMPARE(config["text"].toString(), QString());
    cfg.setText(QStringLiteral("<p>${CREATION_TIME}</p>"));
    QVERIFY(cfg.toJson(config));
    QCOMPARE(config, (QJsonObject{{"text", "<p>${CREATION_TIME}</p>"}}));
}

void KvTextDocumentNodeCfgTest::readsItsText()
{
    KvTextDocumentNodeCfg cfg(nullptr);
    QVERIFY(cfg.fromJson({{"text", "<b>x</b>"}, {"other", 5}}));
    QCOMPARE(cfg.text(), QStringLiteral("<b>x</b>"));
    QVERIFY(cfg.fromJson({{"text", ""}}));
    QCOMPARE(cfg.text(), QString());
}

void KvTextDocumentNodeCfgTest::requiresText_data()
{
    QTest::addColumn<QJsonObject>("config");
    QTest::newRow("missing") << QJsonObject{};
    QTest::newRow("other case") << QJsonObject{{"Text", "x"}};
    QTest::newRow("number") << QJsonObject{{"text", 5}};
    QTest::newRow("null") << QJsonObject{{"text", QJsonValue::Null}};
    QTest::newRow("bool") << QJsonObject{{"text", true}};
    QTest::newRow("list") << QJsonObject{{"text", QJsonArray{"x"}}};
    QTest::newRow("object") << QJsonObject{{"text", QJsonObject{{"text", "x"}}}};
}

void KvTextDocumentNodeCfgTest::requiresText()
{
    QFETCH(QJsonObject, config);
    KvTextDocumentNodeCfg cfg(nullptr);
    cfg.setText(QStringLiteral("old"));
    QVERIFY(!cfg.fromJson(config));
    QCOMPARE(cfg.text(), QStringLiteral("old"));
}

void KvTextDocumentNodeCfgTest::settingTellsWhetherItChanged()
{
    KvTextDocumentNodeCfg cfg(nullptr);
    QVERIFY(!cfg.setText(QString()));
    QVERIFY(cfg.setText(QStringLiteral("a")));
    QVERIFY(!cfg.setText(QStringLiteral("a")));
    QVERIFY(cfg.setText(QStringLiteral("A")));
    QVERIFY(cfg.setText(QString()));
    QCOMPARE(cfg.text(), QString());
}

void KvTextDocumentNodeCfgTest::comesBackFromItsOwnFile_data()
{
    QTest::addColumn<QString>("text");
    QTest::newRow("quotes and markup") << QStringLiteral("<p style=\"color:red\">a &amp; \\ b</p>");
    QTest::newRow("line breaks") << QStringLiteral("a\nb\r\n\tc");
    QTest::newRow("languages") << QString::fromUtf8("µm² قياس 测量 𝔐");
    QTest::newRow("long") << QString(100000, QLatin1Char('x'));
}

void KvTextDocumentNodeCfgTest::comesBackFromItsOwnFile()
{
    QFETCH(QString, text);
    KvTextDocumentNodeCfg cfg(nullptr);
    cfg.setText(text);
    QJsonObject config;
    QVERIFY(cfg.toJson(config));
    const QByteArray file = QJsonDocument(config).toJson();
    KvTextDocumentNodeCfg again(nullptr);
    QVERIFY(again.fromJson(QJsonDocument::fromJson(file).object()));
    QCOMPARE(again.text(), text);
}

void KvTextDocumentNodeCfgTest::knowsItsContext()
{
    KvTemplateContext context(nullptr);
    QCOMPARE(KvTextDocumentNodeCfg(&context).context(), &context);
    QObject parent;
    QCOMPARE((new KvTextDocumentNodeCfg(&context, &parent))->parent(), &parent);
}

STATREPORT_TEST_MAIN(KvTextDocumentNodeCfgTest)
#include "KvTextDocumentNodeCfgTest.moc"
