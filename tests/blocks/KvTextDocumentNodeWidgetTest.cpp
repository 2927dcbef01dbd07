// SPDX-License-Identifier: MIT
#include "support/StatReportTest.h"

#include "ConfigArgument.h"
#include "KvTextDocumentDialogProbe.h"
#include "MetaMethods.h"
#include "blocks/textdocument/KvAddLinkDialog.h"
#include "blocks/textdocument/KvRichTextGuard.h"
#include "blocks/textdocument/KvTextDocumentNodeCfg.h"
#include "blocks/textdocument/KvTextDocumentNodeOptionsWidget.h"
#include "blocks/textdocument/KvTextDocumentNodeWidget.h"
#include "kernel/ZtAppSettings.h"
#include "report/KvBaseDisplayWidgetSignals.h"
#include "templates/KvTemplateContext.h"

#include <QBuffer>
#include <QClipboard>
#include <QGuiApplication>
#include <QPainter>
#include <QPdfWriter>
#include <QScrollBar>
#include <QTextDocument>

#include <sys/stat.h>

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
    void picturesInTheTextArePrinted();
    void picturesOfFilesAreShown();
    void neverWaitsForAPipe_data();
    void neverWaitsForAPipe();
    void isNoHigherThanAWidgetCanBe();
    void layoutDoesNotDependOnTheScreen_data();
    void layoutDoesNotDependOnTheScreen();
    void rightToLeftText();
    void longParagraphs();
    void sizeIsRightWhenShownLater();
    void survivesTinyPages_data();
    void survivesTinyPages();
    void worksWithoutAContext();
    void hasItsSlots();
    void takesNoInputWhileItIsShown();
    void takesNoDrops_data();
    void takesNoDrops();
    void leavesTheWheelToThePage_data();
    void leavesTheWheelToThePage();
    void panelOpensTheText();
    void panelEndsTheEditing();
    void keywordsArePlaceholdersWhileEdited();
    void lookingIsNoEdit_data();
    void lookingIsNoEdit();
    void typingKeepsPlaceholders();
    void endOfEditingStoresWhatIsLeft();
    void valuesMayNeedOtherRoom();
    void undoStopsAtThePlaceholders();
    void selectionEndsWithTheEditing();
    void secondPanelTakesOver();
    void textMayDieBeforeItsPanel();
    void printingEndsTheEditing();
    void formatsAreApplied_data();
    void formatsAreApplied();
    void formatsOfASelectionAreStored();
    void keysFormat_data();
    void keysFormat();
    void keysComeBeforeThoseOfMenus();
    void keysInsertALink();
    void newTextIsBlack();
    void linksAreReadableInAnyTheme_data();
    void linksAreReadableInAnyTheme();
    void pastedMarkupIsTamed_data();
    void pastedMarkupIsTamed();
    void pastedPicturesAreEmbedded();
    void pictureOfATextIsPastedAsText();
    void nothingIsPastedIntoAShownText();
    void pictureIsNotInsertedWhenItCannotBeEncoded();

private:
    /** Opens the text's options panel, which is deleted by closePanel(). */
    KvTextDocumentNodeOptionsWidget *openPanel();
    void closePanel() { m_side.reset(); }
    bool show()
    {
        m_widget->show();
        return QTest::qWaitForWindowExposed(m_widget.get());
    }
    /** Makes the widget anew, showing \a html. */
    void makeWidget(const QString &html);
    QString shownText() const { return m_widget->toPlainText(); }

    std::unique_ptr<KvTemplateContext> m_context;
    std::unique_ptr<KvTextDocumentNodeCfg> m_cfg;
    std::unique_ptr<KvTextDocumentNodeWidget> m_widget;
    std::unique_ptr<QWidget> m_side; ///< holds the panel
};

void KvTextDocumentNodeWidgetTest::init()
{
    StatReportTest::init();
    m_context = std::make_unique<KvTemplateContext>(nullptr);
    makeWidget(QString());
}

void KvTextDocumentNodeWidgetTest::cleanup()
{
    m_side.reset();
    m_widget.reset();
    m_cfg.reset();
    m_context.reset();
    StatReportTest::cleanup();
}

KvTextDocumentNodeOptionsWidget *KvTextDocumentNodeWidgetTest::openPanel()
{
    m_side = std::make_unique<QWidget>();
    return qobject_cast<KvTextDocumentNodeOptionsWidget *>(m_widget->createOptionsWidget(m_side.get(), true));
}

