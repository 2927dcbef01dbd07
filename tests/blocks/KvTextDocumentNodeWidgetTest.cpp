// SPDX-License-Identifier: MIT
#include "support/StatReportTest.h"

#include "ConfigArgument.h"
#include "blocks/textdocument/KvTextDocumentNodeCfg.h"
#include "blocks/textdocument/KvTextDocumentNodeWidget.h"
#include "kernel/ZtAppSettings.h"
#include "report/KvBaseDisplayWidgetSignals.h"
#include "templates/KvTemplateContext.h"

#include <QBuffer>
#include <QScrollBar>
#include <QTextDocument>

namespace {

/** Counts what a text tells layout, window and template. */
struct TextSpies
{
    TextSpies(const KvTextDocumentNodeWidget &text, const KvTemplateContext *context)
        : changed(text.displaySignals(), SIGNAL(signalWidgetChanged()))
                  , config(text.displaySignals(),
                           SIGNAL(signalWidgetConfigChanged(const KvBaseEditorNodeCfg *)))
                           , modified(context, SIGNAL(signalTemplateModified()))
    {}

    QSignalSpy changed;
    QSignalSpy config;
    QSignalSpy modified;
};

/** An image element as the picture dialog writes it: with a blank after the comma of the data URL. */
QString pictureHtml(int width, const QSize &size, const QColor &color)
{
    QImage image(size, QImage::Format_RGB32);
    image.fill(color);
    QByteArray bytes;
    QBuffer buffer(&bytes);
    buffer.open(QIODevice::WriteOnly);
    image.save(&buffer, "PNG");
    return QStringLiteral("<img width=%1 style=\"float:none;\" src=\"data:image/png;base64, %2\" />")
        .arg(width)
        .arg(QString::fromLatin1(bytes.toBase64()));
}

QString lines(int count)
{
    QString html;
    for (int i = 0; i < count; ++i)
        html += QStringLiteral("<p>Line %1</p>").arg(i);
    return html;
}

} // namespace

class KvTextDocumentNodeWidgetTest : public StatReportTest
{
    Q_OBJECT

private slots:
    void init();
    void cleanup();
    void isSetUpForAPage();
    void typedTextIsBlackInAnyTheme();
    void isOnePieceThatIsItself();
    void wrapsAtTheContentWidth();
    void followsThePageWidth();
    void keywordsAreShownExpanded();
    void valuesAreNotEscaped();
    void unknownPlaceholdersStay();
    void showingIsNoEdit_data();
    void showingIsNoEdit();
    void refreshShowsANewText();
    void typingIsStored();
    void anUnchangedTextIsStillAnEdit();
    void clearingTheTextStoresNothing();
    void aPictureAloneIsAText();
    void aLineIsLow();
    void anEmptyTextIsAtLeastTenPixelsHigh();
    void fiftyLinesAreAsHighAsTheDocument();
    void heightFollowsTheText();
    void onlySizeChangesMoveTheLayout();
    void picturesInTheTextAreShown();
    void layoutDoesNotDependOnTheScreen_data();
    void layoutDoesNotDependOnTheScreen();
    void rightToLeftText();
    void longParagraphs();
    void sizeIsRightWhenShownLater();
    void survivesTinyPages_data();
    void survivesTinyPages();
    void worksWithoutAContext();

private:
    /** Makes the widget anew, showing \a html. */
    void makeWidget(const QString &html);
    QString shownText() const { return m_widget->toPlainText(); }

    std::unique_ptr<KvTemplateContext> m_context;
    std::unique_ptr<KvTextDocumentNodeCfg> m_cfg;
    std::unique_ptr<KvTextDocumentNodeWidget> m_widget;
};

void KvTextDocumentNodeWidgetTest::init()
{
    StatReportTest::init();
    m_context = std::make_unique<KvTemplateContext>(nullptr);
    makeWidget(QString());
}

void KvTextDocumentNodeWidgetTest::cleanup()
{
    m_widget.reset();
    m_cfg.reset();
    m_context.reset();
    StatReportTest::cleanup();
}

void KvTextDocumentNodeWidgetTest::makeWidget(const QString &html)
{
    m_widget.reset();
    m_cfg = std::make_unique<KvTextDocumentNodeCfg>(m_context.get());
    m_cfg->setText(html);
    m_widget = std::make_unique<KvTextDocumentNodeWidget>(nullptr, m_cfg.get());
}

