// SPDX-License-Identifier: MIT
#include "support/StatReportTest.h"

#include "KvDeskCalibrationDialog.h"
#include "KvDeskCalibrationHistory.h"
#include "KvDeskCalibrator.h"
#include "KvDeskExportDialog.h"
#include "KvDeskGuideCommand.h"
#include "KvDeskGuideWindow.h"
#include "KvDeskNumberBox.h"
#include "KvDeskProgress.h"
#include "KvDeskSession.h"
#include "KvDeskSettingsDialog.h"
#include "KvDeskTypedPixelSize.h"
#include "LanguageWalk.h"
#include "editor/KvPrintProgressDialog.h"
#include "measuring/ZtProgress.h"

#include <atomic>
#include <chrono>
#include <thread>

/** Walks through the dialogs and message boxes of the Measuring Desk and the plug-in, in every language. */
class DialogLanguagesTest : public StatReportTest
{
    Q_OBJECT

private slots:
    void init();
    void cleanup();

    void dialogsHaveRoom_data() { LanguageWalk::addLanguages(); }
    void dialogsHaveRoom();
    void calibrationHasRoom_data() { LanguageWalk::addLanguages(); }
    void calibrationHasRoom();
    void messagesHaveRoom_data() { LanguageWalk::addLanguages(); }
    void messagesHaveRoom();
    void progressHasRoom_data() { LanguageWalk::addLanguages(); }
    void progressHasRoom();

private:
    LanguageWalk m_walk;
};

void DialogLanguagesTest::init()
{
    StatReportTest::init();
    ZtAppSettings::getInstance()->setStoragePath(QString());
}

void DialogLanguagesTest::cleanup()
{
    m_walk.end();
    StatReportTest::cleanup();
}

void DialogLanguagesTest::dialogsHaveRoom()
{
    QFETCH(QString, language);
    m_walk.start(language);
    m_walk.openSession();
    KvDeskSettingsDialog settings(m_walk.window());
    settings.show();
    m_walk.look(&settings, QStringLiteral("settings"));
    KvDeskExportDialog exporting({}, m_walk.window());
    exporting.show();
    m_walk.look(&exporting, QStringLiteral("export"));
    KvDeskGuideWindow guide(KvDeskGuideCommand::guide(language));
    guide.show();
    m_walk.look(&guide, QStringLiteral("guide"));
    QVERIFY2(m_walk.faults().isEmpty(), m_walk.faults());
}

void DialogLanguagesTest::calibrationHasRoom()
{
    QFETCH(QString, language);
    m_walk.start(language);
    m_walk.openSession();
    m_walk.action(KvDeskActions::Calibrate)->trigger();
    auto *const dialog = m_walk.window()->findChild<KvDeskCalibrationDialog *>();
    QVERIFY(dialog);
    for (const auto way : {KvDeskCalibrationDialog::KnownDistance, KvDeskCalibrationDialog::ImageFile,
                           KvDeskCalibrationDialog::Typed}) {
        dialog->wayButton(way)->setEnabled(true);
        dialog->wayButton(way)->click();
        m_walk.look(dialog, QStringLiteral("calibration"));
    }
    for (const char *const text : {"1.234,5", "1e400"}) {
        dialog->typed()->xBox()->setText(QLatin1String(text));
        QVERIFY(!dialog->typed()->fault().isEmpty());
        m_walk.look(dialog, QStringLiteral("faulty size"));
    }
    dialog->objectiveBox()->setEditText(QStringLiteral("50x"));
    dialog->nameEdit()->setText(QStringLiteral("Stage micrometer"));
    dialog->typed()->xBox()->setValue(0.5);
    dialog->calibrateButton()->click();
    m_walk.look(dialog, QStringLiteral("history"));
    QVERIFY(dialog->history()->rowCount() > 0);
    QVERIFY2(m_walk.faults().isEmpty(), m_walk.faults());
}

void DialogLanguagesTest::messagesHaveRoom()
{
    QFETCH(QString, language);
    m_walk.start(language);
    m_walk.lookAtModal(QStringLiteral("about"), [this]() { m_walk.action(KvDeskActions::About)->trigger(); });
    m_walk.lookAtModal(QStringLiteral("cannot open"), [this]() {
        m_walk.window()->files()->openSession(temporaryPath(QStringLiteral("missing.json")));
    });
    m_walk.openSession();
    QVERIFY(QMetaObject::invokeMethod(m_walk.window()->session(), "slotMarkModified"));
    QVERIFY(m_walk.window()->session()->isModified());
    m_walk.lookAtModal(QStringLiteral("unsaved"), [this]() { m_walk.window()->files()->maybeSave(); });
    m_walk.openEditor();
    m_walk.composeAll([]() {});
    m_walk.lookAtModal(QStringLiteral("unsaved template"), [this]() { m_walk.desk()->editor()->close(); });
    QVERIFY2(m_walk.faults().isEmpty(), m_walk.faults());
}

void DialogLanguagesTest::progressHasRoom()
{
    QFETCH(QString, language);
    m_walk.start(language);
    std::atomic_bool hasLooked{false};
    KvDeskProgress progress(m_walk.window());
    QTimer timer;
    connect(&timer, &QTimer::timeout, this, [&]() {
        if (!progress.isVisible() || hasLooked)
            return;
        timer.stop();
        m_walk.look(m_walk.window(), QStringLiteral("saving"));
        hasLooked = true;
    });
    timer.start(5);
    const QString text = QCoreApplication::translate("KvDeskFileCommands", "Saving \"%1\"");
    progress.run(text.arg(QStringLiteral("demo.json")), [&](ZtProgress *) {
        while (!hasLooked)
            std::this_thread::sleep_for(std::chrono::milliseconds(5));
    });
    QVERIFY(hasLooked);

    KvPrintProgressDialog printing(m_walk.window(), 0);
    printing.pageWritten(1, 1000);
    m_walk.look(&printing, QStringLiteral("printing"));
    QVERIFY2(m_walk.faults().isEmpty(), m_walk.faults());
}

STATREPORT_TEST_MAIN(DialogLanguagesTest)
#include "DialogLanguagesTest.moc"
