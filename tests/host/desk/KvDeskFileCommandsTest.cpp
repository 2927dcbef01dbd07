// SPDX-License-Identifier: MIT
#include "KvDeskFileCommands.h"

#include "DeskFiles.h"
#include "DeskLog.h"
#include "FileDialogAnswerer.h"
#include "KvDeskProgress.h"
#include "KvDeskRecentFiles.h"
#include "KvDeskSession.h"
#include "host/measuring/Polygon.h"
#include "kernel/ZtAppSettings.h"
#include "measuring/ZtDrawnType.h"
#include "measuring/ZtMeasuringDocument.h"
#include "support/MessageBoxAnswerer.h"
#include "support/UnprivilegedUser.h"

#include <QProgressBar>
#include <QPushButton>

#include <ctime>
#include <functional>

#include <sys/stat.h>

namespace {

// Processor time of this thread, which other programs do not lengthen.
qint64 threadMs()
{
    timespec time{};
    clock_gettime(CLOCK_THREAD_CPUTIME_ID, &time);
    return static_cast<qint64>(time.tv_sec) * 1000 + time.tv_nsec / 1000000;
}

const QPolygonF diagonal = polygon({QPointF(0, 0), QPointF(10, 10)});

} // namespace

class KvDeskFileCommandsTest : public StatReportTest
{
    Q_OBJECT

private slots:
    void init();
    void cleanup();

    void unmodifiedSessionIsNotAskedFor();
    void unsavedChanges_data();
    void unsavedChanges();
    void savingThatIsCancelledKeepsTheSession();
    void opensEveryKind_data();
    void opensEveryKind();
    void faultsAreTold_data();
    void faultsAreTold();
    void missingImage_data();
    void missingImage();
    void sessionWithWrongImageEntryIsNoQuestion();
    void saveThatFails();
    void notesOfATableAreLogged();
    void savesWhereItWasSaved();
    void savesAsWithSuffix();
    void choosesFiles_data();
    void choosesFiles();
    void startsWhereTheLastFileWas();
    void newSessionAsks();
    void recentSessions();
    void dropsAreOpenedByKind();
    void faultsOfDropsAreToldAtOnce();
    void secondSessionOfADropIsLeftOut();
    void fileOfAnotherProgram_data();
    void fileOfAnotherProgram();
    void writeProtectedFile_data();
    void writeProtectedFile();
    void newerVersionIsRefused();
    void badFilesOfAnySize_data();
    void badFilesOfAnySize();
    void cutSessionsLoseNothing();
    void longWorkCanBeCancelled_data();
    void longWorkCanBeCancelled();
    void millionRows_data();
    void millionRows();
    void largeSessionIsSavedAndRead();
    void largeSessionsHoldNothingUp();
    void savingCanBeCancelled();

private:
    void cancelWhenShown(QTimer *timer);
    void cancelSoon(QTimer *timer);

    QWidget m_window;
    std::unique_ptr<ZtMeasuringDocument> m_document;
    std::unique_ptr<KvDeskSession> m_session;
    std::unique_ptr<KvDeskFileCommands> m_commands;
};

void KvDeskFileCommandsTest::init()
{
    StatReportTest::init();
    ZtAppSettings::getInstance()->setStoragePath(QString());
    ZtStatusLog::getInstance()->clear();
    m_document = std::make_unique<ZtMeasuringDocument>();
    m_session = std::make_unique<KvDeskSession>(m_document.get());
    m_commands = std::make_unique<KvDeskFileCommands>(m_session.get(), &m_window);
}

void KvDeskFileCommandsTest::cleanup()
{
    m_commands.reset();
    m_session.reset();
    m_document.reset();
    StatReportTest::cleanup();
}

void KvDeskFileCommandsTest::unmodifiedSessionIsNotAskedFor()
{
    const MessageBoxAnswerer answerer(QMessageBox::Cancel);
    QVERIFY(m_commands->maybeSave());
    QCOMPARE(answerer.boxes().size(), 0);
}

void KvDeskFileCommandsTest::unsavedChanges_data()
{
    QTest::addColumn<int>("answer");
    QTest::addColumn<bool>("goesOn");
    QTest::addColumn<bool>("isSaved");
    QTest::newRow("save") << static_cast<int>(QMessageBox::Save) << true << true;
    QTest::newRow("discard") << static_cast<int>(QMessageBox::Discard) << true << false;
    QTest::newRow("cancel") << static_cast<int>(QMessageBox::Cancel) << false << false;
}

