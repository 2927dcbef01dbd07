// SPDX-License-Identifier: MIT
#include "KvDeskActions.h"

#include "KvDeskResources.h"
#include "common/ZtAppStatus.h"
#include "support/StatReportTest.h"

#include <QAction>

class KvDeskActionsTest : public StatReportTest
{
    Q_OBJECT

private slots:
    void initTestCase();
    void commands_data();
    void commands();
    void noShortcutIsUsedTwice();
    void allIconsAreThere();
};

void KvDeskActionsTest::initTestCase()
{
    KvDeskResources::ensure();
}

void KvDeskActionsTest::commands_data()
{
    QTest::addColumn<int>("id");
    QTest::addColumn<QString>("text");
    QTest::addColumn<QString>("toolTip");
    QTest::addColumn<bool>("hasIcon");
    QTest::addColumn<bool>("isCheckable");
    const auto row = [](KvDeskActions::Id id, const char *text, const char *toolTip, bool hasIcon = true,
                        bool isCheckable = false) {
        QTest::newRow(text) << static_cast<int>(id) << QString::fromLatin1(text)
                            << QString::fromLatin1(toolTip) << hasIcon << isCheckable;
    };
    using A = KvDeskActions;
    row(A::NewSession, "&New session", "Start an empty session (Ctrl+N)", false);
    row(A::OpenImage, "Open &image...", "Open image (Ctrl+O)");
    row(A::OpenSession, "&Open session...", "Open session (Ctrl+Shift+O)");
    row(A::ImportTable, "Import &table...", "Import table of measured values (Ctrl+I)");
    row(A::SaveSession, "&Save session", "Save session (Ctrl+S)");
    row(A::SaveSessionAs, "Save session &as...", "Save session to another file (Ctrl+Shift+S)", false);
    row(A::Quit, "&Quit", "Quit the program (Ctrl+Q)", false);
    row(A::ZoomIn, "Zoom &in", "Zoom in (Ctrl++)");
    row(A::ZoomOut, "Zoom &out", "Zoom out (Ctrl+-)");
    row(A::ZoomFit, "&Fit to window", "Show the whole image (Ctrl+0)");
    row(A::ZoomActual, "&Actual size", "Show the image at 100 % (Ctrl+1)");
    row(A::ShowValues, "&Measured values", "Show or hide the measured values (F6)", true, true);
    row(A::ShowLog, "Status &log", "Show or hide the status log (F7)", true, true);
    row(A::ToggleTheme, "&Dark or light theme", "Change between the dark and the light theme (F8)");
    row(A::Settings, "S&ettings...", "Settings (Ctrl+,)");
    row(A::About, "&About Measuring Desk", "About Measuring Desk");
}

void KvDeskActionsTest::commands()
{
    QFETCH(int, id);
    QFETCH(QString, text);
    QFETCH(QString, toolTip);
    QFETCH(bool, hasIcon);
    QFETCH(bool, isCheckable);
    const KvDeskActions actions;
    const QAction *const action = actions.action(static_cast<KvDeskActions::Id>(id));
    QCOMPARE(action->text(), text);
    QCOMPARE(action->toolTip(), toolTip);
    QCOMPARE(action->icon().isNull(), !hasIcon);
    QCOMPARE(action->isCheckable(), isCheckable);
}

void KvDeskActionsTest::noShortcutIsUsedTwice()
{
    const KvDeskActions actions;
    QStringList keys;
    for (int id = 0; id < KvDeskActions::Count; ++id) {
        for (const QKeySequence &sequence : actions.action(static_cast<KvDeskActions::Id>(id))->shortcuts())
            keys.append(sequence.toString());
    }
    QVERIFY(keys.contains(QStringLiteral("Ctrl+=")));
    QCOMPARE(keys.removeDuplicates(), 0);
}

void KvDeskActionsTest::allIconsAreThere()
{
    const KvDeskActions actions;
    // A missing icon is reported there.
    QCOMPARE(ZtStatusLog::getInstance()->entries().size(), 0);
}

STATREPORT_TEST_MAIN(KvDeskActionsTest)
#include "KvDeskActionsTest.moc"