void KvTextDocumentNodeWidgetTest::isSetUpForAPage()
{
    QCOMPARE(m_widget->displayName(), QStringLiteral("Text"));
    QCOMPARE(m_widget->sizePolicy(), QSizePolicy(QSizePolicy::Preferred, QSizePolicy::Preferred));
    QCOMPARE(m_widget->sizeAdjustPolicy(), QAbstractScrollArea::AdjustToContents);
    QCOMPARE(m_widget->frameShape(), QFrame::NoFrame);
    QCOMPARE(m_widget->horizontalScrollBarPolicy(), Qt::ScrollBarAlwaysOff);
    QCOMPARE(m_widget->verticalScrollBarPolicy(), Qt::ScrollBarAlwaysOff);
    QCOMPARE(m_widget->minimumWidth(), 724);
    QCOMPARE(m_widget->maximumWidth(), 724);
    QCOMPARE(m_widget->document()->textWidth(), 724.0);
    QCOMPARE(m_widget->document()->defaultFont().family(), QStringLiteral("Segoe UI"));
    QCOMPARE(m_widget->document()->defaultFont().pixelSize(), 12);
    QCOMPARE(m_widget->textColor(), QColor(Qt::black));
    QVERIFY(m_widget->metaObject()->indexOfSlot("slotTextChanged()") >= 0);
}

void KvTextDocumentNodeWidgetTest::typedTextIsBlackInAnyTheme()
{
    // A dark program writes white by default; pages are white.
    QPalette dark = m_widget->palette();
    dark.setColor(QPalette::Text, Qt::white);
    dark.setColor(QPalette::Base, Qt::white);
    m_widget->setPalette(dark);
    m_widget->insertPlainText(QString(4, QChar(0x2588)));
    const QTextCharFormat format = m_widget->textCursor().charFormat();
    QVERIFY(format.hasProperty(QTextFormat::ForegroundBrush));
    QCOMPARE(format.foreground().color(), QColor(Qt::black));
    const QImage image = m_widget->grab().toImage();
    QCOMPARE(image.pixelColor(12, image.height() / 2), QColor(Qt::black));
    QCOMPARE(image.pixelColor(400, image.height() / 2), QColor(Qt::white));
}

void KvTextDocumentNodeWidgetTest::isOnePieceThatIsItself()
{
    QCOMPARE(m_widget->subWidgetCount(), 1);
    QCOMPARE(m_widget->subWidgetAt(0), m_widget.get());
    QVERIFY(!m_widget->subWidgetAt(1));
    QVERIFY(!m_widget->subWidgetAt(-1));
}

void KvTextDocumentNodeWidgetTest::wrapsAtTheContentWidth()
{
    const QFontMetricsF metrics(m_widget->document()->defaultFont());
    const qreal word = metrics.horizontalAdvance(QStringLiteral("measure "));
    const int wordsInALine = int(724 / word);
    const QString text = QStringLiteral("measure ").repeated(3 * wordsInALine);
    makeWidget(QStringLiteral("<p>%1</p>").arg(text));
    m_widget->show();
    QVERIFY(QTest::qWaitForWindowExposed(m_widget.get()));
    QCOMPARE(m_widget->document()->textWidth(), 724.0);
    const int lineCount = m_widget->document()->firstBlock().layout()->lineCount();
    // The document keeps 4 pixels to each side, so that a line holds a word less at times.
    QVERIFY2(lineCount == 3 || lineCount == 4, qPrintable(QString::number(lineCount)));
    for (int i = 0; i < lineCount; ++i)
        QVERIFY(m_widget->document()->firstBlock().layout()->lineAt(i).naturalTextWidth() <= 724);
}

void KvTextDocumentNodeWidgetTest::followsThePageWidth()
{
    makeWidget(QStringLiteral("<p>%1</p>").arg(QStringLiteral("measure ").repeated(60)));
    const int height = m_widget->height();
    m_context->setPageWidth(400); // margins of 48
    QCOMPARE(m_widget->subWidgetAt(0)->width(), 304);
    QCOMPARE(m_widget->document()->textWidth(), 304.0);
    QVERIFY(m_widget->height() > height);
    QCOMPARE(m_widget->sizeHint(), QSize(304, m_widget->height()));
    m_context->setPageWidth(952);
    m_widget->subWidgetAt(0);
    QCOMPARE(m_widget->size(), QSize(724, height));
}

