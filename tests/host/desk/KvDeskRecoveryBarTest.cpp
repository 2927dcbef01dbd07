// SPDX-License-Identifier: MIT
#include "KvDeskRecoveryBar.h"

#include "KvDeskFileCommands.h"
#include "KvDeskRecovery.h"
#include "KvDeskSession.h"
#include "RecoveryCopies.h"
#include "kernel/ZtAppSettings.h"
#include "measuring/ZtMeasuringDocument.h"

#include <QMenu>
#include <QPushButton>
#include <QToolButton>

class KvDeskRecoveryBarTest : public StatReportTest
{
    Q_OBJECT
private slots:
    void init();
    void cleanup();

    void hiddenWithoutACopy();
    void offersOneCopy();
    void offersTheNewestOfSeveral();
    void anotherOneIsChosen();
    void buttonsAreReachedByKeys();

private:
    QString sentence(int index) const;

    QString m_folder;
    QWidget m_window;
    std::unique_ptr<ZtMeasuringDocument> m_document;
    std::unique_ptr<KvDeskSession> m_session;
    std::unique_ptr<KvDeskFileCommands> m_files;
    std::unique_ptr<KvDeskRecovery> m_recovery;
    std::unique_ptr<KvDeskRecoveryBar> m_bar;
};

void KvDeskRecoveryBarTest::init()
{
    StatReportTest::init();
    ZtAppSettings::getInstance()->setStoragePath(QString());
    m_folder = temporaryPath(QString::fromLatin1(QTest::currentTestFunction()));
    m_document = std::make_unique<ZtMeasuringDocument>();
    m_session = std::make_unique<KvDeskSession>(m_document.get());
    m_files = std::make_unique<KvDeskFileCommands>(m_session.get(), &m_window);
    m_recovery = std::make_unique<KvDeskRecovery>(m_session.get(), m_files.get());
    m_bar = std::make_unique<KvDeskRecoveryBar>(m_recovery.get());
}

void KvDeskRecoveryBarTest::cleanup()
{
    m_bar.reset();
    m_recovery.reset();
    m_files.reset();
    m_session.reset();
    m_document.reset();
    StatReportTest::cleanup();
}

QString KvDeskRecoveryBarTest::sentence(int index) const
{
    // Of today the time is enough.
    const QDateTime time = m_recovery->at(index).time.toLocalTime();
    return QStringLiteral("Measurements from %1 were not saved.")
        .arg(time.date() == QDate::currentDate() ? QLocale().toString(time.time(), QLocale::ShortFormat)
                                                 : QLocale().toString(time, QLocale::ShortFormat));
}

void KvDeskRecoveryBarTest::hiddenWithoutACopy()
{
    QVERIFY(m_bar->isHidden());
    m_recovery->find(m_folder);
    QVERIFY(m_bar->isHidden());
}

void KvDeskRecoveryBarTest::offersOneCopy()
{
    RecoveryCopies::add(m_folder, QStringLiteral("a"), 2, 90);
    m_recovery->find(m_folder);
    QVERIFY(!m_bar->isHidden());
    QCOMPARE(m_bar->text(), sentence(0));
    QVERIFY(m_bar->othersButton()->isHidden());
    QCOMPARE(m_bar->restoreButton()->text(), QStringLiteral("Restore"));
    QCOMPARE(m_bar->discardButton()->text(), QStringLiteral("Discard"));
    m_bar->restoreButton()->click();
    QCOMPARE(m_session->objectCount(), 2);
    QVERIFY(m_bar->isHidden());
}

void KvDeskRecoveryBarTest::offersTheNewestOfSeveral()
{
    RecoveryCopies::add(m_folder, QStringLiteral("a"), 1, 3000);
    RecoveryCopies::add(m_folder, QStringLiteral("b"), 2, 0);
    m_recovery->find(m_folder);
    QCOMPARE(m_bar->text(), sentence(0));
    QVERIFY(!m_bar->othersButton()->isHidden());
    QCOMPARE(m_bar->othersButton()->text(), QStringLiteral("1 more"));
    QCOMPARE(m_bar->othersButton()->menu()->actions().size(), 2);
    m_bar->discardButton()->click();
    QVERIFY(!m_bar->isHidden());
    QVERIFY(m_bar->othersButton()->isHidden());
    QCOMPARE(m_recovery->at(0).objectCount, 1);
    QCOMPARE(m_bar->text(), sentence(0));
    m_bar->discardButton()->click();
    QVERIFY(m_bar->isHidden());
    QCOMPARE(QDir(m_folder).entryList(QDir::Files), QStringList());
    QCOMPARE(m_session->objectCount(), 0);
}

void KvDeskRecoveryBarTest::anotherOneIsChosen()
{
    RecoveryCopies::add(m_folder, QStringLiteral("a"), 1, 3000, QStringLiteral("/x/this & that.json"));
    RecoveryCopies::add(m_folder, QStringLiteral("b"), 2, 0);
    m_recovery->find(m_folder);
    const QList<QAction *> actions = m_bar->othersButton()->menu()->actions();
    QVERIFY(actions.at(1)->text().endsWith(QStringLiteral(": this && that.json (1 object(s))")));
    actions.at(1)->trigger();
    QCOMPARE(m_bar->text(), sentence(1));
    m_bar->restoreButton()->click();
    QCOMPARE(m_session->objectCount(), 1);
    QCOMPARE(m_recovery->count(), 1);
    QCOMPARE(m_bar->text(), sentence(0));
}

void KvDeskRecoveryBarTest::buttonsAreReachedByKeys()
{
    RecoveryCopies::add(m_folder, QStringLiteral("a"), 1, 3000);
    RecoveryCopies::add(m_folder, QStringLiteral("b"), 2, 0);
    m_recovery->find(m_folder);
    m_bar->show();
    m_bar->activateWindow();
    QVERIFY(QTest::qWaitForWindowActive(m_bar.get()));
    m_bar->restoreButton()->setFocus();
    QTest::keyClick(m_bar->restoreButton(), Qt::Key_Tab);
    QCOMPARE(QApplication::focusWidget(), m_bar->discardButton());
    for (QAbstractButton *const button : m_bar->findChildren<QAbstractButton *>())
        QVERIFY(!button->toolTip().isEmpty() && !button->text().isEmpty());
}

STATREPORT_TEST_MAIN(KvDeskRecoveryBarTest)
#include "KvDeskRecoveryBarTest.moc"