void KvTextDocumentNodeWidgetTest::makeWidget(const QString &html)
{
    m_side.reset();
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
    openPanel();
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
    openPanel();
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
    openPanel();
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
    openPanel();
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

void KvTextDocumentNodeWidgetTest::picturesInTheTextArePrinted()
{
    makeWidget(QStringLiteral("<p>before</p>%1<p>after</p>").arg(pictureHtml(200, QSize(600, 300), Qt::red)));
    QByteArray bytes;
    QBuffer file(&bytes);
    QVERIFY(file.open(QIODevice::WriteOnly));
    QPdfWriter writer(&file);
    QPainter painter(&writer);
    m_widget->render(&painter);
    QVERIFY(painter.end());
    QVERIFY(bytes.contains("/Subtype /Image"));
    QVERIFY(bytes.contains("/Width 600"));
}

void KvTextDocumentNodeWidgetTest::picturesOfFilesAreShown()
{
    const QString path = temporaryPath(QStringLiteral("picture.png"));
    QImage image(60, 30, QImage::Format_RGB32);
    image.fill(Qt::red);
    QVERIFY(image.save(path));
    makeWidget(QStringLiteral("<img src=\"%1\"/>").arg(path));
    const QImage shown = m_widget->grab().toImage();
    QCOMPARE(shown.pixelColor(20, 20), QColor(Qt::red));
}

void KvTextDocumentNodeWidgetTest::neverWaitsForAPipe_data()
{
    QTest::addColumn<QString>("html");
    QTest::newRow("picture") << "<p>a<img src=\"file://%1\"/>b</p>";
    QTest::newRow("path alone") << "<p>a<img src=\"%1\"/>b</p>";
    QTest::newRow("style sheet")
        << "<head><link rel=\"stylesheet\" type=\"text/css\" href=\"%1\"/></head><p>ab</p>";
}

void KvTextDocumentNodeWidgetTest::neverWaitsForAPipe()
{
    QFETCH(QString, html);
    const QString path = temporaryPath(QStringLiteral("pipe"));
    QFile::remove(path);
    QCOMPARE(mkfifo(QFile::encodeName(path).constData(), 0600), 0);
    makeWidget(html.arg(path)); // opening it would wait for somebody to write
    m_widget->grab();
    QCOMPARE(shownText().remove(QChar::ObjectReplacementCharacter), QStringLiteral("ab"));
}

void KvTextDocumentNodeWidgetTest::isNoHigherThanAWidgetCanBe()
{
    // Pictures that a damaged file makes far too large would leave the layout without an end.
    makeWidget(
        QStringLiteral("<p><img height=\"999999999\" width=\"999999999\" src=\"none\"/></p>").repeated(20));
    QVERIFY(m_widget->height() >= 20 * KvRichTextGuard::LargestNumber);
    // Qt would warn of a height that no widget can have.
    makeWidget(QStringLiteral("<p style=\"font-size:20000px; line-height:99999%\">a</p>"));
    QVERIFY(m_widget->document()->size().height() > QWIDGETSIZE_MAX);
    QCOMPARE(m_widget->height(), QWIDGETSIZE_MAX);
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

void KvTextDocumentNodeWidgetTest::hasItsSlots()
{
    QCOMPARE(ownMethods(KvTextDocumentNodeWidget::staticMetaObject, QMetaMethod::Slot),
             (QStringList{"slotTextChanged()", "slotFontSizeChanged(uint)", "slotTextColorChanged(QColor)",
                          "slotAlignmentChanged(Qt::Alignment)",
                          "slotVAlignmentChanged(QTextCharFormat::VerticalAlignment)",
                          "slotBoldChanged(bool)", "slotItalicChanged(bool)", "slotUnderlineChanged(bool)",
                          "slotOptionsWidgetDestroyed()"}));
}

void KvTextDocumentNodeWidgetTest::takesNoInputWhileItIsShown()
{
    makeWidget(QStringLiteral("<p>ab ${PROGRAM_NAME}</p>"));
    QVERIFY(show());
    const QString shown = shownText();
    TextSpies spies(*m_widget, m_context.get());
    QVERIFY(!m_widget->isEditing());
    QVERIFY(m_widget->isReadOnly());
    QCOMPARE(m_widget->focusPolicy(), Qt::NoFocus);
    m_widget->setFocus();
    QTest::keyClicks(m_widget.get(), QStringLiteral("xyz"));
    QTest::keyClick(m_widget.get(), Qt::Key_B, Qt::ControlModifier);
    QTest::keyClick(m_widget.get(), Qt::Key_K, Qt::ControlModifier);
    QTest::keyClick(m_widget.get(), Qt::Key_A, Qt::ControlModifier);
    QTest::mouseDClick(m_widget->viewport(), Qt::LeftButton, Qt::NoModifier, QPoint(10, 22));
    QVERIFY(!m_widget->textCursor().hasSelection());
    QCOMPARE(shownText(), shown);
    QCOMPARE(spies.config.count() + spies.modified.count() + spies.changed.count(), 0);
}

void KvTextDocumentNodeWidgetTest::takesNoDrops_data()
{
    QTest::addColumn<bool>("edited");
    QTest::newRow("shown") << false;
    QTest::newRow("edited") << true;
}

void KvTextDocumentNodeWidgetTest::takesNoDrops()
{
    QFETCH(bool, edited);
    makeWidget(QStringLiteral("<p>ab</p>"));
    if (edited)
        openPanel();
    QVERIFY(show());
    QVERIFY(!m_widget->acceptDrops());
    QVERIFY(!m_widget->viewport()->acceptDrops());
    QMimeData data;
    data.setText(QStringLiteral("file:///picture.png"));
    data.setHtml(QStringLiteral("<b>dragged</b>"));
    for (QWidget *target : {static_cast<QWidget *>(m_widget.get()), m_widget->viewport()}) {
        QDragEnterEvent enter(QPoint(10, 22), Qt::CopyAction, &data, Qt::LeftButton, Qt::NoModifier);
        enter.ignore();
        QCoreApplication::sendEvent(target, &enter);
        QVERIFY(!enter.isAccepted());
    }
    QCOMPARE(shownText(), QStringLiteral("ab"));
}

void KvTextDocumentNodeWidgetTest::leavesTheWheelToThePage_data()
{
    QTest::addColumn<bool>("edited");
    QTest::addColumn<Qt::KeyboardModifiers>("modifiers");
    QTest::newRow("shown") << false << Qt::KeyboardModifiers(Qt::NoModifier);
    QTest::newRow("shown, zooming") << false << Qt::KeyboardModifiers(Qt::ControlModifier);
    QTest::newRow("edited") << true << Qt::KeyboardModifiers(Qt::NoModifier);
    QTest::newRow("edited, zooming") << true << Qt::KeyboardModifiers(Qt::ControlModifier);
}

void KvTextDocumentNodeWidgetTest::leavesTheWheelToThePage()
{
    QFETCH(bool, edited);
    QFETCH(Qt::KeyboardModifiers, modifiers);
    makeWidget(lines(5));
    if (edited)
        openPanel();
    QVERIFY(show());
    const QSize size = m_widget->size();
    QWheelEvent wheel(QPointF(10, 22), QPointF(10, 22), QPoint(), QPoint(0, 120), Qt::NoButton, modifiers,
                      Qt::NoScrollPhase, false);
    QCoreApplication::sendEvent(m_widget->viewport(), &wheel);
    QVERIFY(!wheel.isAccepted());
    QCOMPARE(m_widget->size(), size);
    QCOMPARE(m_widget->document()->defaultFont().pixelSize(), 12);
}

void KvTextDocumentNodeWidgetTest::panelOpensTheText()
{
    makeWidget(QStringLiteral("<p>ab</p>"));
    QVERIFY(show());
    QWidget side;
    QWidget *panel = m_widget->createOptionsWidget(&side, true);
    QVERIFY(qobject_cast<KvTextDocumentNodeOptionsWidget *>(panel));
    QCOMPARE(panel->parentWidget(), &side);
    QVERIFY(m_widget->isEditing());
    QVERIFY(!m_widget->isReadOnly());
    QVERIFY(m_widget->focusPolicy() & Qt::ClickFocus);
    QTest::keyClick(m_widget.get(), Qt::Key_X);
    QCOMPARE(shownText(), QStringLiteral("xab"));
    QTest::mouseDClick(m_widget->viewport(), Qt::LeftButton, Qt::NoModifier, QPoint(10, 22));
    QCOMPARE(m_widget->textCursor().selectedText(), QStringLiteral("xab"));

    // There is no width or alignment to leave out.
    const std::unique_ptr<QWidget> other(m_widget->createOptionsWidget(nullptr, false));
    QCOMPARE(other->sizeHint(), panel->sizeHint());
}

void KvTextDocumentNodeWidgetTest::panelEndsTheEditing()
{
    makeWidget(QStringLiteral("<p>ab</p>"));
    QVERIFY(show());
    delete openPanel();
    QVERIFY(!m_widget->isEditing());
    QVERIFY(m_widget->isReadOnly());
    QTest::keyClick(m_widget.get(), Qt::Key_X);
    QCOMPARE(shownText(), QStringLiteral("ab"));
    // And it begins anew with the next panel.
    openPanel();
    QTest::keyClick(m_widget.get(), Qt::Key_X);
    QCOMPARE(shownText(), QStringLiteral("xab"));
}

void KvTextDocumentNodeWidgetTest::keywordsArePlaceholdersWhileEdited()
{
    const QString stored = QStringLiteral("<p>${CREATION_TIME}, ${PROGRAM_NAME}</p>");
    makeWidget(stored);
    const QString placeholders = QStringLiteral("${CREATION_TIME}, ${PROGRAM_NAME}");
    QVERIFY(!shownText().contains(QLatin1Char('$')));
    openPanel();
    QCOMPARE(shownText(), placeholders);
    closePanel();
    QVERIFY(!shownText().contains(QLatin1Char('$')));
    QVERIFY(shownText().endsWith(QStringLiteral(", ") + ZtAppSettings::getProgramName()));
    QCOMPARE(m_cfg->text(), stored);
}

void KvTextDocumentNodeWidgetTest::lookingIsNoEdit_data()
{
    showingIsNoEdit_data();
    QTest::newRow("tables too deep") << QStringLiteral("<table><tr><td>").repeated(12) + QLatin1Char('x');
}

void KvTextDocumentNodeWidgetTest::lookingIsNoEdit()
{
    QFETCH(QString, html);
    makeWidget(html);
    QVERIFY(show());
    TextSpies spies(*m_widget, m_context.get());
    for (int i = 0; i < 2; ++i) {
        openPanel();
        QTest::mouseClick(m_widget->viewport(), Qt::LeftButton, Qt::NoModifier, QPoint(10, 10));
        QTest::keyClick(m_widget.get(), Qt::Key_End);
        closePanel();
    }
    QCOMPARE(m_cfg->text(), html);
    QCOMPARE(spies.config.count(), 0);
    QCOMPARE(spies.modified.count(), 0);
}

void KvTextDocumentNodeWidgetTest::typingKeepsPlaceholders()
{
    makeWidget(QStringLiteral("${CREATION_TIME}"));
    openPanel();
    QVERIFY(show());
    m_widget->moveCursor(QTextCursor::End);
    QTest::keyClicks(m_widget.get(), QStringLiteral(" h"));
    QCOMPARE(shownText(), QStringLiteral("${CREATION_TIME} h"));
    QCOMPARE(m_widget->textCursor().position(), shownText().size());
    QCOMPARE(m_cfg->text(), m_widget->toHtml());
    closePanel();
    QVERIFY(!shownText().contains(QLatin1Char('$')));
    QVERIFY(shownText().endsWith(QStringLiteral(" h")));
    QVERIFY(m_cfg->text().contains(QStringLiteral("${CREATION_TIME} h")));
    QJsonObject config;
    QVERIFY(m_cfg->toJson(config));
    QVERIFY(config["text"].toString().contains(QStringLiteral("${CREATION_TIME} h")));
}

void KvTextDocumentNodeWidgetTest::endOfEditingStoresWhatIsLeft()
{
    makeWidget(QStringLiteral("<p>ab</p>"));
    openPanel();
    {
        const QSignalBlocker blocker(m_widget.get());
        m_widget->moveCursor(QTextCursor::End);
        m_widget->insertPlainText(QStringLiteral(" unannounced"));
    }
    QCOMPARE(m_cfg->text(), QStringLiteral("<p>ab</p>"));
    {
        TextSpies spies(*m_widget, m_context.get());
        closePanel();
        QVERIFY(m_cfg->text().contains(QStringLiteral("ab unannounced")));
        QCOMPARE(spies.config.count(), 1);
        QCOMPARE(configArgument(spies.config, 0), m_cfg.get());
        QCOMPARE(spies.modified.count(), 1);
    }

    // What was stored with the last key is not announced again.
    openPanel();
    m_widget->insertPlainText(QStringLiteral("more "));
    TextSpies spies(*m_widget, m_context.get());
    closePanel();
    QCOMPARE(spies.config.count(), 0);
    QCOMPARE(spies.modified.count(), 0);
    QCOMPARE(shownText(), QStringLiteral("more ab unannounced"));
}

void KvTextDocumentNodeWidgetTest::valuesMayNeedOtherRoom()
{
    ZtAppSettings::setProgramInfo(QStringLiteral("one<br>two<br>three"), QString(), QString());
    makeWidget(QStringLiteral("<p>${PROGRAM_NAME}</p>"));
    const int expandedHeight = m_widget->height();
    TextSpies spies(*m_widget, m_context.get());
    openPanel();
    QVERIFY(m_widget->height() < expandedHeight);
    QCOMPARE(spies.changed.count(), 1);
    closePanel();
    QCOMPARE(m_widget->height(), expandedHeight);
    QCOMPARE(spies.changed.count(), 2);
    // Nothing moves for nothing.
    m_cfg->setText(QStringLiteral("<p>${PROGRAM_VERSION}</p>"));
    m_widget->refreshText();
    spies.changed.clear();
    openPanel();
    closePanel();
    QCOMPARE(spies.changed.count(), 0);
    ZtAppSettings::setProgramInfo(QString(), QString(), QString());
}

void KvTextDocumentNodeWidgetTest::undoStopsAtThePlaceholders()
{
    makeWidget(QStringLiteral("<p>${PROGRAM_NAME}</p>"));
    openPanel();
    QVERIFY(show());
    m_widget->moveCursor(QTextCursor::End);
    QTest::keyClicks(m_widget.get(), QStringLiteral("xy"));
    for (int i = 0; i < 5; ++i)
        QTest::keyClick(m_widget.get(), Qt::Key_Z, Qt::ControlModifier);
    QCOMPARE(shownText(), QStringLiteral("${PROGRAM_NAME}"));
    QTest::keyClick(m_widget.get(), Qt::Key_Z, Qt::ControlModifier | Qt::ShiftModifier);
    QVERIFY(shownText().startsWith(QStringLiteral("${PROGRAM_NAME}x")));
    QCOMPARE(m_cfg->text(), m_widget->toHtml());
}

void KvTextDocumentNodeWidgetTest::selectionEndsWithTheEditing()
{
    makeWidget(QStringLiteral("<p>ab</p>"));
    openPanel();
    m_widget->selectAll();
    QVERIFY(m_widget->textCursor().hasSelection());
    closePanel();
    QVERIFY(!m_widget->textCursor().hasSelection());
}

void KvTextDocumentNodeWidgetTest::secondPanelTakesOver()
{
    makeWidget(QStringLiteral("<p>${PROGRAM_NAME}</p>"));
    QWidget side;
    auto *first = qobject_cast<KvTextDocumentNodeOptionsWidget *>(m_widget->createOptionsWidget(&side, true));
    m_widget->insertPlainText(QStringLiteral("typed "));
    m_widget->moveCursor(QTextCursor::End);
    auto *second =
        qobject_cast<KvTextDocumentNodeOptionsWidget *>(m_widget->createOptionsWidget(&side, true));
    QVERIFY(first != second);
    QCOMPARE(shownText(), QStringLiteral("typed ${PROGRAM_NAME}"));
    QVERIFY(m_widget->textCursor().atEnd()); // it goes on where it was
    QVERIFY(!first->isEnabled());
    QVERIFY(second->isEnabled());

    emit first->signalItalicChanged(true);
    QVERIFY(!m_widget->fontItalic());
    emit second->signalItalicChanged(true);
    QVERIFY(m_widget->fontItalic());
    delete first;
    QVERIFY(m_widget->isEditing());
    QCOMPARE(shownText(), QStringLiteral("typed ${PROGRAM_NAME}"));
    delete second;
    QVERIFY(!m_widget->isEditing());
    QVERIFY(!shownText().contains(QLatin1Char('$')));
}

void KvTextDocumentNodeWidgetTest::textMayDieBeforeItsPanel()
{
    makeWidget(QStringLiteral("<p>ab</p>"));
    auto *panel = openPanel();
    m_widget->moveCursor(QTextCursor::End);
    m_widget->insertPlainText(QStringLiteral(" typed"));
    m_widget.reset();
    emit panel->signalBoldChanged(true);
    panel->slotStateChanged();
    closePanel();
    QVERIFY(m_cfg->text().contains(QStringLiteral("ab typed")));
}

void KvTextDocumentNodeWidgetTest::printingEndsTheEditing()
{
    makeWidget(QStringLiteral("<p>${PROGRAM_NAME}</p>"));
    auto *panel = openPanel();
    m_widget->moveCursor(QTextCursor::End);
    m_widget->insertPlainText(QStringLiteral(" typed"));
    QCOMPARE(m_widget->subWidgetAt(0), m_widget.get());
    QVERIFY(m_widget->isEditing()); // the screen asks as well
    m_context->setPrinting(true);
    QCOMPARE(m_widget->subWidgetAt(0), m_widget.get());
    m_context->setPrinting(false);
    QCOMPARE(shownText(), ZtAppSettings::getProgramName() + QStringLiteral(" typed"));
    QVERIFY(!m_widget->isEditing());
    QVERIFY(!panel->isEnabled());
    QVERIFY(m_cfg->text().contains(QStringLiteral("${PROGRAM_NAME} typed")));
    closePanel();
    QVERIFY(m_cfg->text().contains(QStringLiteral("${PROGRAM_NAME} typed")));
}

using FormatSignal = void (*)(KvTextDocumentNodeOptionsWidget *);
using FormatTest = bool (*)(const KvTextDocumentNodeWidget &);
Q_DECLARE_METATYPE(FormatSignal)
Q_DECLARE_METATYPE(FormatTest)

void KvTextDocumentNodeWidgetTest::formatsAreApplied_data()
{
    using Panel = KvTextDocumentNodeOptionsWidget;
    using Text = KvTextDocumentNodeWidget;
    QTest::addColumn<QString>("html");
    QTest::addColumn<FormatSignal>("announce");
    QTest::addColumn<FormatTest>("isApplied");
    const auto add = [](const char *name, const char *html, FormatSignal announce, FormatTest isApplied) {
        QTest::newRow(name) << QString::fromLatin1(html) << announce << isApplied;
    };
    const char plain[] = "<p>a</p>";
    const char formatted[] = "<p align=\"right\"><b><i><u><sup>a</sup></u></i></b></p>";
    add(
        "size", plain, [](Panel *panel) { emit panel->signalFontSizeChanged(20); },
        [](const Text &text) { return text.fontPointSize() == 20.0; });
    add(
        "color", plain, [](Panel *panel) { emit panel->signalTextColorChanged(Qt::red); },
        [](const Text &text) { return text.textColor() == QColor(Qt::red); });
    add(
        "bold", plain, [](Panel *panel) { emit panel->signalBoldChanged(true); },
        [](const Text &text) { return text.fontWeight() == 75; });
    add(
        "not bold", formatted, [](Panel *panel) { emit panel->signalBoldChanged(false); },
        [](const Text &text) { return text.fontWeight() == 50; });
    add(
        "italic", plain, [](Panel *panel) { emit panel->signalItalicChanged(true); },
        [](const Text &text) { return text.fontItalic(); });
    add(
        "not italic", formatted, [](Panel *panel) { emit panel->signalItalicChanged(false); },
        [](const Text &text) { return !text.fontItalic(); });
    add(
        "underline", plain, [](Panel *panel) { emit panel->signalUnderlineChanged(true); },
        [](const Text &text) { return text.fontUnderline(); });
    add(
        "no underline", formatted, [](Panel *panel) { emit panel->signalUnderlineChanged(false); },
        [](const Text &text) { return !text.fontUnderline(); });
    add(
        "center", plain, [](Panel *panel) { emit panel->signalAlignmentChanged(Qt::AlignCenter); },
        [](const Text &text) { return text.alignment() == Qt::AlignCenter; });
    add(
        "left", formatted, [](Panel *panel) { emit panel->signalAlignmentChanged(Qt::AlignLeft); },
        [](const Text &text) { return text.alignment() == Qt::AlignLeft; });
    add(
        "subscript", plain,
        [](Panel *panel) { emit panel->signalVAlignmentChanged(QTextCharFormat::AlignSubScript); },
        [](const Text &text) {
            return text.currentCharFormat().verticalAlignment() == QTextCharFormat::AlignSubScript;
        });
    add(
        "no superscript", formatted,
        [](Panel *panel) { emit panel->signalVAlignmentChanged(QTextCharFormat::AlignNormal); },
        [](const Text &text) {
            return text.currentCharFormat().verticalAlignment() == QTextCharFormat::AlignNormal;
        });
}

void KvTextDocumentNodeWidgetTest::formatsAreApplied()
{
    QFETCH(QString, html);
    QFETCH(FormatSignal, announce);
    QFETCH(FormatTest, isApplied);
    makeWidget(html);
    auto *panel = openPanel();
    QVERIFY(show());
    m_widget->moveCursor(QTextCursor::End);
    m_widget->clearFocus();
    const QSignalSpy focusBack(m_widget->displaySignals(), SIGNAL(signalFocusBackToPageView()));
    QVERIFY(!isApplied(*m_widget));
    announce(panel);
    QVERIFY(isApplied(*m_widget));
    QCOMPARE(focusBack.count(), 1);
    QCOMPARE(m_widget->window()->focusWidget(), m_widget.get());
    // It holds for what is typed next, and is stored with it.
    QTest::keyClick(m_widget.get(), Qt::Key_Z);
    QVERIFY(isApplied(*m_widget));
    closePanel();
    m_widget->moveCursor(QTextCursor::End);
    QVERIFY(isApplied(*m_widget) || m_widget->alignment() == Qt::AlignHCenter);
}

void KvTextDocumentNodeWidgetTest::formatsOfASelectionAreStored()
{
    makeWidget(QStringLiteral("<p>abc</p>"));
    auto *panel = openPanel();
    m_widget->selectAll();
    TextSpies spies(*m_widget, m_context.get());
    emit panel->signalBoldChanged(true);
    QVERIFY(m_cfg->text().contains(QStringLiteral("font-weight:600")));
    QCOMPARE(spies.config.count(), 1);
    emit panel->signalFontSizeChanged(36);
    QVERIFY(m_cfg->text().contains(QStringLiteral("font-size:36pt")));
    QCOMPARE(spies.changed.count(), 1); // the line is higher now
}

void KvTextDocumentNodeWidgetTest::keysFormat_data()
{
    QTest::addColumn<int>("key");
    QTest::addColumn<FormatTest>("isApplied");
    using Text = KvTextDocumentNodeWidget;
    QTest::newRow("bold") << int(Qt::Key_B)
                          << FormatTest([](const Text &text) { return text.fontWeight() == 75; });
    QTest::newRow("italic") << int(Qt::Key_I)
                            << FormatTest([](const Text &text) { return text.fontItalic(); });
    QTest::newRow("underline") << int(Qt::Key_U)
                               << FormatTest([](const Text &text) { return text.fontUnderline(); });
}

void KvTextDocumentNodeWidgetTest::keysFormat()
{
    QFETCH(int, key);
    QFETCH(FormatTest, isApplied);
    makeWidget(QStringLiteral("<p>abc</p>"));
    openPanel();
    QVERIFY(show());
    m_widget->moveCursor(QTextCursor::End);
    for (const bool on : {true, false, true}) {
        QTest::keyClick(m_widget.get(), static_cast<Qt::Key>(key), Qt::ControlModifier);
        QCOMPARE(isApplied(*m_widget), on);
        QCOMPARE(shownText(), QStringLiteral("abc"));
    }
}

void KvTextDocumentNodeWidgetTest::keysComeBeforeThoseOfMenus()
{
    for (const bool edited : {false, true}) {
        if (edited)
            openPanel();
        for (const int key : {Qt::Key_B, Qt::Key_I, Qt::Key_U, Qt::Key_K}) {
            QKeyEvent event(QEvent::ShortcutOverride, key, Qt::ControlModifier);
            event.ignore();
            QCoreApplication::sendEvent(m_widget.get(), &event);
            QCOMPARE(event.isAccepted(), edited);
        }
        QKeyEvent save(QEvent::ShortcutOverride, Qt::Key_S, Qt::ControlModifier);
        save.ignore();
        QCoreApplication::sendEvent(m_widget.get(), &save);
        QVERIFY(!save.isAccepted());
    }
}

void KvTextDocumentNodeWidgetTest::keysInsertALink()
{
    openPanel();
    QVERIFY(show());
    const KvTextDocumentDialogProbe<KvAddLinkDialog> probe([](KvAddLinkDialog *dialog) {
        dialog->setTitle(QStringLiteral("title"));
        dialog->accept();
    });
    QTest::keyClick(m_widget.get(), Qt::Key_K, Qt::ControlModifier);
    QCOMPARE(probe.count(), 1);
    QCOMPARE(shownText(), QStringLiteral("title "));
}

void KvTextDocumentNodeWidgetTest::newTextIsBlack()
{
    openPanel();
    QVERIFY(show());
    QTest::keyClick(m_widget.get(), Qt::Key_X);
    QCOMPARE(m_widget->textColor(), QColor(Qt::black));
    QCOMPARE(m_widget->palette().color(QPalette::Text), QColor(Qt::black));
}

void KvTextDocumentNodeWidgetTest::linksAreReadableInAnyTheme_data()
{
    QTest::addColumn<QColor>("themeColor");
    QTest::newRow("dark") << QColor(Qt::yellow);
    QTest::newRow("light") << QColor(Qt::blue);
}

void KvTextDocumentNodeWidgetTest::linksAreReadableInAnyTheme()
{
    QFETCH(QColor, themeColor);
    const QPalette before = QGuiApplication::palette();
    QPalette theme = before;
    theme.setColor(QPalette::Link, themeColor);
    QGuiApplication::setPalette(theme);
    makeWidget(QStringLiteral("<p><a href=\"u\">link</a> <a href=\"u\" style=\"color:red\">own</a></p>"));
    openPanel();
    m_widget->moveCursor(QTextCursor::End);
    m_widget->insertHtml(QStringLiteral("<a href=\"u\" style=\"font-size:9pt;\" >new</a>"));
    QGuiApplication::setPalette(before);
    const QColor paperColor(0x00, 0x65, 0x9D);
    QTextCursor cursor(m_widget->document());
    const auto colorAt = [&cursor](int position) {
        cursor.setPosition(position);
        return cursor.charFormat().foreground().color();
    };
    QCOMPARE(colorAt(2), paperColor);
    QCOMPARE(colorAt(7), QColor(Qt::red));
    QCOMPARE(colorAt(shownText().size()), paperColor);
    QVERIFY(!m_cfg->text().contains(themeColor.name()));
}

void KvTextDocumentNodeWidgetTest::pastedMarkupIsTamed_data()
{
    QTest::addColumn<QString>("format");
    QTest::addColumn<QString>("pasted");
    const QString tables = QStringLiteral("<table><tr><td>").repeated(30) + QStringLiteral("inmost");
    const QString word(KvRichTextGuard::LongestWord + 10, QLatin1Char('m'));
    QTest::newRow("markup") << "text/html" << tables;
    QTest::newRow("from another text") << "application/x-qrichtext" << tables;
    QTest::newRow("long word in markup") << "text/html" << QStringLiteral("<p>") + word;
    QTest::newRow("long word") << "text/plain" << word;
    QTest::newRow("ordinary markup") << "text/html"
                                     << "<p><b>bold</b> words</p>";
    QTest::newRow("markup as plain text") << "text/plain"
                                          << "<b>not bold</b>";
}

void KvTextDocumentNodeWidgetTest::pastedMarkupIsTamed()
{
    QFETCH(QString, format);
    QFETCH(QString, pasted);
    openPanel();
    auto *data = new QMimeData;
    data->setData(format, pasted.toUtf8());
    QGuiApplication::clipboard()->setMimeData(data);
    QVERIFY(m_widget->canPaste());
    m_widget->paste();

    const bool isPlain = format == QLatin1String("text/plain");
    QTextDocument expected;
    if (isPlain)
        expected.setPlainText(KvRichTextGuard::tamedPlain(pasted));
    else
        expected.setHtml(KvRichTextGuard::tamed(pasted));
    // Text copied from a report keeps the blanks that stand for its tables.
    QCOMPARE(shownText().simplified(), expected.toPlainText().simplified());
    QCOMPARE(m_cfg->text(), m_widget->toHtml());
    if (shownText().startsWith(QStringLiteral("bold")))
        QVERIFY(m_cfg->text().contains(QStringLiteral("font-weight:600")));
}

void KvTextDocumentNodeWidgetTest::pastedPicturesAreEmbedded()
{
    for (const int pictureWidth : {60, 3000}) {
        makeWidget(QString());
        openPanel();
        QImage image(pictureWidth, 30, QImage::Format_RGB32);
        image.fill(Qt::red);
        QGuiApplication::clipboard()->setImage(image);
        QVERIFY(m_widget->canPaste());
        m_widget->paste();
        QTextCursor cursor(m_widget->document());
        cursor.setPosition(1);
        const QTextImageFormat format = cursor.charFormat().toImageFormat();
        QVERIFY(format.isValid());
        QCOMPARE(format.width(), qreal(qMin(pictureWidth, 724)));
        QVERIFY(m_cfg->text().contains(QStringLiteral("data:image/png;base64, ")));
    }
}

void KvTextDocumentNodeWidgetTest::pictureOfATextIsPastedAsText()
{
    openPanel();
    auto *data = new QMimeData;
    QImage image(60, 30, QImage::Format_RGB32);
    image.fill(Qt::red);
    data->setImageData(image);
    data->setHtml(QStringLiteral("<i>copied</i> text"));
    data->setText(QStringLiteral("copied text"));
    QGuiApplication::clipboard()->setMimeData(data);
    m_widget->paste();
    QCOMPARE(shownText(), QStringLiteral("copied text"));
    QVERIFY(m_cfg->text().contains(QStringLiteral("font-style:italic")));
    QVERIFY(!m_cfg->text().contains(QStringLiteral("<img")));
}

void KvTextDocumentNodeWidgetTest::nothingIsPastedIntoAShownText()
{
    makeWidget(QStringLiteral("<p>ab</p>"));
    QImage image(60, 30, QImage::Format_RGB32);
    image.fill(Qt::red);
    QGuiApplication::clipboard()->setImage(image);
    m_widget->paste();
    QGuiApplication::clipboard()->setText(QStringLiteral("pasted"));
    m_widget->paste();
    QCOMPARE(shownText(), QStringLiteral("ab"));
    QVERIFY(!m_widget->document()->isModified());
    QVERIFY(!m_widget->canPaste());
}

void KvTextDocumentNodeWidgetTest::pictureIsNotInsertedWhenItCannotBeEncoded()
{
    openPanel();
    const QSignalSpy focusBack(m_widget->displaySignals(), SIGNAL(signalFocusBackToPageView()));
    m_widget->insertPicture(QPixmap(), 100, QStringLiteral("style=\"float:none;\""));
    QVERIFY(m_widget->document()->isEmpty());
    QCOMPARE(focusBack.count(), 0);
}

STATREPORT_TEST_MAIN(KvTextDocumentNodeWidgetTest)
#include "KvTextDocumentNodeWidgetTest.moc"