void KvTextDocumentNodeWidgetTest::keywordsAreShownExpanded()
{
    const QString stored = QStringLiteral("${CREATION_DATE_ISO} ${CREATION_TIME}");
    // Once more if midnight came in between.
    QString date;
    do {
        date = QDate::currentDate().toString(Qt::ISODate);
        makeWidget(stored);
    } while (date != QDate::currentDate().toString(Qt::ISODate));
    const QString shown = shownText();
    QVERIFY(shown.startsWith(date + QLatin1Char(' ')));
    const QTime time = QTime::fromString(shown.mid(date.size() + 1), QStringLiteral("h:mm:ss"));
    QVERIFY2(time.isValid(), qPrintable(shown));
    QVERIFY(qAbs(time.secsTo(QTime::currentTime())) < 60 || time.hour() == 23);
    QCOMPARE(m_cfg->text(), stored);
    QJsonObject config;
    QVERIFY(m_cfg->toJson(config));
    QCOMPARE(config["text"].toString(), stored);
}

void KvTextDocumentNodeWidgetTest::valuesAreNotEscaped()
{
    makeWidget(QStringLiteral("<p>[${PROGRAM_NAME}] [${PROGRAM_VERSION}] [${PROGRAM_VENDOR}]</p>"));
    const ZtAppSettings *settings = ZtAppSettings::getInstance();
    QTextDocument expected;
    expected.setHtml(
        QStringLiteral("<p>[%1] [%2] [%3]</p>")
            .arg(settings->getProgramName(), settings->getProgramVersion(), settings->getVendor()));
    QCOMPARE(shownText(), expected.toPlainText());
    QVERIFY(!shownText().contains(QLatin1Char('$')));
}

void KvTextDocumentNodeWidgetTest::unknownPlaceholdersStay()
{
    makeWidget(QStringLiteral("<p>${CREATION_YEAR} ${creation_time}</p>"));
    QCOMPARE(shownText(), QStringLiteral("${CREATION_YEAR} ${creation_time}"));
}

void KvTextDocumentNodeWidgetTest::showingIsNoEdit_data()
{
    QTest::addColumn<QString>("html");
    QTest::newRow("empty") << QString();
    QTest::newRow("hand-made") << QStringLiteral("<h1>Title</h1>\n<p>a<br/>b &amp; <b>c</b></p>");
    QTest::newRow("not closed") << QStringLiteral("<p><b>a");
    QTest::newRow("plain") << QStringLiteral("no markup");
    QTest::newRow("keyword") << QStringLiteral("${CREATION_TIME}");
    QTest::newRow("picture") << pictureHtml(20, QSize(60, 30), Qt::red);
}

void KvTextDocumentNodeWidgetTest::showingIsNoEdit()
{
    QFETCH(QString, html);
    m_cfg->setText(html);
    TextSpies spies(*m_widget, m_context.get());
    QSignalSpy textChanged(m_widget.get(), SIGNAL(textChanged()));
    m_widget->refreshText();
    m_widget->show();
    QVERIFY(QTest::qWaitForWindowExposed(m_widget.get()));
    m_widget->subWidgetAt(0);
    m_widget->grab();
    QCoreApplication::processEvents();
    QCOMPARE(m_cfg->text(), html);
    QVERIFY(!m_widget->document()->isModified());
    QCOMPARE(textChanged.count(), 0);
    QCOMPARE(spies.config.count(), 0);
    QCOMPARE(spies.modified.count(), 0);
    QVERIFY(!m_widget->signalsBlocked());
}

void KvTextDocumentNodeWidgetTest::refreshShowsANewText()
{
    makeWidget(QStringLiteral("<p>old</p>"));
    const int height = m_widget->height();
    m_cfg->setText(lines(10));
    QCOMPARE(shownText(), QStringLiteral("old"));
    m_widget->refreshText();
    QVERIFY(shownText().startsWith(QStringLiteral("Line 0\nLine 1\n")));
    QVERIFY(m_widget->height() > 5 * height);
}