void KvDeskFileCommandsTest::unsavedChanges()
{
    QFETCH(int, answer);
    QFETCH(bool, goesOn);
    QFETCH(bool, isSaved);
    const QString path = temporaryPath(QStringLiteral("asked.json"));
    QVERIFY(m_commands->saveSession(path));
    const QByteArray before = DeskFiles::bytes(path);
    m_document->addObject(ZtDrawnType::Line, diagonal);
    const MessageBoxAnswerer answerer(static_cast<QMessageBox::StandardButton>(answer));
    QCOMPARE(m_commands->maybeSave(), goesOn);
    QCOMPARE(answerer.boxes().size(), 1);
    const SeenMessageBox &box = answerer.boxes().first();
    QCOMPARE(box.text, QStringLiteral("Save the changes to \"asked.json\"?"));
    QCOMPARE(box.buttons, QMessageBox::Save | QMessageBox::Discard | QMessageBox::Cancel);
    QVERIFY(box.hasParent);
    QCOMPARE(DeskFiles::bytes(path) != before, isSaved);
    QCOMPARE(m_session->isModified(), !isSaved);
}

void KvDeskFileCommandsTest::savingThatIsCancelledKeepsTheSession()
{
    m_document->addObject(ZtDrawnType::Line, diagonal);
    const MessageBoxAnswerer boxes(QMessageBox::Save);
    const FileDialogAnswerer dialogs((QString()));
    QVERIFY(!m_commands->openSession(DeskFiles::demoSession()));
    QCOMPARE(dialogs.dialogs().size(), 1);
    QVERIFY(dialogs.dialogs().first().isForSaving);
    QCOMPARE(m_session->objectCount(), 1);
    QVERIFY(m_session->isModified());
}

void KvDeskFileCommandsTest::opensEveryKind_data()
{
    QTest::addColumn<QString>("path");
    QTest::addColumn<int>("objects");
    QTest::addColumn<QString>("message");
    QTest::newRow("session") << DeskFiles::demoSession() << 33
                             << QStringLiteral("Session opened: demo.json (33 object(s))");
    QTest::newRow("image") << DeskFiles::image(QStringLiteral("kind.png")) << 0
                           << QStringLiteral("Image opened: kind.png");
    QTest::newRow("table") << DeskFiles::table(QStringLiteral("kind.csv")) << 2
                           << QStringLiteral("Table imported: kind.csv (2 object(s))");
}

void KvDeskFileCommandsTest::opensEveryKind()
{
    QFETCH(QString, path);
    QFETCH(int, objects);
    QFETCH(QString, message);
    QVERIFY(m_commands->openFile(path));
    QCOMPARE(m_session->objectCount(), objects);
    QCOMPARE(DeskLog::messages(ZtAppStatus::Information), QStringList(message));
    QVERIFY(!QGuiApplication::overrideCursor());
}

void KvDeskFileCommandsTest::faultsAreTold_data()
{
    QTest::addColumn<QString>("path");
    QTest::addColumn<QString>("text");
    QTest::newRow("no such session") << QStringLiteral("/none/a.json")
                                     << QStringLiteral("The session \"a.json\" was not opened.");
    QTest::newRow("no session") << DeskFiles::text(QStringLiteral("b.json"), "[]")
                                << QStringLiteral("The session \"b.json\" was not opened.");
    QTest::newRow("no image") << DeskFiles::text(QStringLiteral("c.png"), "text")
                              << QStringLiteral("The image \"c.png\" was not opened.");
    QTest::newRow("no table") << DeskFiles::text(QStringLiteral("d.csv"), QByteArray("\0\1\2\3", 4))
                              << QStringLiteral("The table \"d.csv\" was not imported.");
    QTest::newRow("empty table") << DeskFiles::text(QStringLiteral("e.csv"), "")
                                 << QStringLiteral("The table \"e.csv\" was not imported.");
}

