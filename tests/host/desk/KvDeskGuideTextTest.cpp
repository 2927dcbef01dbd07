// SPDX-License-Identifier: MIT
#include "KvDeskGuideText.h"

#include "GuideFile.h"
#include "KvDeskTheme.h"
#include "gui/QtAdvancedStylesheet.h"

#include <QAbstractTextDocumentLayout>
#include <QClipboard>
#include <QDesktopServices>
#include <QFontInfo>
#include <QScrollBar>
#include <QTextBlock>
#include <QTextTable>

namespace {

/// What the desktop is asked to open.
class Desktop : public QObject
{
    Q_OBJECT
public:
    Desktop()
    {
        for (const char *const scheme : {"file", "https"})
            QDesktopServices::setUrlHandler(QLatin1String(scheme), this, "slotOpen");
    }
    ~Desktop() override
    {
        for (const char *const scheme : {"file", "https"})
            QDesktopServices::unsetUrlHandler(QLatin1String(scheme));
    }
    QList<QUrl> opened;
public slots:
    void slotOpen(const QUrl &aUrl) { opened.append(aUrl); }
};

} // namespace

namespace {

/// The first column from \a x on that holds something, or that holds nothing.
int nextColumn(const QImage &image, int x, bool isInk)
{
    const QRgb paper = image.pixel(0, 0);
    const auto hasInk = [&image, paper](int column) {
        for (int y = 0; y < image.height(); ++y) {
            if (image.pixel(column, y) != paper)
                return true;
        }
        return false;
    };
    while (x < image.width() && hasInk(x) != isInk)
        ++x;
    return x;
}

} // namespace

class KvDeskGuideTextTest : public StatReportTest
{
    Q_OBJECT

private slots:
    void initTestCase();
    void init();
    void cleanup();

    void anchors_data();
    void anchors();
    void headings();
    void linksIntoTheText();
    void otherLinksAreOpenedOutside_data();
    void otherLinksAreOpenedOutside();
    void linksWorkByKeys();
    void backAndForward();
    void tellsTheHeadingInView();
    void picturesFitTheWidth();
    void findsInBothDirections();
    void findsWhatIsTyped();
    void zooms();
    void wheelZooms();
    void followsTheTheme();
    void readsAsItsLanguage_data();
    void readsAsItsLanguage();
    void codeReadsFromLeftToRight();
    void copiedCodeIsPlain();
    void bulletsStandApart_data();
    void bulletsStandApart();
    void missingFileIsEmpty();

private:
    /// Of the letters that \a text begins with.
    QTextCharFormat formatOf(const QString &text) const;
    int scrolled() const { return m_text->verticalScrollBar()->value(); }

    QString m_path;
    std::unique_ptr<KvDeskGuideText> m_text;
};

void KvDeskGuideTextTest::initTestCase()
{
    m_path = GuideFile::create();
    KvDeskTheme::apply(QStringLiteral("Dark"));
}

void KvDeskGuideTextTest::init()
{
    StatReportTest::init();
    m_text = std::make_unique<KvDeskGuideText>(m_path);
    m_text->resize(600, 400);
    m_text->show();
    QVERIFY(QTest::qWaitForWindowExposed(m_text.get()));
}

void KvDeskGuideTextTest::cleanup()
{
    m_text.reset();
    StatReportTest::cleanup();
}

QTextCharFormat KvDeskGuideTextTest::formatOf(const QString &text) const
{
    QTextCursor found = m_text->document()->find(text);
    found.setPosition(found.selectionStart() + 1);
    return found.charFormat();
}

