// SPDX-License-Identifier: MIT
#include "KvDeskTranslation.h"

#include "support/BracketTranslator.h"
#include "support/StatReportTest.h"

class KvDeskTranslationTest : public StatReportTest
{
    Q_OBJECT

private slots:
    void cleanup();

    void direction_data();
    void direction();
    void directionSurvivesTranslatorsOfPlugins();
    void missingTranslationChangesNoText();
};

void KvDeskTranslationTest::cleanup()
{
    QGuiApplication::setLayoutDirection(Qt::LeftToRight);
    StatReportTest::cleanup();
}

void KvDeskTranslationTest::direction_data()
{
    QTest::addColumn<QString>("language");
    QTest::addColumn<Qt::LayoutDirection>("direction");
    QTest::newRow("English") << QStringLiteral("English") << Qt::LeftToRight;
    QTest::newRow("Arabic") << QStringLiteral("Arabic") << Qt::RightToLeft;
    QTest::newRow("Japanese") << QStringLiteral("Japanese") << Qt::LeftToRight;
    QTest::newRow("unknown") << QStringLiteral("Klingon") << Qt::LeftToRight;
}

void KvDeskTranslationTest::direction()
{
    QFETCH(QString, language);
    QFETCH(Qt::LayoutDirection, direction);
    const KvDeskTranslation translation(language);
    QCOMPARE(QGuiApplication::layoutDirection(), direction);
}

void KvDeskTranslationTest::directionSurvivesTranslatorsOfPlugins()
{
    const KvDeskTranslation translation(QStringLiteral("Arabic"));
    const BracketTranslator plugin(QStringLiteral("SomePlugin"));
    QCoreApplication::processEvents();
    QCOMPARE(QGuiApplication::layoutDirection(), Qt::RightToLeft);
}

void KvDeskTranslationTest::missingTranslationChangesNoText()
{
    const KvDeskTranslation translation(QStringLiteral("Klingon"));
    QVERIFY(!translation.isLoaded());
    QCOMPARE(QCoreApplication::translate("KvDeskActions", "Zoom in"), QStringLiteral("Zoom in"));
}

STATREPORT_TEST_MAIN(KvDeskTranslationTest)
#include "KvDeskTranslationTest.moc"