void KvDeskFileCommandsTest::faultsAreTold()
{
    QFETCH(QString, path);
    QFETCH(QString, text);
    QVERIFY(m_commands->openSession(DeskFiles::demoSession()));
    ZtStatusLog::getInstance()->clear();
    const MessageBoxAnswerer answerer;
    QVERIFY(!m_commands->openFile(path));
    QCOMPARE(answerer.boxes().size(), 1);
    QCOMPARE(answerer.boxes().first().text, text);
    QCOMPARE(answerer.boxes().first().buttons, QMessageBox::StandardButtons(QMessageBox::Ok));
    QVERIFY(answerer.boxes().first().hasParent);
    const QStringList errors = DeskLog::messages(ZtAppStatus::Error);
    QCOMPARE(errors.size(), 1);
    QVERIFY2(errors.first().startsWith(text + QLatin1Char(' ') + path), qPrintable(errors.first()));
    // Nothing of what was there is lost.
    QCOMPARE(m_session->path(), DeskFiles::demoSession());
    QCOMPARE(m_session->objectCount(), 33);
    QVERIFY(!m_session->isModified());
    QVERIFY(!QGuiApplication::overrideCursor());
}

void KvDeskFileCommandsTest::missingImage_data()
{
    QTest::addColumn<int>("answer");
    QTest::addColumn<bool>("isOpen");
    QTest::newRow("open") << static_cast<int>(QMessageBox::Open) << true;
    QTest::newRow("cancel") << static_cast<int>(QMessageBox::Cancel) << false;
}

void KvDeskFileCommandsTest::missingImage()
{
    QFETCH(int, answer);
    QFETCH(bool, isOpen);
    const QString path = DeskFiles::text(
        QStringLiteral("imageless.json"),
        "{\"format\": \"statreport-session\", \"version\": 1, \"image\": \"gone.png\", \"objects\": []}");
    const MessageBoxAnswerer answerer(static_cast<QMessageBox::StandardButton>(answer));
    QCOMPARE(m_commands->openSession(path), isOpen);
    QCOMPARE(answerer.boxes().first().text, QStringLiteral("Open the session without its image?"));
    // Who declines is told what was not opened, and why.
    QCOMPARE(answerer.boxes().size(), isOpen ? 1 : 2);
    QCOMPARE(m_session->path(), isOpen ? path : QString());
}

void KvDeskFileCommandsTest::sessionWithWrongImageEntryIsNoQuestion()
{
    const QString path = DeskFiles::text(
        QStringLiteral("wrong.json"),
        "{\"format\": \"statreport-session\", \"version\": 1, \"image\": 5, \"objects\": []}");
    const MessageBoxAnswerer answerer(QMessageBox::Open);
    QVERIFY(!m_commands->openSession(path));
    QCOMPARE(answerer.boxes().size(), 1);
    QCOMPARE(answerer.boxes().first().text, QStringLiteral("The session \"wrong.json\" was not opened."));
}

void KvDeskFileCommandsTest::saveThatFails()
{
    m_document->addObject(ZtDrawnType::Line, diagonal);
    const MessageBoxAnswerer answerer;
    QVERIFY(!m_commands->saveSession(temporaryPath(QStringLiteral("no folder/a.json"))));
    QCOMPARE(answerer.boxes().size(), 1);
    QCOMPARE(answerer.boxes().first().text, QStringLiteral("The session \"a.json\" was not saved."));
    QVERIFY(m_session->isModified());
    QCOMPARE(KvDeskRecentFiles::paths(), QStringList());
}

void KvDeskFileCommandsTest::notesOfATableAreLogged()
{
    const QString path = DeskFiles::text(QStringLiteral("notes.csv"),
                                         "Object,Length [mm],Remark\nA,1,good\nB,2,bad\nC,3,new\n");
    QVERIFY(m_commands->importTable(path));
    const QStringList warnings = DeskLog::messages(ZtAppStatus::Warning);
    QVERIFY(!warnings.isEmpty());
    QVERIFY2(warnings.first().startsWith(QStringLiteral("notes.csv: ")), qPrintable(warnings.first()));
}

void KvDeskFileCommandsTest::savesWhereItWasSaved()
{
    const QString path = temporaryPath(QStringLiteral("again.json"));
    QVERIFY(m_commands->saveSession(path));
    m_document->addObject(ZtDrawnType::Line, diagonal);
    const FileDialogAnswerer dialogs((QString()));
    QVERIFY(m_commands->slotSaveSession());
    QCOMPARE(dialogs.dialogs().size(), 0);
    QVERIFY(DeskFiles::bytes(path).contains("\"line\""));
}

