// SPDX-License-Identifier: MIT
#include "kernel/ZtAppSettings.h"
#include "report/KvBaseDisplayWidgetSignals.h"
#include "report/KvFooterWidget.h"
#include "report/KvHeaderWidget.h"
#include "support/FakeReport.h"
#include "support/StatReportTest.h"

#include <QTextCursor>

namespace {

/** Counts how often a header shows its text anew. */
class CountedHeader : public KvHeaderWidget
{
public:
    using KvHeaderWidget::KvHeaderWidget;

    static int countRefreshes(QTextDocument *document, const std::function<void()> &act)
    {
        int count = 0;
        const QMetaObject::Connection connection =
            QObject::connect(document, &QTextDocument::contentsChanged, document, [&count]() { ++count; });
        act();
        QObject::disconnect(connection);
        return count;
    }
};

} // namespace

class KvHeaderFooterWidgetTest : public StatReportTest
{
    Q_OBJECT

private slots:
    void hasItsName();
    void isATextOfItsSection();
    void followsTheTemplate();
    void rendersOncePerAnnouncement();
    void rendersOnlyWhatIsNew_data();
    void rendersOnlyWhatIsNew();
    void typingIsNotOverwritten();
    void typingReachesTheOtherPages();
    void hasThePanelOfATextUnderItsName();
    void placeholdersStayWhileEdited();
    void endOfEditingReachesTheOtherPages();
    void growingIsAnnouncedOnce();
    void measuringSettlesTheAnnouncement();
    void textSpansTheWidth();
    void fitsToAWidth_data();
    void fitsToAWidth();
};

void KvHeaderFooterWidgetTest::hasItsName()
{
    FakeReport report;
    const std::unique_ptr<KvHeaderWidget> header(report.model()->createHeaderWidget());
    const std::unique_ptr<KvFooterWidget> footer(report.model()->createFooterWidget());
    QCOMPARE(header->displayName(), QStringLiteral("Header"));
    QCOMPARE(footer->displayName(), QStringLiteral("Footer"));
}

void KvHeaderFooterWidgetTest::isATextOfItsSection()
{
    FakeReport report;
    report.model()->header()->setText(QStringLiteral("<b>top</b>"));
    report.model()->footer()->setText(QStringLiteral("bottom"));
    const std::unique_ptr<KvHeaderWidget> header(report.model()->createHeaderWidget());
    const std::unique_ptr<KvFooterWidget> footer(report.model()->createFooterWidget());
    QVERIFY(header->inherits("KvTextDocumentNodeWidget"));
    QVERIFY(footer->inherits("KvTextDocumentNodeWidget"));
    QCOMPARE(header->toPlainText(), QStringLiteral("top"));
    QCOMPARE(footer->toPlainText(), QStringLiteral("bottom"));
    QVERIFY(header->metaObject()->indexOfSlot("slotTemplateModified()") >= 0);
    QVERIFY2(!report.model()->isModified(), "showing a section is no change");
}

void KvHeaderFooterWidgetTest::followsTheTemplate()
{
    FakeReport report;
    report.model()->header()->setText(QStringLiteral("by ${PROGRAM_NAME}"));
    const std::unique_ptr<KvHeaderWidget> header(report.model()->createHeaderWidget());
    QCOMPARE(header->toPlainText(), QStringLiteral("by ") + ZtAppSettings::getProgramName());

    ZtAppSettings::setProgramInfo(QStringLiteral("Other"), QString(), QString());
    emit report.model()->context()->signalTemplateModified();
    const QString shown = header->toPlainText();
    ZtAppSettings::setProgramInfo(QString(), QString(), QString());
    QCOMPARE(shown, QStringLiteral("by Other"));
    QCOMPARE(report.model()->header()->text(), QStringLiteral("by ${PROGRAM_NAME}"));
}

void KvHeaderFooterWidgetTest::rendersOncePerAnnouncement()
{
    FakeReport report;
    report.model()->header()->setText(QStringLiteral("by ${PROGRAM_NAME}"));
    std::vector<std::unique_ptr<CountedHeader>> headers;
    for (int i = 0; i < 3; ++i)
        headers.push_back(std::make_unique<CountedHeader>(nullptr, report.model()->header()));
    KvTemplateContext *context = report.model()->context();
    const QSignalSpy modified(context, SIGNAL(signalTemplateModified()));
    const auto announce = [context]() { emit context->signalTemplateModified(); };

    const int perRefresh =
        CountedHeader::countRefreshes(headers[0]->document(), [&]() { headers[0]->refreshText(); });
    QVERIFY(perRefresh > 0);
    for (std::size_t i = 0; i < headers.size(); ++i) {
        ZtAppSettings::setProgramInfo(QStringLiteral("Program %1").arg(i), QString(), QString());
        QCOMPARE(CountedHeader::countRefreshes(headers[i]->document(), announce), perRefresh);
    }
    for (const std::unique_ptr<CountedHeader> &header : headers)
        QCOMPARE(header->toPlainText(), QStringLiteral("by Program 2"));
    ZtAppSettings::setProgramInfo(QString(), QString(), QString());
    QCOMPARE(modified.count(), 3);
}