void KvDeskGuideTextTest::anchors_data()
{
    QTest::addColumn<QString>("title");
    QTest::addColumn<QString>("anchor");
    QTest::newRow("words") << QStringLiteral("The first Measurement")
                           << QStringLiteral("the-first-measurement");
    QTest::newRow("marks") << QStringLiteral("Objects, undo (\"all\")") << QStringLiteral("objects-undo-all");
    QTest::newRow("hyphens") << QStringLiteral("Command-line a_b 2") << QStringLiteral("command-line-a_b-2");
    QTest::newRow("nothing") << QString() << QString();
    QTest::newRow("umlauts") << QStringLiteral("Größe ändern") << QStringLiteral("größe-ändern");
    QTest::newRow("Cyrillic") << QStringLiteral("Первое Измерение") << QStringLiteral("первое-измерение");
    QTest::newRow("Arabic") << QStringLiteral("الجلسات والاستعادة") << QStringLiteral("الجلسات-والاستعادة");
    QTest::newRow("Chinese") << QStringLiteral("更改对象、撤消") << QStringLiteral("更改对象撤消");
    QTest::newRow("Japanese") << QStringLiteral("レポート") << QStringLiteral("レポート");
    QTest::newRow("Korean") << QStringLiteral("보고서 템플릿") << QStringLiteral("보고서-템플릿");
}

void KvDeskGuideTextTest::anchors()
{
    QFETCH(QString, title);
    QFETCH(QString, anchor);
    QCOMPARE(KvDeskGuideText::anchorOf(title), anchor);
}

void KvDeskGuideTextTest::headings()
{
    QStringList found;
    for (const KvDeskGuideText::Heading &heading : m_text->headings())
        found.append(QStringLiteral("%1 %2").arg(heading.level).arg(heading.anchor));
    QCOMPARE(found, QStringList({QStringLiteral("1 the-guide"), QStringLiteral("2 first-code-chapter"),
                                 QStringLiteral("2 second-chapter-its-end"), QStringLiteral("3 deeper"),
                                 QStringLiteral("2 second-chapter-its-end-1")}));
    QCOMPARE(m_text->headings().at(1).title, QStringLiteral("First code chapter"));
}

void KvDeskGuideTextTest::linksIntoTheText()
{
    const Desktop desktop;
    QCOMPARE(scrolled(), 0);
    emit m_text->anchorClicked(QUrl(QStringLiteral("#second-chapter-its-end")));
    QCOMPARE(m_text->headingInView(), 2);
    QVERIFY(scrolled() > 400);
    QVERIFY(desktop.opened.isEmpty());
    m_text->showHeading(4);
    QCOMPARE(m_text->headingInView(), 4);
    m_text->showHeading(0);
    QCOMPARE(m_text->headingInView(), 0);
}

void KvDeskGuideTextTest::otherLinksAreOpenedOutside_data()
{
    QTest::addColumn<QString>("link");
    QTest::addColumn<QUrl>("url");
    QTest::newRow("file") << QStringLiteral("tables.md")
                          << QUrl::fromLocalFile(temporaryPath(QStringLiteral("guide/tables.md")));
    QTest::newRow("place in a file")
        << QStringLiteral("tables.md#first")
        << QUrl(QUrl::fromLocalFile(temporaryPath(QStringLiteral("guide/tables.md"))).toString() +
                QStringLiteral("#first"));
    QTest::newRow("web") << QStringLiteral("https://a.invalid/b")
                         << QUrl(QStringLiteral("https://a.invalid/b"));
}

void KvDeskGuideTextTest::otherLinksAreOpenedOutside()
{
    QFETCH(QString, link);
    QFETCH(QUrl, url);
    const Desktop desktop;
    const QString before = m_text->toPlainText();
    emit m_text->anchorClicked(QUrl(link));
    QCOMPARE(desktop.opened, QList<QUrl>({url}));
    QCOMPARE(m_text->toPlainText(), before);
}

void KvDeskGuideTextTest::linksWorkByKeys()
{
    m_text->setFocus();
    QTest::keyClick(m_text.get(), Qt::Key_Tab);
    QTest::keyClick(m_text.get(), Qt::Key_Return);
    QCOMPARE(m_text->headingInView(), 2);
}