void KvDeskFileCommandsTest::savesAsWithSuffix()
{
    const FileDialogAnswerer dialogs(temporaryPath(QStringLiteral("named")));
    QVERIFY(m_commands->slotSaveSession());
    QCOMPARE(dialogs.dialogs().size(), 1);
    QCOMPARE(dialogs.dialogs().first().title, QStringLiteral("Save session"));
    QCOMPARE(m_session->path(), temporaryPath(QStringLiteral("named.json")));
    QVERIFY(QFileInfo::exists(temporaryPath(QStringLiteral("named.json"))));
}

void KvDeskFileCommandsTest::choosesFiles_data()
{
    QTest::addColumn<QByteArray>("slot");
    QTest::addColumn<QString>("path");
    QTest::addColumn<QString>("title");
    QTest::addColumn<QString>("filter");
    QTest::addColumn<QString>("message");
    QTest::newRow("session") << QByteArray("slotOpenSession") << DeskFiles::demoSession()
                             << QStringLiteral("Open session") << QStringLiteral("Sessions (*.json)")
                             << QStringLiteral("Session opened: demo.json (33 object(s))");
    QTest::newRow("image") << QByteArray("slotOpenImage") << DeskFiles::image(QStringLiteral("chosen.png"))
                           << QStringLiteral("Open image") << QStringLiteral("Images (")
                           << QStringLiteral("Image opened: chosen.png");
    QTest::newRow("table") << QByteArray("slotImportTable") << DeskFiles::table(QStringLiteral("chosen.csv"))
                           << QStringLiteral("Import table") << QStringLiteral("Tables (*.csv")
                           << QStringLiteral("Table imported: chosen.csv (2 object(s))");
}

void KvDeskFileCommandsTest::choosesFiles()
{
    QFETCH(QByteArray, slot);
    QFETCH(QString, path);
    QFETCH(QString, title);
    QFETCH(QString, filter);
    QFETCH(QString, message);
    const FileDialogAnswerer dialogs(path);
    QVERIFY(QMetaObject::invokeMethod(m_commands.get(), slot.constData()));
    QCOMPARE(dialogs.dialogs().size(), 1);
    QCOMPARE(dialogs.dialogs().first().title, title);
    QVERIFY(dialogs.dialogs().first().filters.first().startsWith(filter));
    QCOMPARE(dialogs.dialogs().first().filters.last(), QStringLiteral("All files (*)"));
    QCOMPARE(DeskLog::messages(ZtAppStatus::Information), QStringList(message));
}

void KvDeskFileCommandsTest::startsWhereTheLastFileWas()
{
    {
        const FileDialogAnswerer dialogs(DeskFiles::image(QStringLiteral("first.png")));
        m_commands->slotOpenImage();
    }
    const FileDialogAnswerer dialogs((QString()));
    m_commands->slotImportTable();
    QCOMPARE(dialogs.dialogs().first().folder,
             QFileInfo(temporaryPath(QStringLiteral("first.png"))).absolutePath());
}

void KvDeskFileCommandsTest::newSessionAsks()
{
    m_document->addObject(ZtDrawnType::Line, diagonal);
    {
        const MessageBoxAnswerer answerer(QMessageBox::Cancel);
        m_commands->slotNewSession();
        QCOMPARE(m_session->objectCount(), 1);
    }
    const MessageBoxAnswerer answerer(QMessageBox::Discard);
    m_commands->slotNewSession();
    QCOMPARE(m_session->objectCount(), 0);
}

void KvDeskFileCommandsTest::recentSessions()
{
    const QString path = temporaryPath(QStringLiteral("recent.json"));
    QVERIFY(m_commands->saveSession(path));
    QVERIFY(m_commands->openSession(DeskFiles::demoSession()));
    QVERIFY(m_commands->openImage(DeskFiles::image(QStringLiteral("recent.png"))));
    QCOMPARE(KvDeskRecentFiles::paths(), QStringList({DeskFiles::demoSession(), path}));
}

void KvDeskFileCommandsTest::dropsAreOpenedByKind()
{
    m_commands->openFiles({DeskFiles::table(QStringLiteral("d.csv")),
                           DeskFiles::image(QStringLiteral("d.png")), DeskFiles::demoSession()});
    QCOMPARE(DeskLog::messages(ZtAppStatus::Information),
             QStringList({QStringLiteral("Session opened: demo.json (33 object(s))"),
                          QStringLiteral("Image opened: d.png"),
                          QStringLiteral("Table imported: d.csv (2 object(s))")}));
    QCOMPARE(m_session->objectCount(), 35);
}