void KvTextDocumentNodeWidgetTest::typingIsStored()
{
    makeWidget(QStringLiteral("<p>ab</p>"));
    m_widget->show();
    QVERIFY(QTest::qWaitForWindowExposed(m_widget.get()));
    TextSpies spies(*m_widget, m_context.get());
    m_widget->moveCursor(QTextCursor::End);
    QTest::keyClick(m_widget.get(), Qt::Key_C);
    QCOMPARE(shownText(), QStringLiteral("abc"));
    QCOMPARE(m_cfg->text(), m_widget->toHtml());
    QCOMPARE(spies.config.count(), 1);
    QCOMPARE(configArgument(spies.config, 0), m_cfg.get());
    QCOMPARE(spies.modified.count(), 2);
    QTest::keyClick(m_widget.get(), Qt::Key_Backspace);
    QCOMPARE(spies.config.count(), 2);
    QCOMPARE(spies.modified.count(), 4);
    QCOMPARE(spies.changed.count(), 0); // the line is as high as before
}

void KvTextDocumentNodeWidgetTest::anUnchangedTextIsStillAnEdit()
{
    makeWidget(QStringLiteral("<p>ab</p>"));
    m_widget->slotTextChanged(); // takes over the editor's own form of the text
    TextSpies spies(*m_widget, m_context.get());
    m_widget->slotTextChanged();
    QCOMPARE(spies.config.count(), 0);
    QCOMPARE(spies.modified.count(), 1);
}

void KvTextDocumentNodeWidgetTest::clearingTheTextStoresNothing()
{
    makeWidget(lines(3));
    m_widget->show();
    QVERIFY(QTest::qWaitForWindowExposed(m_widget.get()));
    m_widget->selectAll();
    QTest::keyClick(m_widget.get(), Qt::Key_Delete);
    QVERIFY(m_widget->document()->isEmpty());
    QVERIFY(!m_widget->toHtml().isEmpty()); // an empty document has a text of its own
    QCOMPARE(m_cfg->text(), QString());
    QJsonObject config;
    QVERIFY(m_cfg->toJson(config));
    QCOMPARE(config, (QJsonObject{{"text", ""}}));
}

void KvTextDocumentNodeWidgetTest::aPictureAloneIsAText()
{
    m_widget->insertHtml(pictureHtml(20, QSize(60, 30), Qt::red));
    QVERIFY(m_cfg->text().contains(QStringLiteral("base64, ")));
    QVERIFY(m_cfg->text().contains(QStringLiteral("width=\"20\"")));
}

void KvTextDocumentNodeWidgetTest::aLineIsLow()
{
    makeWidget(QStringLiteral("<p>One line</p>"));
    QVERIFY2(m_widget->height() < 60, qPrintable(QString::number(m_widget->height())));
    QVERIFY(m_widget->height() >= 10);
    QCOMPARE(m_widget->sizeHint(), m_widget->size());
    QCOMPARE(m_widget->minimumSizeHint(), m_widget->size());
    QCOMPARE(m_widget->minimumHeight(), m_widget->height());
}

void KvTextDocumentNodeWidgetTest::anEmptyTextIsAtLeastTenPixelsHigh()
{
    QVERIFY(m_widget->height() >= 10);
    QVERIFY(m_widget->height() < 60);
    makeWidget(QStringLiteral("<p style=\"font-size:1px\">x</p>"));
    m_widget->document()->setDocumentMargin(0);
    m_widget->slotTextChanged();
    QVERIFY(m_widget->document()->size().height() < 10);
    QCOMPARE(m_widget->height(), 10);
    QCOMPARE(m_widget->minimumHeight(), 10);
    QCOMPARE(m_widget->sizeHint().height(), 10);
}

void KvTextDocumentNodeWidgetTest::fiftyLinesAreAsHighAsTheDocument()
{
    makeWidget(lines(50));
    QTextDocument document;
    document.setDefaultFont(m_widget->document()->defaultFont());
    document.setTextWidth(724);
    document.setHtml(lines(50));
    QVERIFY(document.size().height() > 1000);
    QVERIFY(qAbs(m_widget->height() - document.size().height()) <= 1);
    QCOMPARE(m_widget->sizeHint().height(), m_widget->height());
    m_widget->show();
    QVERIFY(QTest::qWaitForWindowExposed(m_widget.get()));
    QCOMPARE(m_widget->verticalScrollBar()->maximum(), 0); // nothing is cut
}