void KvDeskGuideTextTest::backAndForward()
{
    QVERIFY(!m_text->isBackwardAvailable());
    m_text->showHeading(2);
    const int second = scrolled();
    m_text->showHeading(1);
    const int first = scrolled();
    QVERIFY(first < second);
    QVERIFY(m_text->isBackwardAvailable());
    m_text->backward();
    QCOMPARE(scrolled(), second);
    m_text->backward();
    QCOMPARE(scrolled(), 0);
    QVERIFY(!m_text->isBackwardAvailable());
    m_text->forward();
    QCOMPARE(scrolled(), second);
    m_text->forward();
    QCOMPARE(scrolled(), first);
    QVERIFY(!m_text->isForwardAvailable());
    // Still the same text.
    QCOMPARE(m_text->headings().size(), 5);
    QVERIFY(m_text->toPlainText().contains(QStringLiteral("Needle one")));
}

void KvDeskGuideTextTest::tellsTheHeadingInView()
{
    QSignalSpy changed(m_text.get(), SIGNAL(signalHeadingInViewChanged(int)));
    m_text->verticalScrollBar()->setValue(m_text->verticalScrollBar()->maximum());
    QVERIFY(!changed.isEmpty());
    QCOMPARE(changed.last().first().toInt(), 4);
}

void KvDeskGuideTextTest::picturesFitTheWidth()
{
    for (const int width : {600, 900, 400}) {
        m_text->resize(width, 400);
        QApplication::processEvents();
        QCOMPARE(m_text->horizontalScrollBar()->maximum(), 0);
        QTextCursor cursor = m_text->document()->find(QStringLiteral("web"));
        const QTextBlock picture = cursor.block().next();
        const QRectF rect = m_text->document()->documentLayout()->blockBoundingRect(picture);
        const double drawn = m_text->viewport()->width() - 2 * m_text->document()->documentMargin();
        QVERIFY2(qAbs(rect.height() - drawn / 2) < 30, qPrintable(QString::number(rect.height())));
    }
}

void KvDeskGuideTextTest::findsInBothDirections()
{
    QVERIFY(m_text->findNext(QStringLiteral("needle")));
    const int first = m_text->textCursor().selectionStart();
    QVERIFY(m_text->findNext(QStringLiteral("needle")));
    const int second = m_text->textCursor().selectionStart();
    QVERIFY(second > first);
    QVERIFY(scrolled() > 0);
    QVERIFY(m_text->findNext(QStringLiteral("needle")));
    QCOMPARE(m_text->textCursor().selectionStart(), first);
    QVERIFY(m_text->findPrevious(QStringLiteral("needle")));
    QCOMPARE(m_text->textCursor().selectionStart(), second);
    QVERIFY(!m_text->findNext(QStringLiteral("haystack")));
    QCOMPARE(m_text->textCursor().selectionStart(), second);
}

void KvDeskGuideTextTest::findsWhatIsTyped()
{
    QVERIFY(m_text->findTyped(QStringLiteral("Need")));
    const int first = m_text->textCursor().selectionStart();
    QVERIFY(m_text->findTyped(QStringLiteral("Needle")));
    QCOMPARE(m_text->textCursor().selectionStart(), first);
    QVERIFY(m_text->findTyped(QStringLiteral("Needle t")));
    QVERIFY(m_text->textCursor().selectionStart() > first);
}

void KvDeskGuideTextTest::zooms()
{
    const int normal = QFontInfo(m_text->document()->defaultFont()).pixelSize();
    const double height = m_text->document()->size().height();
    for (int i = 0; i < 5; ++i)
        m_text->slotZoomIn();
    QCOMPARE(m_text->zoom(), 150);
    QCOMPARE(QFontInfo(m_text->document()->defaultFont()).pixelSize(), normal * 3 / 2);
    QVERIFY(m_text->document()->size().height() > height);
    // Code, too.
    QCOMPARE(QFontInfo(formatOf(QStringLiteral("Ctrl+S")).font().resolve(m_text->document()->defaultFont()))
                 .pixelSize(),
             normal * 3 / 2);
    m_text->slotZoomNormal();
    QCOMPARE(m_text->zoom(), 100);
    m_text->setZoom(1);
    QCOMPARE(m_text->zoom(), 50);
    m_text->setZoom(1000);
    QCOMPARE(m_text->zoom(), 300);
}

