// SPDX-License-Identifier: MIT
#include "KvDeskExportCommand.h"

#include "DeskLog.h"
#include "DeskValues.h"
#include "ExportDialogAnswerer.h"
#include "FileDialogAnswerer.h"
#include "KvDeskFileCommands.h"
#include "kernel/ZtAppSettings.h"
#include "support/MessageBoxAnswerer.h"

#include <QAction>
#include <QProgressDialog>

class KvDeskExportCommandTest : public StatReportTest
{
    Q_OBJECT

private slots:
    void init();
    void cleanup();

    void needsMeasuredObjects();
    void exports_data();
    void exports();
    void cancelledDialog();
    void cancelledFile();
    void suggestsTheSessionsName();
    void saysWhatWentWrong();
    void progressCanBeCancelled();

private:
    std::unique_ptr<DeskValues> m_values;
    std::unique_ptr<QWidget> m_window;
    std::unique_ptr<QAction> m_action;
    std::unique_ptr<KvDeskFileCommands> m_files;
    std::unique_ptr<KvDeskExportCommand> m_command;
};

void KvDeskExportCommandTest::init()
{
    StatReportTest::init();
    ZtAppSettings::getInstance()->setStoragePath(QString());
    ZtStatusLog::getInstance()->clear();
    m_values = std::make_unique<DeskValues>();
    m_window = std::make_unique<QWidget>();
    m_window->show();
    m_action = std::make_unique<QAction>();
    m_action->setToolTip(QStringLiteral("Export"));
    m_files = std::make_unique<KvDeskFileCommands>(&m_values->session, m_window.get());
    m_command = std::make_unique<KvDeskExportCommand>(m_action.get(), m_files.get(), &m_values->session,
                                                      &m_values->selection, m_window.get());
}

void KvDeskExportCommandTest::cleanup()
{
    m_command.reset();
    m_files.reset();
    m_action.reset();
    m_window.reset();
    m_values.reset();
    ZtAppSettings::getInstance()->setStoragePath(QString());
    StatReportTest::cleanup();
}

void KvDeskExportCommandTest::needsMeasuredObjects()
{
    QVERIFY(!m_action->isEnabled());
    QCOMPARE(m_action->toolTip(), QStringLiteral("Export\nNothing was measured yet"));
    m_values->document.addObject(ZtDrawnType::TextNote, polygon({QPointF(0, 0)}), QString(),
                                 QStringLiteral("Note"));
    QTest::qWait(2 * KvDeskObjectChanges::intervalMs);
    QVERIFY(!m_action->isEnabled());
    m_values->add(ZtDrawnType::Line);
    QTRY_VERIFY(m_action->isEnabled());
    QCOMPARE(m_action->toolTip(), QStringLiteral("Export"));
    m_values->document.clear();
    QTRY_VERIFY(!m_action->isEnabled());
}

void KvDeskExportCommandTest::exports_data()
{
    QTest::addColumn<int>("layout");
    QTest::addColumn<QString>("filter");
    QTest::newRow("tidy") << static_cast<int>(ZtTableExport::TidyCsv) << QStringLiteral("CSV tables (*.csv)");
    QTest::newRow("wide") << static_cast<int>(ZtTableExport::WideCsv) << QStringLiteral("CSV tables (*.csv)");
    QTest::newRow("JSON") << static_cast<int>(ZtTableExport::Json) << QStringLiteral("JSON files (*.json)");
}

void KvDeskExportCommandTest::exports()
{
    QFETCH(int, layout);
    QFETCH(QString, filter);
    m_values->add(ZtDrawnType::Rectangle);
    const QString path = temporaryPath(QStringLiteral("export-%1.table").arg(layout));
    const ExportDialogAnswerer dialog(layout);
    const FileDialogAnswerer files(path);
    m_action->trigger();
    QCOMPARE(files.dialogs().size(), 1);
    QVERIFY(files.dialogs().first().isForSaving);
    QCOMPARE(files.dialogs().first().filters, QStringList(filter));
    ZtTableExport::Options options;
    options.layout = static_cast<ZtTableExport::Layout>(layout);
    QCOMPARE(DeskFiles::bytes(path), ZtTableExport::toBytes(options));
    QCOMPARE(DeskLog::messages(ZtAppStatus::Information).last(),
             QStringLiteral("Measured values exported: export-%1.table").arg(layout));
}

