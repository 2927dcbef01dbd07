// SPDX-License-Identifier: MIT
#include "measuring/ZtLoadedSession.h"

#include "measuring/ZtProgress.h"
#include "measuring/ZtTableImport.h"
#include "measuring/ZtWorkerThread.h"
#include "support/StatReportTest.h"

#include <QThread>

namespace {

const int manyRows = 5 * static_cast<int>(ZtProgress::stride);

QString write(const QString &name, const QByteArray &bytes)
{
    const QString path = StatReportTest::temporaryPath(name);
    QFile file(path);
    if (!file.open(QIODevice::WriteOnly) || file.write(bytes) != bytes.size())
        qCritical("cannot write %s", qPrintable(path));
    return path;
}

QByteArray session(const QByteArray &members)
{
    return "{\"format\":\"statreport-session\",\"version\":1," + members + "}";
}

QByteArray manyObjects()
{
    QByteArray objects;
    for (int i = 1; i <= manyRows; ++i)
        objects += (i > 1 ? "," : "") + QByteArray("{\"type\":\"line\",\"points\":[[0,0],[1,1]],\"id\":") +
                   QByteArray::number(i) + '}';
    return session("\"objects\":[" + objects + "]");
}

QByteArray manyTableRows(const QByteArray &header = "Name,Length [mm]\n")
{
    QByteArray table = header;
    for (int i = 0; i < manyRows; ++i)
        table += "A" + QByteArray::number(i) + ",1.5\n";
    return table;
}

// As a thread sees it: how far the work was when it was cancelled, from the bar's point of view.
class CancellingDevice : public QBuffer
{
public:
    CancellingDevice(QByteArray *bytes, ZtProgress *progress)
        : QBuffer(bytes)
        , m_progress(progress)
    {
        open(QIODevice::ReadOnly);
    }

protected:
    qint64 readData(char *data, qint64 count) override
    {
        m_progress->cancel();
        return QBuffer::readData(data, count);
    }

private:
    ZtProgress *m_progress;
};

} // namespace

class ZtLoadedSessionTest : public StatReportTest
{
    Q_OBJECT
private slots:
    void readsSessionAndImage();
    void tellsWhyTheImageIsMissing();
    void tellsFaultsOfTheFile();
    void imageBelongsToTheApplication();
    void cancelledSessionsAreFaults_data();
    void cancelledSessionsAreFaults();
    void cancelledTablesAreFaults_data();
    void cancelledTablesAreFaults();
    void tablesAreCancelledWhileTheyAreRead();
    void countsToTheEnd();

private:
    ZtFault m_fault;
};

void ZtLoadedSessionTest::readsSessionAndImage()
{
    ZtLoadedSession loaded;
    const QString demo = sourcePath(QStringLiteral("examples/sessions/demo.json"));
    QVERIFY2(loaded.read(demo, &m_fault), qPrintable(m_fault.text()));
    QVERIFY(loaded.image);
    QVERIFY(loaded.imageFault.isNull());
    QCOMPARE(loaded.image->path(), loaded.session.imagePath);
    QVERIFY(!loaded.session.objects.isEmpty());
}

void ZtLoadedSessionTest::tellsWhyTheImageIsMissing()
{
    ZtLoadedSession loaded;
    QVERIFY(loaded.read(write(QStringLiteral("gone.json"), session("\"image\":\"gone.png\"")), &m_fault));
    QVERIFY(!loaded.image);
    QCOMPARE(loaded.imageFault.text(),
             temporaryPath(QStringLiteral("gone.png")) + QStringLiteral(": The picture does not exist"));
}

void ZtLoadedSessionTest::tellsFaultsOfTheFile()
{
    ZtLoadedSession loaded;
    QVERIFY(!loaded.read(write(QStringLiteral("cut.json"), session("\"objects\":[").left(40)), &m_fault));
    QCOMPARE(m_fault.file, temporaryPath(QStringLiteral("cut.json")));
    QVERIFY(!m_fault.isNull());
}

