// SPDX-License-Identifier: MIT
#include "templates/KvTemplateContext.h"
#include "blocks/MetaMethods.h"
#include "data/KvReportKernelData.h"
#include "support/StatReportTest.h"

#include <QJsonArray>
#include <QJsonObject>
#include <QSignalSpy>

#include <limits>

class KvTemplateContextTest : public StatReportTest
{
    Q_OBJECT

private slots:
    void startsWithDefaults();
    void declaresItsSignalsInOrder();
    void writesPageAndMargin();
    void readsPageAndMargin_data();
    void readsPageAndMargin();
    void missingKeysKeepTheValues();
    void resetIsSilent();
    void contentHeightIsAnnouncedOnChange();
    void liveUpdatesAreCounted();
    void liveUpdatesSurviveTheData();
    void computesPixels_data();
    void computesPixels();
};

namespace {
constexpr int kMax = std::numeric_limits<int>::max();
constexpr int kMin = std::numeric_limits<int>::min();
} // namespace

void KvTemplateContextTest::startsWithDefaults()
{
    KvReportKernelData data;
    const KvTemplateContext context(&data);
    QCOMPARE(context.kernelData(), &data);
    QCOMPARE(context.isLiveUpdates(), false);
    QCOMPARE(context.isPrinting(), false);
    QCOMPARE(context.pageWidth(), 952);
    QCOMPARE(context.contentHeight(), 1346);
    QCOMPARE(context.marginWidth(), 0.12f);
    QVERIFY(!context.keywords().keywords().isEmpty());
}

void KvTemplateContextTest::declaresItsSignalsInOrder()
{
    QCOMPARE(ownMethods(KvTemplateContext::staticMetaObject, QMetaMethod::Signal),
             QStringList({QStringLiteral("signalContentHeightChanged()"),
                          QStringLiteral("signalTemplateModified()")}));
}

void KvTemplateContextTest::writesPageAndMargin()
{
    const KvTemplateContext context(nullptr);
    QJsonObject config;
    QVERIFY(context.toJson(config));
    QCOMPARE(config.keys(), QStringList({QStringLiteral("marginWidth"), QStringLiteral("pageWidth")}));
    QCOMPARE(config.value(QStringLiteral("pageWidth")).toDouble(), 952.0);
    // The nearest 32-bit number to 0.12, as a double.
    QVERIFY(config.value(QStringLiteral("marginWidth")).toDouble() == 0.11999999731779099);
    QVERIFY(static_cast<float>(config.value(QStringLiteral("marginWidth")).toDouble()) == 0.12f);
}

void KvTemplateContextTest::readsPageAndMargin_data()
{
    QTest::addColumn<QJsonValue>("pageWidth");
    QTest::addColumn<int>("expectedWidth");
    QTest::addColumn<QJsonValue>("marginWidth");
    QTest::addColumn<float>("expectedMargin");

    const QJsonValue text(QStringLiteral("952"));
    QTest::newRow("numbers") << QJsonValue(600) << 600 << QJsonValue(0.25) << 0.25f;
    QTest::newRow("fractions are no page width") << QJsonValue(952.5) << 0 << QJsonValue(1) << 1.0f;
    QTest::newRow("texts") << text << 0 << QJsonValue(QStringLiteral("0.2")) << 0.0f;
    QTest::newRow("nulls") << QJsonValue(QJsonValue::Null) << 0 << QJsonValue(QJsonValue::Null) << 0.0f;
    QTest::newRow("booleans") << QJsonValue(true) << 0 << QJsonValue(true) << 0.0f;
    QTest::newRow("arrays") << QJsonValue(QJsonArray{1}) << 0 << QJsonValue(QJsonArray{1}) << 0.0f;
    QTest::newRow("objects") << QJsonValue(QJsonObject()) << 0 << QJsonValue(QJsonObject()) << 0.0f;
    QTest::newRow("beyond 32 bits") << QJsonValue(3e9) << 0 << QJsonValue(10.0) << 10.0f;
    QTest::newRow("negative") << QJsonValue(-5) << -5 << QJsonValue(-0.5) << -0.5f;
    QTest::newRow("largest") << QJsonValue(kMax) << kMax << QJsonValue(0) << 0.0f;
    QTest::newRow("smallest") << QJsonValue(kMin) << kMin << QJsonValue(0) << 0.0f;
}

void KvTemplateContextTest::readsPageAndMargin()
{
    QFETCH(QJsonValue, pageWidth);
    QFETCH(int, expectedWidth);
    QFETCH(QJsonValue, marginWidth);
    QFETCH(float, expectedMargin);

    KvTemplateContext context(nullptr);
    QVERIFY(context.fromJson(
        {{QStringLiteral("pageWidth"), pageWidth}, {QStringLiteral("marginWidth"), marginWidth}}));
    QCOMPARE(context.pageWidth(), expectedWidth);
    QVERIFY(context.marginWidth() == expectedMargin);
}

void KvTemplateContextTest::missingKeysKeepTheValues()
{
    KvTemplateContext context(nullptr);
    context.setPageWidth(700);
    context.setMarginWidth(0.5f);
    QVERIFY(context.fromJson({}));
    QCOMPARE(context.pageWidth(), 700);
    QCOMPARE(context.marginWidth(), 0.5f);
    QVERIFY(context.fromJson({{QStringLiteral("pageWidth"), 800}}));
    QCOMPARE(context.pageWidth(), 800);
    QCOMPARE(context.marginWidth(), 0.5f);
    QVERIFY(context.fromJson({{QStringLiteral("marginWidth"), 0.25}, {QStringLiteral("contentHeight"), 5}}));
    QCOMPARE(context.pageWidth(), 800);
    QCOMPARE(context.marginWidth(), 0.25f);
    QCOMPARE(context.contentHeight(), 1346); // never in a file
}