void KvHeaderFooterWidgetTest::rendersOnlyWhatIsNew_data()
{
    QTest::addColumn<QString>("html");
    QTest::newRow("plain") << "top";
    QTest::newRow("keyword") << "by ${PROGRAM_NAME}";
    QTest::newRow("empty") << "";
}

void KvHeaderFooterWidgetTest::rendersOnlyWhatIsNew()
{
    QFETCH(QString, html);
    FakeReport report;
    report.model()->header()->setText(html);
    const CountedHeader header(nullptr, report.model()->header());
    const auto announce = [&report]() { emit report.model()->context()->signalTemplateModified(); };
    // Each key that is typed anywhere in the template announces itself, and every page has a header.
    QCOMPARE(CountedHeader::countRefreshes(header.document(), announce), 0);
    report.model()->header()->setText(QStringLiteral("new"));
    QVERIFY(CountedHeader::countRefreshes(header.document(), announce) > 0);
    QCOMPARE(header.toPlainText(), QStringLiteral("new"));
    QCOMPARE(CountedHeader::countRefreshes(header.document(), announce), 0);
}

void KvHeaderFooterWidgetTest::typingIsNotOverwritten()
{
    FakeReport report;
    const std::unique_ptr<KvFooterWidget> footer(report.model()->createFooterWidget());
    const QSignalSpy modified(report.model()->context(), SIGNAL(signalTemplateModified()));
    QTextCursor cursor(footer->document());
    cursor.insertText(QStringLiteral("ab"));
    footer->setTextCursor(cursor);
    footer->textCursor().insertText(QStringLiteral("c"));
    QCOMPARE(footer->toPlainText(), QStringLiteral("abc"));
    QCOMPARE(footer->textCursor().position(), 3);
    QVERIFY(report.model()->footer()->text().contains(QLatin1String("abc")));
    QVERIFY(report.model()->isModified());
    QVERIFY(modified.count() >= 2);

    // Its own changes are over: it follows again.
    report.model()->footer()->setText(QStringLiteral("other"));
    emit report.model()->context()->signalTemplateModified();
    QCOMPARE(footer->toPlainText(), QStringLiteral("other"));
}

void KvHeaderFooterWidgetTest::typingReachesTheOtherPages()
{
    FakeReport report;
    const std::unique_ptr<KvHeaderWidget> first(report.model()->createHeaderWidget());
    const std::unique_ptr<KvHeaderWidget> second(report.model()->createHeaderWidget());
    const std::unique_ptr<KvFooterWidget> footer(report.model()->createFooterWidget());
    first->insertPlainText(QStringLiteral("hello"));
    QCOMPARE(first->toPlainText(), QStringLiteral("hello"));
    QCOMPARE(second->toPlainText(), QStringLiteral("hello"));
    QCOMPARE(footer->toPlainText(), QString());
}

void KvHeaderFooterWidgetTest::hasThePanelOfATextUnderItsName()
{
    FakeReport report;
    const std::unique_ptr<KvHeaderWidget> header(report.model()->createHeaderWidget());
    const std::unique_ptr<KvFooterWidget> footer(report.model()->createFooterWidget());
    QWidget side;
    const auto heading = [&side](KvPageSectionWidget *section) {
        const std::unique_ptr<QWidget> panel(section->createOptionsWidget(&side, true));
        return panel->inherits("KvTextDocumentNodeOptionsWidget")
                   ? panel->findChild<QLabel *>(QStringLiteral("sideHeader"))->text()
                   : QString();
    };
    QCOMPARE(heading(header.get()), QStringLiteral("Header"));
    QCOMPARE(heading(footer.get()), QStringLiteral("Footer"));
}

void KvHeaderFooterWidgetTest::placeholdersStayWhileEdited()
{
    FakeReport report;
    report.model()->header()->setText(QStringLiteral("${CREATION_TIME}"));
    const std::unique_ptr<KvHeaderWidget> edited(report.model()->createHeaderWidget());
    const std::unique_ptr<KvHeaderWidget> other(report.model()->createHeaderWidget());
    auto panel = std::make_unique<QWidget>();
    edited->createOptionsWidget(panel.get(), true);
    edited->show();
    QVERIFY(QTest::qWaitForWindowExposed(edited.get()));
    edited->moveCursor(QTextCursor::End);
    for (const QChar c : QStringLiteral(" h!")) {
        QTest::keyClick(edited.get(), c.toLatin1());
        QVERIFY(edited->toPlainText().startsWith(QStringLiteral("${CREATION_TIME}")));
        QVERIFY(edited->textCursor().atEnd());
    }
    // Changes elsewhere in the template do not touch it either.
    emit report.model()->context()->signalTemplateModified();
    QCOMPARE(edited->toPlainText(), QStringLiteral("${CREATION_TIME} h!"));
    QVERIFY(edited->textCursor().atEnd());
    QVERIFY(report.model()->header()->text().contains(QStringLiteral("${CREATION_TIME} h!")));
    QVERIFY(other->toPlainText().endsWith(QStringLiteral(" h!")));
    QVERIFY(!other->toPlainText().contains(QLatin1Char('$')));

    panel.reset();
    QVERIFY(!edited->toPlainText().contains(QLatin1Char('$')));
    QVERIFY(edited->toPlainText().endsWith(QStringLiteral(" h!")));
    QVERIFY(report.model()->header()->text().contains(QStringLiteral("${CREATION_TIME} h!")));
}