void KvTextDocumentNodeWidgetTest::heightFollowsTheText()
{
    makeWidget(QStringLiteral("<p>a</p>"));
    m_widget->show();
    QVERIFY(QTest::qWaitForWindowExposed(m_widget.get()));
    TextSpies spies(*m_widget, m_context.get());
    const int oneLine = m_widget->height();
    m_widget->moveCursor(QTextCursor::End);
    for (int i = 1; i <= 5; ++i) {
        QTest::keyClick(m_widget.get(), Qt::Key_Return);
        QCOMPARE(spies.changed.count(), i);
        QCOMPARE(m_widget->minimumHeight(), qRound(m_widget->document()->size().height()));
        QCOMPARE(m_widget->height(), m_widget->minimumHeight());
    }
    QVERIFY(m_widget->height() > 4 * (oneLine - 8));
    for (int i = 0; i < 5; ++i)
        QTest::keyClick(m_widget.get(), Qt::Key_Backspace);
    QCOMPARE(m_widget->height(), oneLine);
    QCOMPARE(spies.changed.count(), 10);
}

void KvTextDocumentNodeWidgetTest::onlySizeChangesMoveTheLayout()
{
    makeWidget(QStringLiteral("<p>a</p>"));
    m_widget->show();
    QVERIFY(QTest::qWaitForWindowExposed(m_widget.get()));
    TextSpies spies(*m_widget, m_context.get());
    QTest::keyClicks(m_widget.get(), QStringLiteral("bcd"));
    QCOMPARE(spies.changed.count(), 0);
    QCOMPARE(spies.config.count(), 3);
}

void KvTextDocumentNodeWidgetTest::picturesInTheTextAreShown()
{
    makeWidget(QStringLiteral("<p>before</p>%1<p>after</p>").arg(pictureHtml(200, QSize(600, 300), Qt::red)));
    m_widget->show();
    QVERIFY(QTest::qWaitForWindowExposed(m_widget.get()));
    const QImage image = m_widget->grab().toImage();
    int red = 0;
    for (int y = 0; y < image.height(); ++y) {
        for (int x = 0; x < image.width(); ++x)
            red += image.pixelColor(x, y) == QColor(Qt::red) ? 1 : 0;
    }
    // 200 wide whatever the screen's resolution; with the proportions kept, 100 high.
    QVERIFY2(qAbs(red - 200 * 100) <= 300, qPrintable(QString::number(red)));
    QVERIFY(m_widget->height() > 100);
}

void KvTextDocumentNodeWidgetTest::layoutDoesNotDependOnTheScreen_data()
{
    QTest::addColumn<QString>("html");
    QTest::newRow("paragraphs") << lines(30);
    QTest::newRow("sizes in points")
        << QStringLiteral("<p style=\"font-size:20pt\">%1</p>").arg(QStringLiteral("measure ").repeated(30));
    QTest::newRow("picture") << pictureHtml(200, QSize(600, 300), Qt::red);
    QTest::newRow("table") << QStringLiteral(
        "<table border=1 cellpadding=6><tr><td>a</td><td>b</td></tr></table>");
}

void KvTextDocumentNodeWidgetTest::layoutDoesNotDependOnTheScreen()
{
    // A document without a device is laid out at the application's fixed 96 dots per inch.
    QFETCH(QString, html);
    makeWidget(html);
    QVERIFY(m_widget->logicalDpiY() != 96); // else the test would say nothing
    QTextDocument document;
    document.setDefaultFont(m_widget->document()->defaultFont());
    document.setTextWidth(724);
    document.setHtml(html);
    m_widget->show();
    QVERIFY(QTest::qWaitForWindowExposed(m_widget.get()));
    QCOMPARE(m_widget->document()->size(), document.size());
    QCOMPARE(m_widget->document()->idealWidth(), document.idealWidth());
}