void KvDeskFileCommandsTest::faultsOfDropsAreToldAtOnce()
{
    const MessageBoxAnswerer answerer;
    QStringList files;
    for (int i = 0; i < 12; ++i)
        files.append(DeskFiles::text(QStringLiteral("broken%1.png").arg(i), "text"));
    files.append(DeskFiles::table());
    m_commands->openFiles(files);
    QCOMPARE(answerer.boxes().size(), 1);
    QCOMPARE(answerer.boxes().first().text, QStringLiteral("12 files were not opened."));
    QCOMPARE(DeskLog::messages(ZtAppStatus::Error).size(), 12);
    QCOMPARE(m_session->objectCount(), 2);
    // The next fault is a new one.
    m_commands->openFiles({files.first()});
    QCOMPARE(answerer.boxes().size(), 2);
    QCOMPARE(answerer.boxes().last().text, QStringLiteral("The image \"broken0.png\" was not opened."));
}

void KvDeskFileCommandsTest::secondSessionOfADropIsLeftOut()
{
    const QString other = temporaryPath(QStringLiteral("other.json"));
    QVERIFY(m_commands->saveSession(other));
    m_session->clear();
    m_commands->openFiles({DeskFiles::demoSession(), other});
    QCOMPARE(m_session->path(), DeskFiles::demoSession());
    QCOMPARE(DeskLog::messages(ZtAppStatus::Warning),
             QStringList(QStringLiteral("Only one session can be open; not opened: other.json")));
}

void KvDeskFileCommandsTest::fileOfAnotherProgram_data()
{
    QTest::addColumn<QString>("button");
    QTest::addColumn<QString>("written");
    QTest::newRow("overwrite") << QStringLiteral("Overwrite") << QStringLiteral("shared.json");
    QTest::newRow("save as") << QStringLiteral("Save as...") << QStringLiteral("mine.json");
    QTest::newRow("cancel") << QStringLiteral("Cancel") << QString();
}

void KvDeskFileCommandsTest::fileOfAnotherProgram()
{
    QFETCH(QString, button);
    QFETCH(QString, written);
    const QString path = temporaryPath(QStringLiteral("shared.json"));
    const QString mine = temporaryPath(QStringLiteral("mine.json"));
    QFile::remove(mine);
    QVERIFY(m_commands->saveSession(path));
    m_document->addObject(ZtDrawnType::Line, diagonal);
    const QByteArray theirs = DeskFiles::bytes(path) + "\n\n";
    DeskFiles::text(QStringLiteral("shared.json"), theirs);
    const MessageBoxAnswerer answerer(button);
    const FileDialogAnswerer dialogs(mine);
    QCOMPARE(m_commands->slotSaveSession(), !written.isEmpty());
    QCOMPARE(answerer.boxes().size(), 1);
    QCOMPARE(answerer.boxes().first().text,
             QStringLiteral("\"shared.json\" was changed by another program. Overwrite its changes?"));
    QCOMPARE(DeskFiles::bytes(path) != theirs, written == QStringLiteral("shared.json"));
    QCOMPARE(QFileInfo::exists(mine), written == QStringLiteral("mine.json"));
    QCOMPARE(m_session->isModified(), written.isEmpty());
    // It was decided: no more questions.
    m_document->addObject(ZtDrawnType::Line, diagonal);
    if (!written.isEmpty())
        QVERIFY(m_commands->slotSaveSession());
    QCOMPARE(answerer.boxes().size(), 1);
}

void KvDeskFileCommandsTest::writeProtectedFile_data()
{
    QTest::addColumn<QString>("button");
    QTest::addColumn<bool>("isSaved");
    QTest::newRow("save as") << QStringLiteral("Save as...") << true;
    QTest::newRow("cancel") << QStringLiteral("Cancel") << false;
}