void KvHeaderFooterWidgetTest::endOfEditingReachesTheOtherPages()
{
    FakeReport report;
    report.model()->header()->setText(QStringLiteral("top"));
    const std::unique_ptr<KvHeaderWidget> edited(report.model()->createHeaderWidget());
    const std::unique_ptr<KvHeaderWidget> other(report.model()->createHeaderWidget());
    auto panel = std::make_unique<QWidget>();
    edited->createOptionsWidget(panel.get(), true);
    {
        const QSignalBlocker blocker(edited.get());
        edited->insertPlainText(QStringLiteral("on "));
    }
    QCOMPARE(other->toPlainText(), QStringLiteral("top"));
    panel.reset();
    QCOMPARE(edited->toPlainText(), QStringLiteral("on top"));
    QCOMPARE(other->toPlainText(), QStringLiteral("on top"));
    QVERIFY(report.model()->isModified());
}

void KvHeaderFooterWidgetTest::growingIsAnnouncedOnce()
{
    FakeReport report;
    const std::unique_ptr<KvHeaderWidget> header(report.model()->createHeaderWidget());
    QSignalSpy changed(header->displaySignals(), SIGNAL(signalWidgetChanged()));
    for (const char *text : {"<p>1</p><p>2</p>", "<p>1</p><p>2</p><p>3</p>"}) {
        report.model()->header()->setText(QString::fromLatin1(text));
        emit report.model()->context()->signalTemplateModified();
    }
    QCOMPARE(changed.count(), 0); // the sections of all pages hear of the change first
    QCoreApplication::processEvents();
    QCOMPARE(changed.count(), 1);
    // The same height needs no announcement.
    report.model()->header()->setText(QStringLiteral("<p>4</p><p>5</p><p>6</p>"));
    emit report.model()->context()->signalTemplateModified();
    QCoreApplication::processEvents();
    QCOMPARE(changed.count(), 1);
}

void KvHeaderFooterWidgetTest::measuringSettlesTheAnnouncement()
{
    FakeReport report;
    const std::unique_ptr<KvHeaderWidget> header(report.model()->createHeaderWidget());
    header->fitToWidth(700);
    const QSignalSpy changed(header->displaySignals(), SIGNAL(signalWidgetChanged()));
    report.model()->header()->setText(QStringLiteral("<p>1</p><p>2</p>"));
    emit report.model()->context()->signalTemplateModified();
    header->fitToWidth(700);
    QCoreApplication::processEvents();
    QCOMPARE(changed.count(), 0);
}

void KvHeaderFooterWidgetTest::textSpansTheWidth()
{
    FakeReport report;
    KvHeaderWidget *header = report.model()->createHeaderWidget();
    const std::unique_ptr<QWidget> guard(header);
    header->setMinimumWidth(0);
    header->setMaximumWidth(QWIDGETSIZE_MAX);
    for (const int width : {300, 952, 10}) {
        // Resize events reach widgets that are shown.
        header->show();
        header->resize(width, 50);
        QCOMPARE(header->width(), width);
        QCOMPARE(header->document()->textWidth(), static_cast<qreal>(width));
    }
}

void KvHeaderFooterWidgetTest::fitsToAWidth_data()
{
    QTest::addColumn<int>("width");
    QTest::newRow("page") << 952;
    QTest::newRow("narrow") << 60;
    QTest::newRow("one pixel") << 1;
    QTest::newRow("nothing") << 0;
}

void KvHeaderFooterWidgetTest::fitsToAWidth()
{
    QFETCH(int, width);
    FakeReport report;
    report.model()->header()->setText(QStringLiteral("Some words that need several lines on a narrow page"));
    const std::unique_ptr<KvHeaderWidget> header(report.model()->createHeaderWidget());
    header->fitToWidth(width);
    QCOMPARE(header->width(), width);
    QCOMPARE(header->minimumWidth(), width);
    QCOMPARE(header->maximumWidth(), width);
    QCOMPARE(header->height(), qRound(header->document()->size().height()));
    QVERIFY(!report.model()->isModified());
}

STATREPORT_TEST_MAIN(KvHeaderFooterWidgetTest)
#include "KvHeaderFooterWidgetTest.moc"
