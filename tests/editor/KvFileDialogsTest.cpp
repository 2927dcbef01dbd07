// SPDX-License-Identifier: MIT
#include "editor/KvFileDialogs.h"
#include "support/FileDialogAnswerer.h"
#include "support/MessageBoxAnswerer.h"
#include "support/StatReportTest.h"

namespace {

void touch(const QString &path)
{
    QFile file(path);
    QVERIFY(file.open(QIODevice::WriteOnly));
}

} // namespace

class KvFileDialogsTest : public StatReportTest
{
    Q_OBJECT

private slots:
    void init();

    void appendsTheSuffix_data();
    void appendsTheSuffix();
    void openDialogLooksLikeThat();
    void saveDialogLooksLikeThat();
    void startsInTheNearestFolder_data();
    void startsInTheNearestFolder();
    void openReturnsTheFile();
    void cancelReturnsNothing();
    void savedNamesGetTheSuffix_data();
    void savedNamesGetTheSuffix();
    void asksBeforeItOverwritesWhatItNamed_data();
    void asksBeforeItOverwritesWhatItNamed();
    void noGoesBackToTheDialog();
    void asksOnceWhereTheDialogAsked();

private:
    KvFileQuestion question(const QString &suffix = QStringLiteral("rtp")) const
    {
        return {QStringLiteral("Choose file to save"), m_directory,
                QStringLiteral("Report template file (*.rtp)"), suffix, QString()};
    }
    QString inDirectory(const QString &name) const { return m_directory + QLatin1Char('/') + name; }

    QString m_directory;
};

void KvFileDialogsTest::init()
{
    StatReportTest::init();
    static int count = 0;
    m_directory = temporaryPath(QStringLiteral("dialogs%1").arg(++count));
    QVERIFY(QDir().mkpath(m_directory));
}

void KvFileDialogsTest::appendsTheSuffix_data()
{
    QTest::addColumn<QString>("path");
    QTest::addColumn<QString>("result");
    QTest::newRow("none") << QStringLiteral("/t/a") << QStringLiteral("/t/a.rtp");
    QTest::newRow("right") << QStringLiteral("/t/a.rtp") << QStringLiteral("/t/a.rtp");
    QTest::newRow("complete suffix counts")
        << QStringLiteral("/t/a.b.rtp") << QStringLiteral("/t/a.b.rtp.rtp");
    QTest::newRow("case counts") << QStringLiteral("/t/a.RTP") << QStringLiteral("/t/a.RTP.rtp");
    QTest::newRow("other") << QStringLiteral("/t/a.txt") << QStringLiteral("/t/a.txt.rtp");
    QTest::newRow("dots in folders") << QStringLiteral("/t.rtp/a") << QStringLiteral("/t.rtp/a.rtp");
}

void KvFileDialogsTest::appendsTheSuffix()
{
    QFETCH(QString, path);
    QTEST(KvFileDialogs::withSuffix(path, QStringLiteral("rtp")), "result");
}

void KvFileDialogsTest::openDialogLooksLikeThat()
{
    QWidget window;
    const FileDialogAnswerer answerer;
    KvFileDialogs::openFileName(&window, question());
    QCOMPARE(answerer.dialogs().size(), 1);
    const SeenFileDialog &dialog = answerer.dialogs().first();
    QCOMPARE(dialog.caption, QStringLiteral("Choose file to save"));
    QCOMPARE(dialog.directory, m_directory);
    QCOMPARE(dialog.filters, QStringList(QStringLiteral("Report template file (*.rtp)")));
    QCOMPARE(dialog.acceptMode, QFileDialog::AcceptOpen);
    QCOMPARE(dialog.fileMode, QFileDialog::AnyFile);
    QCOMPARE(dialog.viewMode, QFileDialog::Detail);
    QVERIFY(!dialog.isNative);
    QVERIFY(dialog.isModal);
    QVERIFY(dialog.hasParent);
}