void KvDeskExportCommandTest::cancelledDialog()
{
    m_values->add(ZtDrawnType::Rectangle);
    const ExportDialogAnswerer dialog(-1);
    const FileDialogAnswerer files(QString{});
    m_command->slotExport();
    QVERIFY(files.dialogs().isEmpty());
}

void KvDeskExportCommandTest::cancelledFile()
{
    m_values->add(ZtDrawnType::Rectangle);
    const ExportDialogAnswerer dialog(0);
    const FileDialogAnswerer files(QString{});
    m_command->slotExport();
    QCOMPARE(files.dialogs().size(), 1);
    QVERIFY(DeskLog::messages(ZtAppStatus::Information).isEmpty());
}

void KvDeskExportCommandTest::suggestsTheSessionsName()
{
    m_values->add(ZtDrawnType::Rectangle);
    ZtFault fault;
    QVERIFY(m_values->session.save(temporaryPath(QStringLiteral("Coins.json")), &fault));
    const ExportDialogAnswerer dialog(0);
    QString suggested;
    QTimer timer;
    connect(&timer, &QTimer::timeout, &timer, [&suggested]() {
        auto *const files = qobject_cast<QFileDialog *>(QApplication::activeModalWidget());
        if (!files || !files->isVisible())
            return;
        suggested = files->findChild<QLineEdit *>(QStringLiteral("fileNameEdit"))->text();
        files->reject();
    });
    timer.start(5);
    m_command->slotExport();
    QCOMPARE(suggested, QStringLiteral("Coins.csv"));
}

void KvDeskExportCommandTest::saysWhatWentWrong()
{
    m_values->add(ZtDrawnType::Rectangle);
    const MessageBoxAnswerer boxes;
    QVERIFY(!m_command->exportTo(temporaryPath(QStringLiteral("missing folder/values.csv")),
                                 ZtTableExport::Options()));
    QCOMPARE(boxes.boxes().size(), 1);
    QCOMPARE(boxes.boxes().first().text, QStringLiteral("The table \"values.csv\" was not written."));
    QCOMPARE(DeskLog::messages(ZtAppStatus::Error).size(), 1);
}

void KvDeskExportCommandTest::progressCanBeCancelled()
{
    {
        const ZtKernelData::SignalBlocker blocker;
        for (int i = 0; i < 20000; ++i)
            m_values->document.addObject(ZtDrawnType::Line, polygon({QPointF(0, 0), QPointF(3, 4)}));
    }
    const QString path = DeskFiles::text(QStringLiteral("before.csv"), "before");
    m_command->setProgressDelay(0);
    QString shown;
    QTimer timer;
    connect(&timer, &QTimer::timeout, &timer, [&shown]() {
        if (auto *const progress = qobject_cast<QProgressDialog *>(QApplication::activeModalWidget())) {
            shown = progress->labelText();
            progress->findChild<QPushButton *>()->click();
        }
    });
    timer.start(0);
    QVERIFY(!m_command->exportTo(path, ZtTableExport::Options()));
    QCOMPARE(shown, QStringLiteral("Exporting measured values"));
    QCOMPARE(DeskFiles::bytes(path), QByteArray("before"));
    QCOMPARE(DeskLog::messages(ZtAppStatus::Information).last(),
             QStringLiteral("Export cancelled: before.csv"));
}

STATREPORT_TEST_MAIN(KvDeskExportCommandTest)
#include "KvDeskExportCommandTest.moc"