void KvTextDocumentNodeWidgetTest::rightToLeftText()
{
    QGuiApplication::setLayoutDirection(Qt::RightToLeft);
    makeWidget(QStringLiteral("<p>نتائج القياس</p><p>Results</p>"));
    QGuiApplication::setLayoutDirection(Qt::LeftToRight);
    m_widget->show();
    QVERIFY(QTest::qWaitForWindowExposed(m_widget.get()));
    QCOMPARE(m_widget->layoutDirection(), Qt::LeftToRight);
    const QTextBlock arabic = m_widget->document()->firstBlock();
    const QTextBlock latin = m_widget->document()->lastBlock();
    QVERIFY(arabic.layout()->lineAt(0).naturalTextRect().left() > 400);
    QVERIFY(latin.layout()->lineAt(0).naturalTextRect().left() < 20);
    QCOMPARE(m_widget->size(), m_widget->sizeHint());
}

void KvTextDocumentNodeWidgetTest::longParagraphs()
{
    QElapsedTimer stopwatch;
    stopwatch.start();
    const QString words = QStringLiteral("measurement ").repeated(834).left(10000);
    const QString unbroken(10000, QLatin1Char('m'));
    const QString chinese(10000, QChar(0x6D4B));
    makeWidget(QStringLiteral("<p>%1</p><p>%2</p><p>%3</p>").arg(words, unbroken, chinese));
    QCOMPARE(m_widget->width(), 724);
    QCOMPARE(m_widget->height(), qRound(m_widget->document()->size().height()));
    QVERIFY(m_widget->height() > 3000); // all of it wraps, also a word that is longer than a line
    QVERIFY(m_widget->document()->idealWidth() <= 724);
    m_widget->grab();
    QVERIFY2(stopwatch.elapsed() < 10000, "a long text takes far longer than it should");
}

void KvTextDocumentNodeWidgetTest::sizeIsRightWhenShownLater()
{
    QWidget page;
    QVBoxLayout layout(&page);
    layout.setContentsMargins(0, 0, 0, 0);
    makeWidget(lines(20));
    const int height = m_widget->height();
    layout.addWidget(m_widget.get());
    layout.activate();
    QCOMPARE(page.sizeHint(), QSize(724, height));
    page.resize(page.sizeHint());
    page.show();
    QVERIFY(QTest::qWaitForWindowExposed(&page));
    QCOMPARE(m_widget->size(), QSize(724, height));
    m_widget->setParent(nullptr);
}

void KvTextDocumentNodeWidgetTest::survivesTinyPages_data()
{
    QTest::addColumn<int>("pageWidth");
    for (const int width : {-10, 0, 1, 20, 40})
        QTest::addRow("%d", width) << width;
}

void KvTextDocumentNodeWidgetTest::survivesTinyPages()
{
    QFETCH(int, pageWidth);
    m_context->setPageWidth(pageWidth);
    makeWidget(lines(5) + pictureHtml(200, QSize(60, 30), Qt::red));
    QVERIFY(m_widget->width() <= 40);
    QVERIFY(m_widget->height() >= 10);
    QWidget page;
    page.resize(100, 100);
    m_widget->setParent(&page);
    m_widget->show();
    page.show();
    QVERIFY(QTest::qWaitForWindowExposed(&page));
    m_widget->insertPlainText(QStringLiteral("typed"));
    page.grab();
    m_widget->setParent(nullptr);
    m_context->setPageWidth(952);
    QCOMPARE(m_widget->subWidgetAt(0)->width(), 724);
}

void KvTextDocumentNodeWidgetTest::worksWithoutAContext()
{
    KvTextDocumentNodeCfg cfg(nullptr);
    cfg.setText(QStringLiteral("<p>${CREATION_TIME}</p>"));
    KvTextDocumentNodeWidget widget(nullptr, &cfg);
    QCOMPARE(widget.toPlainText(), QStringLiteral("${CREATION_TIME}"));
    QSignalSpy config(widget.displaySignals(),
                      SIGNAL(signalWidgetConfigChanged(const KvBaseEditorNodeCfg *)));
    widget.insertPlainText(QStringLiteral("x"));
    QCOMPARE(config.count(), 1);
    QVERIFY(widget.subWidgetAt(0));
}

STATREPORT_TEST_MAIN(KvTextDocumentNodeWidgetTest)
#include "KvTextDocumentNodeWidgetTest.moc"