void KvTemplateContextTest::resetIsSilent()
{
    KvTemplateContext context(nullptr);
    context.setPageWidth(700);
    context.setContentHeight(100);
    context.setMarginWidth(0.5f);
    const QSignalSpy height(&context, SIGNAL(signalContentHeightChanged()));
    const QSignalSpy modified(&context, SIGNAL(signalTemplateModified()));
    context.resetDefaults();
    QCOMPARE(context.pageWidth(), 952);
    QCOMPARE(context.contentHeight(), 1346);
    QCOMPARE(context.marginWidth(), 0.12f);
    QCOMPARE(height.count(), 0);
    QCOMPARE(modified.count(), 0);
}

void KvTemplateContextTest::contentHeightIsAnnouncedOnChange()
{
    KvTemplateContext context(nullptr);
    const QSignalSpy height(&context, SIGNAL(signalContentHeightChanged()));
    const QSignalSpy modified(&context, SIGNAL(signalTemplateModified()));
    context.setContentHeight(1346);
    QCOMPARE(height.count(), 0);
    context.setContentHeight(1304);
    QCOMPARE(height.count(), 1);
    QCOMPARE(context.contentHeight(), 1304);
    context.setContentHeight(1304);
    QCOMPARE(height.count(), 1);
    context.setContentHeight(-42);
    QCOMPARE(height.count(), 2);
    QCOMPARE(modified.count(), 0);
}

void KvTemplateContextTest::liveUpdatesAreCounted()
{
    KvReportKernelData data;
    KvTemplateContext context(&data);
    context.beginLiveUpdates();
    QVERIFY(context.isLiveUpdates());
    QVERIFY(data.isActive());
    context.beginLiveUpdates();
    context.endLiveUpdates();
    QVERIFY(!context.isLiveUpdates());
    QVERIFY2(data.isActive(), "two begins need two ends");
    context.endLiveUpdates();
    QVERIFY(!data.isActive());
}

void KvTemplateContextTest::liveUpdatesSurviveTheData()
{
    auto data = std::make_unique<KvReportKernelData>();
    KvTemplateContext context(data.get());
    context.beginLiveUpdates();
    data.reset();
    QVERIFY(!context.kernelData());
    context.endLiveUpdates();
    QVERIFY(!context.isLiveUpdates());
    context.beginLiveUpdates();
    QVERIFY(context.isLiveUpdates());
}

void KvTemplateContextTest::computesPixels_data()
{
    QTest::addColumn<int>("pageWidth");
    QTest::addColumn<float>("fraction");
    QTest::addColumn<int>("margin");
    QTest::addColumn<int>("usable");
    QTest::addColumn<int>("height");

    // 600 x 0.12 and 1000 x 0.12 come to 71.99.. and 119.99.. in double precision.
    QTest::newRow("952") << 952 << 0.12f << 114 << 724 << 1346;
    QTest::newRow("600") << 600 << 0.12f << 72 << 456 << 848;
    QTest::newRow("1000") << 1000 << 0.12f << 120 << 760 << 1414;
    QTest::newRow("40") << 40 << 0.12f << 4 << 32 << 56;
    QTest::newRow("1") << 1 << 0.12f << 0 << 1 << 1;
    QTest::newRow("0") << 0 << 0.12f << 0 << 0 << 0;
    QTest::newRow("-5") << -5 << 0.12f << 0 << 0 << 0;
    QTest::newRow("no margin") << 952 << 0.0f << 0 << 952 << 1346;
    QTest::newRow("negative margin") << 952 << -1.0f << 0 << 952 << 1346;
    QTest::newRow("margins meet") << 952 << 0.5f << 476 << 0 << 1346;
    QTest::newRow("margins cross") << 952 << 10.0f << 9520 << 0 << 1346;
    QTest::newRow("margin without end")
        << 952 << std::numeric_limits<float>::infinity() << 32767 << 0 << 1346;
    QTest::newRow("margin of no number")
        << 952 << std::numeric_limits<float>::quiet_NaN() << 0 << 952 << 1346;
    QTest::newRow("largest page") << kMax << 0.0f << 0 << 32767 << 46339;
    QTest::newRow("widest window") << 32767 << 0.12f << 3932 << 24903 << 46339;
    QTest::newRow("wider than a window") << 32768 << 0.12f << 3932 << 24903 << 46339;
    QTest::newRow("smallest page") << kMin << 0.12f << 0 << 0 << 0;
}

void KvTemplateContextTest::computesPixels()
{
    QFETCH(int, pageWidth);
    QFETCH(float, fraction);
    KvTemplateContext context(nullptr);
    context.setPageWidth(pageWidth);
    context.setMarginWidth(fraction);
    QTEST(context.marginPixels(), "margin");
    QTEST(context.usableWidth(), "usable");
    QTEST(context.pageHeight(), "height");
    QCOMPARE(context.layoutWidth(), qBound(0, pageWidth, 32767));
}

STATREPORT_TEST_MAIN(KvTemplateContextTest)
#include "KvTemplateContextTest.moc"