void KvDeskGuideTextTest::wheelZooms()
{
    const QPointF middle(50, 50);
    const auto turn = [this, middle](int delta, Qt::KeyboardModifiers keys) {
        QWheelEvent event(middle, m_text->viewport()->mapToGlobal(middle.toPoint()), QPoint(),
                          QPoint(0, delta), Qt::NoButton, keys, Qt::NoScrollPhase, false);
        QApplication::sendEvent(m_text->viewport(), &event);
    };
    turn(120, Qt::ControlModifier);
    QCOMPARE(m_text->zoom(), 110);
    turn(-120, Qt::ControlModifier);
    QCOMPARE(m_text->zoom(), 100);
    turn(-120, Qt::NoModifier);
    QCOMPARE(m_text->zoom(), 100);
    QVERIFY(scrolled() > 0);
}

void KvDeskGuideTextTest::followsTheTheme()
{
    const auto *const style = acss::QtAdvancedStylesheet::getInstance();
    for (const QString &theme : {QStringLiteral("Light"), QStringLiteral("Dark")}) {
        KvDeskTheme::apply(theme);
        QCOMPARE(formatOf(QStringLiteral("second")).foreground().color(),
                 style->color(QStringLiteral("text")));
        QVERIFY(formatOf(QStringLiteral("second")).fontUnderline());
        QCOMPARE(formatOf(QStringLiteral("Ctrl+S")).background().color(),
                 style->color(QStringLiteral("raised-hover")));
        const auto *const table =
            qobject_cast<QTextTable *>(m_text->document()->rootFrame()->childFrames().first());
        QVERIFY(table);
        QCOMPARE(table->format().borderBrush().color(), style->color(QStringLiteral("line")));
        QCOMPARE(m_text->palette().color(QPalette::Text), style->color(QStringLiteral("text")));
    }
}

void KvDeskGuideTextTest::readsAsItsLanguage_data()
{
    QTest::addColumn<QString>("file");
    QTest::addColumn<Qt::LayoutDirection>("program");
    QTest::addColumn<Qt::LayoutDirection>("text");
    QTest::newRow("English") << QStringLiteral("guide.md") << Qt::LeftToRight << Qt::LeftToRight;
    QTest::newRow("English in a mirrored program")
        << QStringLiteral("guide.md") << Qt::RightToLeft << Qt::LeftToRight;
    QTest::newRow("German") << QStringLiteral("guide.German.md") << Qt::LeftToRight << Qt::LeftToRight;
    QTest::newRow("Arabic") << QStringLiteral("guide.Arabic.md") << Qt::RightToLeft << Qt::RightToLeft;
}

void KvDeskGuideTextTest::readsAsItsLanguage()
{
    QFETCH(QString, file);
    QFETCH(Qt::LayoutDirection, program);
    QFETCH(Qt::LayoutDirection, text);
    const QString path = GuideFile::create(file);
    QGuiApplication::setLayoutDirection(program);
    const KvDeskGuideText guide(path);
    QGuiApplication::setLayoutDirection(Qt::LeftToRight);
    QCOMPARE(guide.layoutDirection(), text);
    for (QTextBlock block = guide.document()->begin(); block.isValid(); block = block.next()) {
        const bool isCode = block.blockFormat().hasProperty(QTextFormat::BlockCodeFence);
        QVERIFY2(block.textDirection() == (isCode ? Qt::LeftToRight : text), qPrintable(block.text()));
    }
    const auto *const table =
        qobject_cast<QTextTable *>(guide.document()->rootFrame()->childFrames().first());
    QVERIFY(table);
    QCOMPARE(table->format().layoutDirection(), text);
    // The first column is where reading begins.
    QCOMPARE(table->cellAt(0, text == Qt::RightToLeft ? 1 : 0).firstCursorPosition().block().text(),
             QStringLiteral("key"));
    QCOMPARE(bool(table->format().alignment() & Qt::AlignRight), text == Qt::RightToLeft);
    // The marks around code are nothing of the anchors.
    QCOMPARE(guide.headings().at(1).anchor, QStringLiteral("first-code-chapter"));
}