void KvDeskFileCommandsTest::writeProtectedFile()
{
    QFETCH(QString, button);
    QFETCH(bool, isSaved);
    const QString folder = temporaryPath(QStringLiteral("protected") + button.left(4));
    QVERIFY(QDir().mkpath(folder));
    const QString path = folder + QStringLiteral("/protected.json");
    QVERIFY(m_commands->saveSession(path));
    const QByteArray before = DeskFiles::bytes(path);
    m_document->addObject(ZtDrawnType::Line, diagonal);
    QFile::setPermissions(path, QFile::ReadOwner | QFile::ReadGroup | QFile::ReadOther);
    QFile::setPermissions(folder, QFile::Permissions(0x7777));
    const UnprivilegedUser user;
    QVERIFY2(user.isUnprivileged(), "needs a user whom permissions stop");
    const MessageBoxAnswerer answerer(button);
    const FileDialogAnswerer dialogs(folder + QStringLiteral("/elsewhere.json"));
    QCOMPARE(m_commands->slotSaveSession(), isSaved);
    QCOMPARE(answerer.boxes().size(), 1);
    QCOMPARE(answerer.boxes().first().text, QStringLiteral("The session \"protected.json\" was not saved."));
    QCOMPARE(DeskLog::messages(ZtAppStatus::Error),
             QStringList(QStringLiteral("The session \"protected.json\" was not saved. %1: The file is "
                                        "write-protected")
                             .arg(path)));
    QCOMPARE(DeskFiles::bytes(path), before);
    QCOMPARE(m_session->isModified(), !isSaved);
    QCOMPARE(m_session->path(), isSaved ? folder + QStringLiteral("/elsewhere.json") : path);
}

void KvDeskFileCommandsTest::newerVersionIsRefused()
{
    const QString path =
        DeskFiles::text(QStringLiteral("future.json"),
                        "{\"format\": \"statreport-session\", \"version\": 99, \"objects\": {}}");
    const MessageBoxAnswerer answerer;
    QVERIFY(!m_commands->openSession(path));
    QCOMPARE(answerer.boxes().size(), 1);
    QCOMPARE(answerer.boxes().first().text, QStringLiteral("The session \"future.json\" was not opened."));
    const QString sentence = DeskLog::messages(ZtAppStatus::Error).first();
    QVERIFY2(sentence.contains(
                 QStringLiteral("The session is of the newer version 99; this program reads versions "
                                "up to ")),
             qPrintable(sentence));
}

void KvDeskFileCommandsTest::badFilesOfAnySize_data()
{
    QTest::addColumn<QString>("name");
    QTest::addColumn<qint64>("size");
    QTest::addColumn<QString>("reason");
    const qint64 huge = 2LL * 1024 * 1024 * 1024 + 1;
    QTest::newRow("no session") << QStringLiteral("s.json") << qint64(0)
                                << QStringLiteral("The file is empty");
    QTest::newRow("no image") << QStringLiteral("i.png") << qint64(0) << QStringLiteral("the file is empty");
    QTest::newRow("no table") << QStringLiteral("t.csv") << qint64(0) << QStringLiteral("The file is empty");
    QTest::newRow("huge session") << QStringLiteral("s.json") << huge
                                  << QStringLiteral("The file is too large for a session");
    QTest::newRow("huge image") << QStringLiteral("i.png") << huge
                                << QStringLiteral("The picture cannot be decoded");
    QTest::newRow("huge tiff") << QStringLiteral("i.tif") << huge
                               << QStringLiteral("The picture cannot be decoded");
    QTest::newRow("huge table") << QStringLiteral("t.csv") << huge
                                << QStringLiteral("The file is larger than 512 MB");
}

void KvDeskFileCommandsTest::badFilesOfAnySize()
{
    QFETCH(QString, name);
    QFETCH(qint64, size);
    QFETCH(QString, reason);
    QVERIFY(m_commands->openSession(DeskFiles::demoSession()));
    ZtStatusLog::getInstance()->clear();
    // Takes no room on the disk: nobody writes it.
    QFile file(temporaryPath(name));
    QVERIFY(file.open(QIODevice::WriteOnly));
    QVERIFY(file.resize(size));
    file.close();
    const MessageBoxAnswerer answerer;
    QElapsedTimer clock;
    clock.start();
    QVERIFY(!m_commands->openFile(file.fileName()));
    QVERIFY2(clock.elapsed() < 10000, qPrintable(QString::number(clock.elapsed())));
    QCOMPARE(answerer.boxes().size(), 1);
    const QString error = DeskLog::messages(ZtAppStatus::Error).value(0);
    QVERIFY2(error.contains(reason), qPrintable(error));
    QCOMPARE(m_session->objectCount(), 33);
    QVERIFY(!m_session->isModified());
    QFile::remove(file.fileName());
}

