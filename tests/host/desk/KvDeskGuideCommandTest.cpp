// SPDX-License-Identifier: MIT
#include "KvDeskGuideCommand.h"

#include "GuideFile.h"
#include "KvDeskActions.h"
#include "KvDeskGuideText.h"
#include "KvDeskGuideWindow.h"
#include "KvDeskMainWindow.h"
#include "KvDeskResources.h"
#include "kernel/ZtAppSettings.h"
#include "measuring/ZtMeasuringDocument.h"

#include <QAction>
#include <QDir>
#include <QMenu>
#include <QMenuBar>

class KvDeskGuideCommandTest : public StatReportTest
{
    Q_OBJECT

private slots:
    void init();

    void missingGuideSaysSo();
    void showsOneWindow();
    void comesBackFromTheTaskBar();
    void guideOfTheProgram_data();
    void guideOfTheProgram();
    void guideOfTheLanguage_data();
    void guideOfTheLanguage();
    void f1ShowsIt();
    void closesWithTheMainWindow();
    void isInTheMenu();
};

namespace {

KvDeskGuideWindow *openGuide()
{
    for (QWidget *const widget : QApplication::topLevelWidgets()) {
        auto *const guide = qobject_cast<KvDeskGuideWindow *>(widget);
        if (guide && guide->isVisible())
            return guide;
    }
    return nullptr;
}

} // namespace

void KvDeskGuideCommandTest::init()
{
    StatReportTest::init();
    KvDeskResources::ensure();
    ZtAppSettings::getInstance()->setStoragePath(QString());
}

void KvDeskGuideCommandTest::missingGuideSaysSo()
{
    KvDeskActions actions;
    const KvDeskGuideCommand command(&actions, QString());
    const QAction *const action = actions.action(KvDeskActions::Guide);
    QVERIFY(!action->isEnabled());
    QCOMPARE(action->toolTip(), QStringLiteral("Read the user guide (F1)\nThe user guide is not installed"));
}

void KvDeskGuideCommandTest::showsOneWindow()
{
    KvDeskActions actions;
    const KvDeskGuideCommand command(&actions, GuideFile::create());
    QAction *const action = actions.action(KvDeskActions::Guide);
    QVERIFY(action->isEnabled());
    QCOMPARE(command.window(), nullptr);
    action->trigger();
    const KvDeskGuideWindow *const first = command.window();
    QVERIFY(first->isVisible());
    QCOMPARE(first->parentWidget(), nullptr);
    QCOMPARE(first->text()->headings().first().title, QStringLiteral("The guide"));
    command.window()->close();
    action->trigger();
    QCOMPARE(command.window(), first);
    QVERIFY(first->isVisible());
}

void KvDeskGuideCommandTest::comesBackFromTheTaskBar()
{
    KvDeskActions actions;
    KvDeskGuideCommand command(&actions, GuideFile::create());
    command.slotShow();
    command.window()->showMinimized();
    expectWarning(QRegularExpression(QStringLiteral("does not support raise")));
    command.slotShow();
    QVERIFY(!command.window()->isMinimized());
}

void KvDeskGuideCommandTest::guideOfTheProgram_data()
{
    QTest::addColumn<QString>("program");
    QTest::addColumn<QString>("guide");
    QTest::newRow("installed") << QStringLiteral("usr/lib/statreport/bin")
                               << QStringLiteral("usr/share/measuringdesk/guide/user-guide.md");
    QTest::newRow("build tree") << QStringLiteral("source/build/dev/bin")
                                << QStringLiteral("source/docs/user-guide.md");
}

void KvDeskGuideCommandTest::guideOfTheProgram()
{
    QFETCH(QString, program);
    QFETCH(QString, guide);
    const QString programFolder = temporaryPath(program);
    const QString path = temporaryPath(guide);
    QVERIFY(QDir().mkpath(programFolder));
    QCOMPARE(KvDeskGuideCommand::guide(QStringLiteral("German"), programFolder), QString());
    QVERIFY(QDir().mkpath(QFileInfo(path).absolutePath()));
    QVERIFY(QFile::copy(GuideFile::create(), path));
    QCOMPARE(KvDeskGuideCommand::guide(QStringLiteral("German"), programFolder), path);
}

void KvDeskGuideCommandTest::guideOfTheLanguage_data()
{
    QTest::addColumn<QString>("language");
    QTest::addColumn<QString>("file");
    QTest::newRow("English") << QStringLiteral("English") << QStringLiteral("user-guide.md");
    QTest::newRow("translated") << QStringLiteral("ChineseSimple")
                                << QStringLiteral("user-guide.ChineseSimple.md");
    QTest::newRow("not translated") << QStringLiteral("Korean") << QStringLiteral("user-guide.md");
    QTest::newRow("no language of the program")
        << QStringLiteral("Polish") << QStringLiteral("user-guide.md");
    QTest::newRow("none") << QString() << QStringLiteral("user-guide.md");
}

void KvDeskGuideCommandTest::guideOfTheLanguage()
{
    QFETCH(QString, language);
    QFETCH(QString, file);
    const QString folder = temporaryPath(QStringLiteral("languages/share/measuringdesk/guide/"));
    const QString program = temporaryPath(QStringLiteral("languages/lib/statreport/bin"));
    QVERIFY(QDir().mkpath(folder));
    QVERIFY(QDir().mkpath(program));
    for (const char *const name : {"user-guide.md", "user-guide.ChineseSimple.md", "user-guide.German.md"})
        QFile::copy(GuideFile::create(), folder + QLatin1String(name));
    QCOMPARE(KvDeskGuideCommand::guide(language, program), folder + file);
}

// The test program is as deep in the build as the Desk.
void KvDeskGuideCommandTest::f1ShowsIt()
{
    ZtMeasuringDocument document;
    KvDeskMainWindow window(&document);
    window.show();
    window.activateWindow();
    QVERIFY(QTest::qWaitForWindowActive(&window));
    QVERIFY(!openGuide());
    QTest::keyClick(&window, Qt::Key_F1);
    QVERIFY(openGuide());
    QCOMPARE(openGuide()->text()->headings().first().title, QStringLiteral("User guide"));
}

void KvDeskGuideCommandTest::closesWithTheMainWindow()
{
    ZtMeasuringDocument document;
    KvDeskMainWindow window(&document);
    window.show();
    window.actions()->action(KvDeskActions::Guide)->trigger();
    QVERIFY(openGuide());
    QVERIFY(window.close());
    QVERIFY(!openGuide());
}

void KvDeskGuideCommandTest::isInTheMenu()
{
    ZtMeasuringDocument document;
    const KvDeskMainWindow window(&document);
    const QMenu *const help = window.menuBar()->actions().last()->menu();
    QCOMPARE(help->title(), QStringLiteral("&Help"));
    QCOMPARE(help->actions().first(), window.actions()->action(KvDeskActions::Guide));
}

STATREPORT_TEST_MAIN(KvDeskGuideCommandTest)
#include "KvDeskGuideCommandTest.moc"
