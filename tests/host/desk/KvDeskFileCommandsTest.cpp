// SPDX-License-Identifier: MIT
#include "KvDeskFileCommands.h"

#include "DeskFiles.h"
#include "DeskLog.h"
#include "FileDialogAnswerer.h"
#include "KvDeskRecentFiles.h"
#include "KvDeskSession.h"
#include "host/measuring/Polygon.h"
#include "kernel/ZtAppSettings.h"
#include "measuring/ZtDrawnType.h"
#include "measuring/ZtMeasuringDocument.h"
#include "support/MessageBoxAnswerer.h"

namespace {

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

private:
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
                             << QStringLiteral("Session opened: demo.json (objects: 33)");
    QTest::newRow("image") << DeskFiles::image(QStringLiteral("kind.png")) << 0
                           << QStringLiteral("Image opened: kind.png");
    QTest::newRow("table") << DeskFiles::table(QStringLiteral("kind.csv")) << 2
                           << QStringLiteral("Table imported: kind.csv (objects: 2)");
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
                             << QStringLiteral("Session opened: demo.json (objects: 33)");
    QTest::newRow("image") << QByteArray("slotOpenImage") << DeskFiles::image(QStringLiteral("chosen.png"))
                           << QStringLiteral("Open image") << QStringLiteral("Images (")
                           << QStringLiteral("Image opened: chosen.png");
    QTest::newRow("table") << QByteArray("slotImportTable") << DeskFiles::table(QStringLiteral("chosen.csv"))
                           << QStringLiteral("Import table") << QStringLiteral("Tables (*.csv")
                           << QStringLiteral("Table imported: chosen.csv (objects: 2)");
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

STATREPORT_TEST_MAIN(KvDeskFileCommandsTest)
#include "KvDeskFileCommandsTest.moc"