// The dashes stay before the word, which stands at the right in the line.
void KvDeskGuideTextTest::codeReadsFromLeftToRight()
{
    KvDeskGuideText guide(GuideFile::create(QStringLiteral("guide.Arabic.md")));
    guide.resize(600, 400);
    guide.show();
    QVERIFY(QTest::qWaitForWindowExposed(&guide));
    const QTextCursor found = guide.document()->find(QStringLiteral("--dashes"));
    QTextCursor cursor(found);
    cursor.setPosition(found.selectionStart());
    const int dashes = guide.cursorRect(cursor).x();
    cursor.setPosition(found.selectionEnd() - 1);
    QVERIFY(dashes < guide.cursorRect(cursor).x());
}

void KvDeskGuideTextTest::copiedCodeIsPlain()
{
    KvDeskGuideText guide(GuideFile::create(QStringLiteral("guide.Arabic.md")));
    QTextCursor cursor = guide.document()->find(QStringLiteral("An item with"));
    cursor.select(QTextCursor::BlockUnderCursor);
    guide.setTextCursor(cursor);
    guide.copy();
    QCOMPARE(QApplication::clipboard()->text().trimmed(), QStringLiteral("An item with --dashes"));
}

void KvDeskGuideTextTest::bulletsStandApart_data()
{
    QTest::addColumn<QString>("file");
    QTest::newRow("left to right") << QStringLiteral("guide.md");
    QTest::newRow("right to left") << QStringLiteral("guide.Arabic.md");
}

// There is room between the bullet and the letters: half of the bullet's size at least.
void KvDeskGuideTextTest::bulletsStandApart()
{
    QFETCH(QString, file);
    KvDeskGuideText guide(GuideFile::create(file));
    guide.resize(600, 400);
    guide.show();
    QVERIFY(QTest::qWaitForWindowExposed(&guide));
    QTextCursor cursor = guide.document()->find(QStringLiteral("Another"));
    cursor.setPosition(cursor.selectionStart());
    guide.setTextCursor(cursor);
    guide.ensureCursorVisible();
    QImage line = guide.viewport()
                      ->grab(QRect(0, guide.cursorRect(cursor).y(), guide.viewport()->width(),
                                   guide.cursorRect(cursor).height()))
                      .toImage();
    if (guide.layoutDirection() == Qt::RightToLeft)
        line = line.mirrored(true, false);
    const int bullet = nextColumn(line, 0, true);
    const int gap = nextColumn(line, bullet, false);
    const int text = nextColumn(line, gap, true);
    QVERIFY(text < line.width());
    QVERIFY2(2 * (text - gap) >= gap - bullet,
             qPrintable(QStringLiteral("bullet %1 gap %2 text %3").arg(bullet).arg(gap).arg(text)));
}

void KvDeskGuideTextTest::missingFileIsEmpty()
{
    const KvDeskGuideText text(temporaryPath(QStringLiteral("none.md")));
    QVERIFY(text.headings().isEmpty());
    QCOMPARE(text.headingInView(), -1);
    QCOMPARE(text.toPlainText(), QString());
}

STATREPORT_TEST_MAIN(KvDeskGuideTextTest)
#include "KvDeskGuideTextTest.moc"
