// SPDX-License-Identifier: MIT
#include "KvDeskGuideWindow.h"

#include "GuideFile.h"
#include "KvDeskGuideText.h"
#include "KvDeskResources.h"
#include "common/ZtAppStatus.h"
#include "kernel/ZtAppSettings.h"

#include <QAction>
#include <QLabel>
#include <QLineEdit>
#include <QListWidget>
#include <QToolButton>

class KvDeskGuideWindowTest : public StatReportTest
{
    Q_OBJECT

private slots:
    void initTestCase();
    void init();
    void cleanup();

    void contentsLeadToTheChapters();
    void contentsFollowTheText();
    void findsByKeys();
    void findsNothing();
    void findingNothingInParticularAsksWhat();
    void findingTakesSomethingToFind();
    void stepsByKeys();
    void zoomsByKeys();
    void escapeCloses();
    void everyButtonIsExplained();
    void isRemembered();
    void standsAtTheLeadingSide_data();
    void standsAtTheLeadingSide();
    void theGuideIsSound();

private:
    void start();
    KvDeskGuideText *text() const { return m_window->text(); }
    QAction *action(const QString &name) const;

    QString m_path;
    std::unique_ptr<KvDeskGuideWindow> m_window;
};

void KvDeskGuideWindowTest::initTestCase()
{
    KvDeskResources::ensure();
    m_path = GuideFile::create();
}

void KvDeskGuideWindowTest::init()
{
    StatReportTest::init();
    ZtAppSettings::getInstance()->setStoragePath(QString());
    ZtStatusLog::getInstance()->clear();
    start();
}

void KvDeskGuideWindowTest::cleanup()
{
    m_window.reset();
    // An icon that is missing is reported there.
    QCOMPARE(ZtStatusLog::getInstance()->entries().size(), 0);
    StatReportTest::cleanup();
}

void KvDeskGuideWindowTest::start()
{
    m_window = std::make_unique<KvDeskGuideWindow>(m_path);
    m_window->show();
    m_window->activateWindow();
    QVERIFY(QTest::qWaitForWindowActive(m_window.get()));
}

QAction *KvDeskGuideWindowTest::action(const QString &name) const
{
    for (QAction *const action : m_window->findChildren<QAction *>()) {
        if (action->text() == name)
            return action;
    }
    return nullptr;
}

void KvDeskGuideWindowTest::contentsLeadToTheChapters()
{
    QListWidget *const contents = m_window->contents();
    QStringList titles;
    for (int row = 0; row < contents->count(); ++row)
        titles.append(contents->item(row)->text());
    QCOMPARE(titles, QStringList({QStringLiteral("The guide"), QStringLiteral("First code chapter"),
                                  QStringLiteral("Second chapter, its end"),
                                  QStringLiteral("Second chapter, its end")}));
    QTest::mouseClick(contents->viewport(), Qt::LeftButton, {},
                      contents->visualItemRect(contents->item(2)).center());
    QCOMPARE(text()->headingInView(), 2);
    contents->setFocus();
    QTest::keyClick(contents, Qt::Key_Down);
    QTest::keyClick(contents, Qt::Key_Return);
    QCOMPARE(text()->headingInView(), 4);
}

void KvDeskGuideWindowTest::contentsFollowTheText()
{
    QCOMPARE(m_window->contents()->currentRow(), 0);
    text()->showHeading(1);
    QCOMPARE(m_window->contents()->currentRow(), 1);
    // A section of the second chapter.
    text()->showHeading(3);
    QCOMPARE(m_window->contents()->currentRow(), 2);
}