void KvDeskFileCommandsTest::cutSessionsLoseNothing()
{
    const QByteArray whole = DeskFiles::bytes(DeskFiles::demoSession());
    m_document->addObject(ZtDrawnType::Line, diagonal);
    m_session->setUnmodified();
    const MessageBoxAnswerer answerer;
    for (const int percent : {1, 25, 50, 75, 99}) {
        const QString path =
            DeskFiles::text(QStringLiteral("cut.json"), whole.left(whole.size() * percent / 100));
        QVERIFY(!m_commands->openSession(path));
        QCOMPARE(m_session->objectCount(), 1);
        QCOMPARE(DeskFiles::bytes(path).size(), whole.size() * percent / 100);
    }
    QCOMPARE(answerer.boxes().size(), 5);
}

void KvDeskFileCommandsTest::cancelWhenShown(QTimer *timer)
{
    connect(timer, &QTimer::timeout, this, [this]() {
        if (m_commands->progress()->isVisibleTo(&m_window))
            m_commands->progress()->cancelButton()->click();
    });
    timer->start(5);
}

// Fast machines are done before anything is shown.
void KvDeskFileCommandsTest::cancelSoon(QTimer *timer)
{
    connect(timer, SIGNAL(timeout()), m_commands->progress()->cancelButton(), SLOT(click()));
    timer->start(1);
}

void KvDeskFileCommandsTest::longWorkCanBeCancelled_data()
{
    QTest::addColumn<QString>("name");
    QTest::addColumn<QString>("message");
    QTest::newRow("table") << QStringLiteral("fifo.csv")
                           << QStringLiteral("The table \"fifo.csv\" was not imported.");
}

void KvDeskFileCommandsTest::longWorkCanBeCancelled()
{
    QFETCH(QString, name);
    QFETCH(QString, message);
    QVERIFY(m_commands->openSession(DeskFiles::demoSession()));
    ZtStatusLog::getInstance()->clear();
    // Reading it takes until somebody writes to it: as long as the test wants.
    const QByteArray path = QFile::encodeName(temporaryPath(name));
    QCOMPARE(mkfifo(path.constData(), 0600), 0);
    QTimer timer;
    cancelWhenShown(&timer);
    const MessageBoxAnswerer answerer;
    QElapsedTimer clock;
    clock.start();
    QVERIFY(!m_commands->importTable(temporaryPath(name)));
    QVERIFY(clock.elapsed() >= KvDeskProgress::delayMs - 50);
    QCOMPARE(answerer.boxes().size(), 0);
    QCOMPARE(DeskLog::messages(ZtAppStatus::Information), QStringList(message));
    QCOMPARE(DeskLog::messages(ZtAppStatus::Error), QStringList());
    QCOMPARE(m_session->objectCount(), 33);
    QVERIFY(!m_session->isModified());
    // The thread that still waits is let go.
    QFile writer(temporaryPath(name));
    QVERIFY(writer.open(QIODevice::WriteOnly));
}

void KvDeskFileCommandsTest::millionRows_data()
{
    QTest::addColumn<QString>("name");
    QTest::addColumn<QByteArray>("start");
    QTest::addColumn<QByteArray>("row");
    QTest::addColumn<QByteArray>("end");
    QTest::newRow("separated") << QStringLiteral("million.csv") << QByteArray("Name,Length [mm]\n")
                               << QByteArray("A,1.5\n") << QByteArray();
    const QByteArray record = R"({"Name":"A","Length [mm]":1.5})";
    QTest::newRow("records") << QStringLiteral("million.json") << "[" + record << ",\n" + record
                             << QByteArray("]");
    const QByteArray object = R"({"type":"Line","index":1,"name":"A","values":[)"
                              R"({"name":"Length","unit":"mm","value":1.5}]})";
    QTest::newRow("exported values") << QStringLiteral("values.json")
                                     << R"({"format":"statreport-values","version":1,"objects":[)" + object
                                     << ",\n" + object << QByteArray("]}");
}

