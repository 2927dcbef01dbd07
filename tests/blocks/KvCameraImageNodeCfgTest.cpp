// SPDX-License-Identifier: MIT
#include "support/StatReportTest.h"

#include "blocks/cameraimage/KvCameraImageNodeCfg.h"
#include "templates/KvTemplateContext.h"

#include <QJsonArray>
#include <QJsonObject>

using Cfg = KvCameraImageNodeCfg;

class KvCameraImageNodeCfgTest : public StatReportTest
{
    Q_OBJECT

private slots:
    void newBlocksAreWritten();
    void everyKeyIsWritten();
    void surviveAFile_data();
    void surviveAFile();
    void everyWidthSurvives();
    void aMissingKeyChangesNothing_data();
    void aMissingKeyChangesNothing();
    void readsEachKey_data();
    void readsEachKey();
    void comparesAllMembers();
};

void KvCameraImageNodeCfgTest::newBlocksAreWritten()
{
    KvTemplateContext context(nullptr);
    const Cfg cfg(&context);
    QCOMPARE(cfg.context(), &context);
    QJsonObject config;
    QVERIFY(cfg.toJson(config));
    QCOMPARE(config, QJsonObject({{"alignment", "132"},
                                  {"widthPercent", "75"},
                                  {"renderMeasurements", false},
                                  {"rotationAngles", "0"}}));
}

void KvCameraImageNodeCfgTest::everyKeyIsWritten()
{
    Cfg cfg(nullptr);
    cfg.setOptions({{Qt::AlignLeft, 33, 270}, true});
    QJsonObject config{{"other", 1}};
    QVERIFY(cfg.toJson(config));
    QCOMPARE(config, QJsonObject({{"other", 1},
                                  {"alignment", "1"},
                                  {"widthPercent", "33"},
                                  {"renderMeasurements", true},
                                  {"rotationAngles", "270"}}));
}

void KvCameraImageNodeCfgTest::surviveAFile_data()
{
    QTest::addColumn<int>("alignment");
    QTest::addColumn<int>("rotation");
    QTest::addColumn<bool>("render");
    QTest::newRow("left") << 1 << 0 << true;
    QTest::newRow("centre") << 132 << 90 << false;
    QTest::newRow("right") << 2 << 180 << true;
    QTest::newRow("three quarters") << 2 << 270 << false;
}

void KvCameraImageNodeCfgTest::surviveAFile()
{
    QFETCH(int, alignment);
    QFETCH(int, rotation);
    QFETCH(bool, render);
    Cfg cfg(nullptr);
    cfg.setOptions({{Qt::Alignment(alignment), 20, rotation}, render});
    QJsonObject config;
    QVERIFY(cfg.toJson(config));
    Cfg read(nullptr);
    QVERIFY(read.fromJson(config));
    QVERIFY(read.options() == cfg.options());
}

void KvCameraImageNodeCfgTest::everyWidthSurvives()
{
    for (int percent = 1; percent <= 100; ++percent) {
        Cfg cfg(nullptr);
        cfg.setOptions({{Qt::AlignLeft, percent, 0}, false});
        QJsonObject config;
        QVERIFY(cfg.toJson(config));
        Cfg read(nullptr);
        QVERIFY(read.fromJson(config));
        QCOMPARE(read.options().placement.widthPercent, percent);
    }
}

void KvCameraImageNodeCfgTest::aMissingKeyChangesNothing_data()
{
    QTest::addColumn<QString>("key");
    for (const char *key : {"alignment", "widthPercent", "renderMeasurements"})
        QTest::newRow(key) << QString::fromLatin1(key);
}

void KvCameraImageNodeCfgTest::aMissingKeyChangesNothing()
{
    QFETCH(QString, key);
    Cfg cfg(nullptr);
    const Cfg::Options before{{Qt::AlignRight, 40, 180}, true};
    cfg.setOptions(before);
    QJsonObject config{
        {"alignment", "1"}, {"widthPercent", "50"}, {"renderMeasurements", false}, {"rotationAngles", "90"}};
    config.remove(key);
    QVERIFY(!cfg.fromJson(config));
    QVERIFY(cfg.options() == before);
}

void KvCameraImageNodeCfgTest::readsEachKey_data()
{
    QTest::addColumn<QJsonObject>("config");
    QTest::addColumn<bool>("isRead");
    QTest::addColumn<int>("alignment");
    QTest::addColumn<int>("width");
    QTest::addColumn<bool>("render");
    QTest::addColumn<int>("rotation");
    // Before, they are at 2, 40, true and 180.
    const auto add = [](const char *name, const QJsonValue &alignment, const QJsonValue &width,
                        const QJsonValue &render, const QJsonValue &rotation) -> QTestData & {
        return QTest::newRow(name) << QJsonObject{{"alignment", alignment},
                                                  {"widthPercent", width},
                                                  {"renderMeasurements", render},
                                                  {"rotationAngles", rotation}};
    };
    const QJsonValue absent(QJsonValue::Undefined);
    add("all", "1", "50", false, "90") << true << 1 << 50 << false << 90;
    add("no rotation", "1", "50", false, absent) << true << 1 << 50 << false << 0;
    add("rotation is a word", "1", "50", false, "x") << true << 1 << 50 << false << 0;
    add("rotation is a number", "1", "50", false, 90) << true << 1 << 50 << false << 0;
    add("alignment is a number", 1, "50", false, "90") << true << 2 << 50 << false << 90;
    add("width is a number", "1", 50, false, "90") << true << 1 << 40 << false << 90;
    add("switch is a text", "1", "50", "false", "90") << true << 1 << 50 << true << 90;
    add("switch is a number", "1", "50", 0, "90") << true << 1 << 50 << true << 90;
    add("switch is null", "1", "50", QJsonValue::Null, "90") << true << 1 << 50 << true << 90;
    add("alignment is a word", "left", "50", false, "90") << false << 0 << 40 << true << 180;
    add("width is a word", "1", "wide", false, "90") << false << 1 << 0 << true << 180;
}

void KvCameraImageNodeCfgTest::readsEachKey()
{
    QFETCH(QJsonObject, config);
    Cfg cfg(nullptr);
    cfg.setOptions({{Qt::AlignRight, 40, 180}, true});
    QTEST(cfg.fromJson(config), "isRead");
    QTEST(int(cfg.options().placement.alignment), "alignment");
    QTEST(cfg.options().placement.widthPercent, "width");
    QTEST(cfg.options().renderMeasurements, "render");
    QTEST(cfg.options().placement.rotation, "rotation");
}

void KvCameraImageNodeCfgTest::comparesAllMembers()
{
    const Cfg::Options options{{Qt::AlignLeft, 50, 90}, true};
    QVERIFY(options == (Cfg::Options{{Qt::AlignLeft, 50, 90}, true}));
    QVERIFY(!(options == (Cfg::Options{{Qt::AlignLeft, 50, 90}, false})));
    QVERIFY(!(options == (Cfg::Options{{Qt::AlignLeft, 51, 90}, true})));
}

STATREPORT_TEST_MAIN(KvCameraImageNodeCfgTest)
#include "KvCameraImageNodeCfgTest.moc"