void KvDeskGuideWindowTest::findsByKeys()
{
    QVERIFY(text()->hasFocus());
    QTest::keyClick(m_window.get(), Qt::Key_F, Qt::ControlModifier);
    QVERIFY(m_window->findField()->hasFocus());
    QTest::keyClicks(m_window->findField(), QStringLiteral("needle"));
    const int first = text()->textCursor().selectionStart();
    QCOMPARE(text()->textCursor().selectedText(), QStringLiteral("Needle"));
    QTest::keyClick(m_window->findField(), Qt::Key_Return);
    const int second = text()->textCursor().selectionStart();
    QVERIFY(second > first);
    QTest::keyClick(m_window->findField(), Qt::Key_Return, Qt::ShiftModifier);
    QCOMPARE(text()->textCursor().selectionStart(), first);
    QTest::keyClick(m_window.get(), Qt::Key_F3);
    QCOMPARE(text()->textCursor().selectionStart(), second);
    QTest::keyClick(m_window.get(), Qt::Key_F3, Qt::ShiftModifier);
    QCOMPARE(text()->textCursor().selectionStart(), first);
    QCOMPARE(m_window->findResult()->text(), QString());
}

void KvDeskGuideWindowTest::findsNothing()
{
    m_window->findField()->setText(QStringLiteral("haystack"));
    QCOMPARE(m_window->findResult()->text(), QStringLiteral("Not found"));
    m_window->findField()->setText(QString());
    QCOMPARE(m_window->findResult()->text(), QString());
}

void KvDeskGuideWindowTest::findingNothingInParticularAsksWhat()
{
    for (const Qt::KeyboardModifiers keys : {Qt::NoModifier, Qt::ShiftModifier}) {
        text()->setFocus();
        QTest::keyClick(m_window.get(), Qt::Key_F3, keys);
        QVERIFY(m_window->findField()->hasFocus());
        QCOMPARE(m_window->findResult()->text(), QString());
    }
}

void KvDeskGuideWindowTest::findingTakesSomethingToFind()
{
    for (const char *const name : {"Find next", "Find previous"}) {
        const QAction *const find = action(QLatin1String(name));
        QVERIFY(!find->isEnabled());
        QVERIFY(find->toolTip().endsWith(QStringLiteral("\nType what to find first")));
        m_window->findField()->setText(QStringLiteral("needle"));
        QVERIFY(find->isEnabled());
        QVERIFY(!find->toolTip().contains(QStringLiteral("Type what")));
        m_window->findField()->clear();
        QVERIFY(!find->isEnabled());
    }
}

void KvDeskGuideWindowTest::stepsByKeys()
{
    QAction *const back = action(QStringLiteral("Back"));
    QVERIFY(!back->isEnabled());
    QVERIFY(back->toolTip().contains(QStringLiteral("first place")));
    text()->showHeading(2);
    QVERIFY(back->isEnabled());
    QVERIFY(!back->toolTip().contains(QStringLiteral("first place")));
    QTest::keyClick(m_window.get(), Qt::Key_Left, Qt::AltModifier);
    QCOMPARE(text()->headingInView(), 0);
    QVERIFY(!back->isEnabled());
    QTest::keyClick(m_window.get(), Qt::Key_Right, Qt::AltModifier);
    QCOMPARE(text()->headingInView(), 2);
    QVERIFY(action(QStringLiteral("Forward"))->toolTip().contains(QStringLiteral("last place")));
}

void KvDeskGuideWindowTest::zoomsByKeys()
{
    QTest::keyClick(m_window.get(), Qt::Key_Plus, Qt::ControlModifier);
    QTest::keyClick(m_window.get(), Qt::Key_Equal, Qt::ControlModifier);
    QCOMPARE(text()->zoom(), 120);
    QTest::keyClick(m_window.get(), Qt::Key_Minus, Qt::ControlModifier);
    QCOMPARE(text()->zoom(), 110);
    QTest::keyClick(m_window.get(), Qt::Key_0, Qt::ControlModifier);
    QCOMPARE(text()->zoom(), 100);
}

void KvDeskGuideWindowTest::escapeCloses()
{
    m_window->findField()->setFocus();
    m_window->findField()->setText(QStringLiteral("needle"));
    QTest::keyClick(m_window.get(), Qt::Key_Escape);
    QVERIFY(m_window->isVisible());
    QCOMPARE(m_window->findField()->text(), QString());
    QVERIFY(text()->hasFocus());
    QTest::keyClick(m_window.get(), Qt::Key_Escape);
    QVERIFY(!m_window->isVisible());
}

