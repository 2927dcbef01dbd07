// SPDX-License-Identifier: MIT
#include "KvDeskStatus.h"

#include "KvDeskResources.h"
#include "common/ZtAppStatus.h"
#include "gui/QtAdvancedStylesheet.h"
#include "gui/acss.h"
#include "support/StatReportTest.h"

class KvDeskStatusTest : public StatReportTest
{
    Q_OBJECT

private slots:
    void categories_data();
    void categories();
    void coloursCanBeRead_data();
    void coloursCanBeRead();
    void logs();
};

void KvDeskStatusTest::categories_data()
{
    QTest::addColumn<int>("category");
    QTest::addColumn<QString>("name");
    QTest::addColumn<QString>("icon");
    QTest::newRow("information") << 1 << QStringLiteral("Information") << QStringLiteral("Icons/status-info");
    QTest::newRow("warning") << 2 << QStringLiteral("Warning") << QStringLiteral("Icons/status-warning");
    QTest::newRow("error") << 3 << QStringLiteral("Error") << QStringLiteral("Icons/status-error");
    QTest::newRow("none") << 0 << QStringLiteral("Information") << QStringLiteral("Icons/status-info");
    QTest::newRow("unknown") << 77 << QStringLiteral("Information") << QStringLiteral("Icons/status-info");
}

void KvDeskStatusTest::categories()
{
    QFETCH(int, category);
    QFETCH(QString, name);
    QFETCH(QString, icon);
    KvDeskResources::ensure();
    QCOMPARE(KvDeskStatus::categoryName(category), name);
    QCOMPARE(KvDeskStatus::iconPath(category), icon);
    QVERIFY(!acss::getPathSVG(icon).isEmpty());
}

void KvDeskStatusTest::coloursCanBeRead_data()
{
    QTest::addColumn<QString>("theme");
    QTest::newRow("dark") << QStringLiteral("Dark");
    QTest::newRow("light") << QStringLiteral("Light");
}

void KvDeskStatusTest::coloursCanBeRead()
{
    QFETCH(QString, theme);
    auto *const style = acss::QtAdvancedStylesheet::getInstance();
    style->setCurrentTheme(theme);
    const auto luminance = [](const QColor &color) {
        const auto part = [](double c) {
            return c <= 0.03928 ? c / 12.92 : std::pow((c + 0.055) / 1.055, 2.4);
        };
        return 0.2126 * part(color.redF()) + 0.7152 * part(color.greenF()) + 0.0722 * part(color.blueF());
    };
    const double ground = luminance(style->color(QStringLiteral("panel")));
    for (const int category : {1, 2, 3}) {
        const double text = luminance(KvDeskStatus::color(category));
        const double contrast = (qMax(text, ground) + 0.05) / (qMin(text, ground) + 0.05);
        QVERIFY2(contrast >= 4.5, qPrintable(QStringLiteral("%1: %2").arg(category).arg(contrast)));
    }
    style->setCurrentTheme(QStringLiteral("Dark"));
}

void KvDeskStatusTest::logs()
{
    QSignalSpy spy(ZtStatusLog::getInstance(), SIGNAL(signalEntryLogged(ZtStatusEntry)));
    KvDeskStatus::log(ZtAppStatus::Error, QStringLiteral("It broke"), QStringLiteral("Class::method"));
    QCOMPARE(spy.count(), 1);
    const ZtStatusEntry entry = spy.first().first().value<ZtStatusEntry>();
    QCOMPARE(entry.category, 3);
    QCOMPARE(entry.code, 0);
    QCOMPARE(entry.message, QStringLiteral("It broke"));
    QCOMPARE(entry.source, QStringLiteral("Class::method"));
}

STATREPORT_TEST_MAIN(KvDeskStatusTest)
#include "KvDeskStatusTest.moc"