void KvFileDialogsTest::saveDialogLooksLikeThat()
{
    KvFileQuestion asked = question();
    asked.fileName = QStringLiteral("mine.rtp");
    const FileDialogAnswerer answerer;
    KvFileDialogs::saveFileName(nullptr, asked);
    QCOMPARE(answerer.dialogs().size(), 1);
    const SeenFileDialog &dialog = answerer.dialogs().first();
    QCOMPARE(dialog.caption, QStringLiteral("Choose file to save"));
    QCOMPARE(dialog.directory, m_directory);
    QCOMPARE(dialog.filters, QStringList(QStringLiteral("Report template file (*.rtp)")));
    QCOMPARE(dialog.acceptMode, QFileDialog::AcceptSave);
    QCOMPARE(dialog.fileMode, QFileDialog::AnyFile);
    QCOMPARE(dialog.viewMode, QFileDialog::Detail);
    QCOMPARE(dialog.defaultSuffix, QStringLiteral("rtp"));
    QCOMPARE(dialog.acceptLabel, QStringLiteral("Save"));
    QCOMPARE(dialog.suggestedName, QStringLiteral("mine.rtp"));
    QVERIFY(!dialog.isNative);
}

void KvFileDialogsTest::startsInTheNearestFolder_data()
{
    QTest::addColumn<QString>("missing");
    QTest::newRow("it is there") << QString();
    QTest::newRow("gone") << QStringLiteral("/Documents");
    QTest::newRow("and the one above") << QStringLiteral("/Home/Documents");
}

// Else the dialog would propose the folder's name for the file.
void KvFileDialogsTest::startsInTheNearestFolder()
{
    QFETCH(QString, missing);
    KvFileQuestion asked = question();
    asked.directory += missing;
    QString shownFolder;
    QString shownName;
    QTimer::singleShot(0, qApp, [&]() {
        auto *const dialog = qobject_cast<QFileDialog *>(QApplication::activeModalWidget());
        shownFolder = dialog->directory().absolutePath();
        shownName = dialog->findChild<QLineEdit *>(QStringLiteral("fileNameEdit"))->text();
        dialog->reject();
    });
    QCOMPARE(KvFileDialogs::saveFileName(nullptr, asked), QString());
    QCOMPARE(shownFolder, QDir(m_directory).absolutePath());
    QCOMPARE(shownName, QString());
}

void KvFileDialogsTest::openReturnsTheFile()
{
    const QString path = inDirectory(QStringLiteral("a.rtp"));
    touch(path);
    const FileDialogAnswerer answerer(path);
    QCOMPARE(KvFileDialogs::openFileName(nullptr, question()), path);
}

void KvFileDialogsTest::cancelReturnsNothing()
{
    const FileDialogAnswerer answerer;
    QVERIFY(KvFileDialogs::openFileName(nullptr, question()).isEmpty());
    QVERIFY(KvFileDialogs::saveFileName(nullptr, question()).isEmpty());
    QCOMPARE(answerer.dialogs().size(), 2);
}

void KvFileDialogsTest::savedNamesGetTheSuffix_data()
{
    QTest::addColumn<QString>("suffix");
    QTest::addColumn<QString>("typed");
    QTest::addColumn<QString>("saved");
    const QString rtp = QStringLiteral("rtp");
    const QString pdf = QStringLiteral("pdf");
    QTest::newRow("none") << rtp << QStringLiteral("a") << QStringLiteral("a.rtp");
    QTest::newRow("right") << rtp << QStringLiteral("a.rtp") << QStringLiteral("a.rtp");
    QTest::newRow("complete suffix counts")
        << rtp << QStringLiteral("a.b.rtp") << QStringLiteral("a.b.rtp.rtp");
    QTest::newRow("case counts") << rtp << QStringLiteral("a.RTP") << QStringLiteral("a.RTP.rtp");
    QTest::newRow("pdf") << pdf << QStringLiteral("a") << QStringLiteral("a.pdf");
    QTest::newRow("date in a pdf's name")
        << pdf << QStringLiteral("2024.05.pdf") << QStringLiteral("2024.05.pdf.pdf");
}