void KvDeskGuideWindowTest::everyButtonIsExplained()
{
    const QStringList shortcuts{QStringLiteral("Alt+Left"), QStringLiteral("Alt+Right"),
                                QStringLiteral("Ctrl+-"),   QStringLiteral("Ctrl++"),
                                QStringLiteral("Shift+F3"), QStringLiteral("F3")};
    QStringList missing = shortcuts;
    for (const QToolButton *const button : m_window->findChildren<QToolButton *>()) {
        if (!button->defaultAction())
            continue;
        QVERIFY(!button->icon().isNull());
        for (const QString &shortcut : shortcuts) {
            if (button->toolTip().contains(QStringLiteral("(%1)").arg(shortcut)))
                missing.removeAll(shortcut);
        }
    }
    QVERIFY2(missing.isEmpty(), qPrintable(missing.join(QLatin1Char(' '))));
    QVERIFY(m_window->findField()->toolTip().contains(QStringLiteral("(Ctrl+F)")));
    for (const QWidget *const widget : std::initializer_list<const QWidget *>{
             m_window->findField(), m_window->contents(), m_window->text()})
        QVERIFY(!widget->accessibleName().isEmpty());
}

void KvDeskGuideWindowTest::isRemembered()
{
    m_window->resize(700, 500);
    text()->setZoom(140);
    m_window->close();
    start();
    QCOMPARE(m_window->size(), QSize(700, 500));
    QCOMPARE(text()->zoom(), 140);
}

void KvDeskGuideWindowTest::standsAtTheLeadingSide_data()
{
    QTest::addColumn<Qt::LayoutDirection>("direction");
    QTest::addColumn<bool>("isLeft");
    QTest::newRow("left to right") << Qt::LeftToRight << true;
    QTest::newRow("right to left") << Qt::RightToLeft << false;
}

void KvDeskGuideWindowTest::standsAtTheLeadingSide()
{
    QFETCH(Qt::LayoutDirection, direction);
    QFETCH(bool, isLeft);
    QGuiApplication::setLayoutDirection(direction);
    start();
    const int contents = m_window->contents()->mapToGlobal(QPoint()).x();
    const int page = text()->mapToGlobal(QPoint()).x();
    QGuiApplication::setLayoutDirection(Qt::LeftToRight);
    QCOMPARE(contents < page, isLeft);
    QCOMPARE(text()->layoutDirection(), Qt::LeftToRight);
}

// What its links into the text say is there, and so are the files that it names.
void KvDeskGuideWindowTest::theGuideIsSound()
{
    const QString path = sourcePath(QStringLiteral("docs/user-guide.md"));
    const KvDeskGuideWindow window(path);
    QStringList anchors;
    for (const KvDeskGuideText::Heading &heading : window.text()->headings())
        anchors.append(heading.anchor);
    QFile file(path);
    QVERIFY(file.open(QIODevice::ReadOnly));
    const QString markdown = QString::fromUtf8(file.readAll());
    QRegularExpressionMatchIterator links =
        QRegularExpression(QStringLiteral("\\]\\(([^)]+)\\)")).globalMatch(markdown);
    int files = 0;
    while (links.hasNext()) {
        const QString link = links.next().captured(1);
        const bool isInside = link.startsWith(QLatin1Char('#'));
        files += isInside ? 0 : 1;
        QVERIFY2(isInside ? anchors.contains(link.mid(1))
                          : QFileInfo(QFileInfo(path).absolutePath() + QLatin1Char('/') + link).isFile(),
                 qPrintable(link));
    }
    QVERIFY(files >= 12);
    QVERIFY(window.contents()->count() > 15);
}

STATREPORT_TEST_MAIN(KvDeskGuideWindowTest)
#include "KvDeskGuideWindowTest.moc"