void ZtLoadedSessionTest::imageBelongsToTheApplication()
{
    ZtLoadedSession loaded;
    const auto thread = ZtWorkerThread::begin([this, &loaded]() {
        loaded.read(sourcePath(QStringLiteral("examples/sessions/demo.json")), &m_fault);
    });
    QVERIFY(thread->wait(30000));
    QVERIFY(loaded.image);
    QCOMPARE(loaded.image->thread(), QThread::currentThread());
}

void ZtLoadedSessionTest::cancelledSessionsAreFaults_data()
{
    QTest::addColumn<QByteArray>("bytes");
    QTest::newRow("small") << session("\"objects\":[]");
    QTest::newRow("large") << manyObjects();
}

void ZtLoadedSessionTest::cancelledSessionsAreFaults()
{
    QFETCH(QByteArray, bytes);
    const QString path = write(QStringLiteral("cancelled.json"), bytes);
    ZtProgress progress;
    progress.cancel();
    ZtSession read;
    QVERIFY(!ZtSession::load(path, &read, &m_fault, &progress));
    QCOMPARE(m_fault.text(), path + QStringLiteral(": Reading was cancelled"));
    QVERIFY(!ZtSession::parse(bytes, path, &read, &m_fault, &progress));
    QCOMPARE(m_fault.text(), path + QStringLiteral(": Reading was cancelled"));
    QVERIFY(read.objects.isEmpty());
}

void ZtLoadedSessionTest::cancelledTablesAreFaults_data()
{
    QTest::addColumn<QByteArray>("bytes");
    QTest::newRow("wide") << QByteArray("Name,Length\nA,1\n");
    QTest::newRow("large wide") << manyTableRows();
    QTest::newRow("large tidy") << manyTableRows("Parameter,Value\n");
}

void ZtLoadedSessionTest::cancelledTablesAreFaults()
{
    QFETCH(QByteArray, bytes);
    const QString path = write(QStringLiteral("cancelled.csv"), bytes);
    ZtProgress progress;
    progress.cancel();
    ZtImportedTable table;
    QVERIFY(!ZtTableImport::readFile(path, ZtTableImportOptions(), &table, &m_fault, &progress));
    QVERIFY2(m_fault.message == QStringLiteral("Reading was cancelled"), qPrintable(m_fault.text()));
    QVERIFY(!ZtTableImport::parse(bytes, path, ZtTableImportOptions(), &table, &m_fault, &progress));
    QVERIFY2(m_fault.message == QStringLiteral("Reading was cancelled"), qPrintable(m_fault.text()));
    QVERIFY(table.types.isEmpty());
}

void ZtLoadedSessionTest::tablesAreCancelledWhileTheyAreRead()
{
    QByteArray bytes = manyTableRows();
    ZtProgress progress;
    CancellingDevice device(&bytes, &progress);
    ZtImportedTable table;
    QVERIFY(!ZtTableImport::readDevice(&device, QStringLiteral("t.csv"), ZtTableImportOptions(), &table,
                                       &m_fault, &progress));
    QCOMPARE(m_fault.text(), QStringLiteral("t.csv: Reading was cancelled"));
}

void ZtLoadedSessionTest::countsToTheEnd()
{
    ZtProgress progress;
    ZtSession read;
    QVERIFY(ZtSession::parse(manyObjects(), QStringLiteral("/a.json"), &read, &m_fault, &progress));
    QCOMPARE(read.objects.size(), manyRows);
    QVERIFY(progress.fraction() > 0.8);
    ZtProgress ofTable;
    ZtImportedTable table;
    QVERIFY(ZtTableImport::parse(manyTableRows(), QStringLiteral("/a.csv"), ZtTableImportOptions(), &table,
                                 &m_fault, &ofTable));
    QCOMPARE(table.objectCount(), manyRows);
    QVERIFY(ofTable.fraction() > 0.75);
    QVERIFY(ofTable.fraction() <= 0.9);
}

STATREPORT_TEST_MAIN(ZtLoadedSessionTest)
#include "ZtLoadedSessionTest.moc"