void KvFileDialogsTest::savedNamesGetTheSuffix()
{
    QFETCH(QString, suffix);
    QFETCH(QString, typed);
    QFETCH(QString, saved);
    const FileDialogAnswerer answerer(inDirectory(typed));
    const MessageBoxAnswerer boxes;
    QCOMPARE(KvFileDialogs::saveFileName(nullptr, question(suffix)), inDirectory(saved));
    QCOMPARE(boxes.boxes().size(), 0);
}

void KvFileDialogsTest::asksBeforeItOverwritesWhatItNamed_data()
{
    QTest::addColumn<QString>("typed");
    QTest::addColumn<QString>("existing");
    QTest::addColumn<int>("boxes");
    const QString appended = QStringLiteral("a.b.rtp.rtp");
    QTest::newRow("existing, suffix appended here") << QStringLiteral("a.b.rtp") << appended << 1;
    QTest::newRow("the typed name is another file") << QStringLiteral("a.b.rtp") << QString() << 0;
    QTest::newRow("existing, suffix appended by the dialog")
        << QStringLiteral("c") << QStringLiteral("c.rtp") << 1;
}

void KvFileDialogsTest::asksBeforeItOverwritesWhatItNamed()
{
    QFETCH(QString, typed);
    QFETCH(QString, existing);
    QFETCH(int, boxes);
    if (!existing.isEmpty())
        touch(inDirectory(existing));
    const FileDialogAnswerer answerer(inDirectory(typed));
    const MessageBoxAnswerer answers(QMessageBox::Yes);
    QVERIFY(!KvFileDialogs::saveFileName(nullptr, question()).isEmpty());
    QCOMPARE(answers.boxes().size(), boxes);
    if (boxes > 0) {
        QVERIFY(answers.boxes().first().text.contains(QStringLiteral("already exists")));
        QVERIFY(answers.boxes().first().text.contains(existing));
    }
}

void KvFileDialogsTest::noGoesBackToTheDialog()
{
    touch(inDirectory(QStringLiteral("a.b.rtp.rtp")));
    const FileDialogAnswerer answerer(
        {inDirectory(QStringLiteral("a.b.rtp")), inDirectory(QStringLiteral("new.rtp"))});
    const MessageBoxAnswerer answers(QMessageBox::No);
    QCOMPARE(KvFileDialogs::saveFileName(nullptr, question()), inDirectory(QStringLiteral("new.rtp")));
    QCOMPARE(answers.boxes().size(), 1);
    const SeenMessageBox &box = answers.boxes().first();
    QCOMPARE(box.title, QStringLiteral("Choose file to save"));
    QCOMPARE(box.text, QStringLiteral("%1 already exists.\nDo you want to replace it?")
                           .arg(inDirectory(QStringLiteral("a.b.rtp.rtp"))));
    QCOMPARE(box.icon, QMessageBox::Warning);
    QCOMPARE(box.buttons, QMessageBox::Yes | QMessageBox::No);
    QVERIFY(box.isModal);
    QCOMPARE(answerer.dialogs().size(), 2);
}

void KvFileDialogsTest::asksOnceWhereTheDialogAsked()
{
    touch(inDirectory(QStringLiteral("a.rtp")));
    const FileDialogAnswerer answerer(inDirectory(QStringLiteral("a.rtp")));
    const MessageBoxAnswerer answers(QMessageBox::Yes);
    QCOMPARE(KvFileDialogs::saveFileName(nullptr, question()), inDirectory(QStringLiteral("a.rtp")));
    QCOMPARE(answers.boxes().size(), 1);
}

STATREPORT_TEST_MAIN(KvFileDialogsTest)
#include "KvFileDialogsTest.moc"