void KvDeskFileCommandsTest::millionRows()
{
    constexpr int rows = 1000000;
    QFETCH(QString, name);
    QFETCH(QByteArray, start);
    QFETCH(QByteArray, row);
    QFETCH(QByteArray, end);
    const QString path = temporaryPath(name);
    QFile file(path);
    QVERIFY(file.open(QIODevice::WriteOnly));
    file.write(start);
    // What JSON starts with has the first row.
    for (int i = end.isEmpty() ? 0 : 1; i < rows; ++i)
        file.write(row);
    file.write(end);
    file.close();
    // What happens while the thread works shows that the interface lives.
    int ticks = 0;
    double fraction = 0.0;
    QTimer timer;
    connect(&timer, &QTimer::timeout, this, [&]() {
        ticks += m_commands->progress()->isRunning() ? 1 : 0;
        fraction = qMax(fraction, m_commands->progress()->bar()->value() / 1000.0);
    });
    timer.start(20);
    {
        QTimer canceller;
        cancelSoon(&canceller);
        QVERIFY(!m_commands->importTable(path));
        QCOMPARE(m_session->objectCount(), 0);
        QVERIFY(!m_session->isModified());
    }
    QVERIFY(m_commands->importTable(path));
    QVERIFY(ticks > 5);
    QCOMPARE(m_session->objectCount(), rows);
    QVERIFY(fraction > 0.2);
    QFile::remove(path);
}

void KvDeskFileCommandsTest::largeSessionIsSavedAndRead()
{
    constexpr int rows = 50000;
    QByteArray table = "Name,Length [mm]\n";
    for (int i = 0; i < rows; ++i)
        table += "A" + QByteArray::number(i) + ",1.5\n";
    QVERIFY(m_commands->importTable(DeskFiles::text(QStringLiteral("large.csv"), table)));
    const QString path = temporaryPath(QStringLiteral("large.json"));
    QVERIFY(m_commands->saveSession(path));
    QVERIFY(!m_session->isModified());
    m_session->clear();
    QVERIFY(m_commands->openSession(path));
    QCOMPARE(m_session->objectCount(), rows);
}

// The thread of the interface waits in between, so its own processor time is what holds it up at most.
void KvDeskFileCommandsTest::largeSessionsHoldNothingUp()
{
    constexpr int rows = 150000;
    QByteArray table = "Name,Length [mm],Width [mm]\n";
    for (int i = 0; i < rows; ++i)
        table += "A" + QByteArray::number(i) + ",1.5,2\n";
    const QString csv = DeskFiles::text(QStringLiteral("smooth.csv"), table);
    const QString path = temporaryPath(QStringLiteral("smooth.json"));
    const auto isQuick = [](const std::function<bool()> &work) {
        const qint64 before = threadMs();
        return work() && threadMs() - before < 150;
    };
    QVERIFY(isQuick([&]() { return m_commands->importTable(csv); }));
    QVERIFY(isQuick([&]() { return m_commands->saveSession(path); }));
    QVERIFY(isQuick([&]() { return m_commands->openSession(path); }));
    QCOMPARE(m_session->objectCount(), rows);
    QVERIFY(isQuick([&]() {
        m_session->clear();
        return true;
    }));
}

void KvDeskFileCommandsTest::savingCanBeCancelled()
{
    constexpr int rows = 400000;
    QByteArray table = "Name,Length [mm]\n";
    for (int i = 0; i < rows; ++i)
        table += "A" + QByteArray::number(i) + ",1.5\n";
    const QString path = temporaryPath(QStringLiteral("cancelled.json"));
    QVERIFY(m_commands->saveSession(path));
    const QByteArray before = DeskFiles::bytes(path);
    QVERIFY(m_commands->importTable(DeskFiles::text(QStringLiteral("cancelled.csv"), table)));
    ZtStatusLog::getInstance()->clear();
    const MessageBoxAnswerer answerer;
    // Handled as soon as the wait for the writer begins, before any word from it.
    QMetaObject::invokeMethod(m_commands->progress()->cancelButton(), "click", Qt::QueuedConnection);
    QVERIFY(!m_commands->saveSession(path));
    QCOMPARE(answerer.boxes().size(), 0);
    QCOMPARE(DeskLog::messages(ZtAppStatus::Information),
             QStringList(QStringLiteral("The session \"cancelled.json\" was not saved.")));
    QCOMPARE(DeskFiles::bytes(path), before);
    QVERIFY(m_session->isModified());
    QVERIFY(!m_session->isChangedOnDisk());
    QVERIFY(m_commands->saveSession(path));
    QVERIFY(!m_session->isModified());
}

STATREPORT_TEST_MAIN(KvDeskFileCommandsTest)
#include "KvDeskFileCommandsTest.moc"
