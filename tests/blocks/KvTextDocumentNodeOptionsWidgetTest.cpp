// SPDX-License-Identifier: MIT
#include "support/StatReportTest.h"

#include "KvTextDocumentDialogProbe.h"
#include "MetaMethods.h"
#include "PanelProbe.h"
#include "blocks/textdocument/KvAddImageDialog.h"
#include "blocks/textdocument/KvAddLinkDialog.h"
#include "blocks/textdocument/KvTextDocumentNodeCfg.h"
#include "blocks/textdocument/KvTextDocumentNodeOptionsWidget.h"
#include "blocks/textdocument/KvTextDocumentNodeWidget.h"
#include "gui/QtAdvancedStylesheet.h"
#include "gui/acss.h"
#include "report/KvBaseDisplayWidgetSignals.h"
#include "templates/KvTemplateContext.h"
#include "widgets/KvColorLabel.h"

#include <QComboBox>
#include <QFontDatabase>
#include <QLineEdit>
#include <QPushButton>
#include <QSpinBox>
#include <QStyleOptionButton>

namespace {

using LinkProbe = KvTextDocumentDialogProbe<KvAddLinkDialog>;
using ImageProbe = KvTextDocumentDialogProbe<KvAddImageDialog>;

// Push buttons in the order in which they appear.
enum Button { Color, Bold, Italic, Underline, Left, Center, Right, Justify, Super, Sub, Link, Gallery };

/** Brings the style sheet of the programs over a test function. */
class ProgramStyle
{
public:
    explicit ProgramStyle(const QString &theme)
    {
        acss::QtAdvancedStylesheet::getInstance()->setCurrentTheme(theme);
        acss::QtAdvancedStylesheet::getInstance()->applyTo(qApp);
    }
    ~ProgramStyle()
    {
        qApp->setStyleSheet(QString());
        qApp->setPalette(QPalette());
    }
};

} // namespace

class KvTextDocumentNodeOptionsWidgetTest : public StatReportTest
{
    Q_OBJECT

private slots:
    void init();
    void cleanup();
    void hasItsSignals();
    void isHeadedByTheTextsName();
    void controlsAreInOrder();
    void lettersLookLikeTheirFormats();
    void buttonsHaveIcons_data();
    void buttonsHaveIcons();
    void nothingIsClipped_data();
    void nothingIsClipped();
    void tabsThroughAllControls();
    void offersTheStandardSizes();
    void showsTheFormatAtTheCursor_data();
    void showsTheFormatAtTheCursor();
    void showsTheParagraphsAlignment_data();
    void showsTheParagraphsAlignment();
    void refreshEmitsNothing();
    void followsTheCursor();
    void buttonsEmit_data();
    void buttonsEmit();
    void sizeEmits();
    void colorEmits();
    void alignmentEmits_data();
    void alignmentEmits();
    void superscriptAndSubscriptExclude();
    void offersTheKeywords();
    void insertsAKeyword();
    void tagBoxIgnoresTheWheel();
    void tagBoxOpensByKeys();
    void insertsALink();
    void linkTakesTheSelectionAsTitle();
    void linkHasTheSizeAtTheCursor_data();
    void linkHasTheSizeAtTheCursor();
    void emptyOrCancelledLinkInsertsNothing_data();
    void emptyOrCancelledLinkInsertsNothing();
    void textBehindALinkIsNone();
    void insertsAPicture_data();
    void insertsAPicture();
    void noPictureInsertsNothing_data();
    void noPictureInsertsNothing();
    void panelMayDieUnderItsDialog();
    void printingUnderADialogInsertsNothing();
    void worksWithoutAText();

private:
    /** Shows \a html in a text that is edited, with the cursor behind \a position characters. */
    void edit(const QString &html, int position = 0, int selected = 0);
    QPushButton *button(int which) const { return PanelProbe::controls<QPushButton>(m_panel).at(which); }
    QComboBox *sizeBox() const { return PanelProbe::controls<QComboBox>(m_panel).first(); }
    QComboBox *tagBox() const { return PanelProbe::controls<QComboBox>(m_panel).last(); }
    /** Fills the file dialog as a user does. */
    static void choose(KvAddImageDialog *dialog, const QString &path, int percent, int placeIndex);

    std::unique_ptr<KvTemplateContext> m_context;
    std::unique_ptr<KvTextDocumentNodeCfg> m_cfg;
    std::unique_ptr<KvTextDocumentNodeWidget> m_text;
    std::unique_ptr<QWidget> m_window;
    KvTextDocumentNodeOptionsWidget *m_panel = nullptr;
};

void KvTextDocumentNodeOptionsWidgetTest::init()
{
    StatReportTest::init();
    m_context = std::make_unique<KvTemplateContext>(nullptr);
    edit(QString());
}

void KvTextDocumentNodeOptionsWidgetTest::cleanup()
{
    m_window.reset();
    m_text.reset();
    m_cfg.reset();
    m_context.reset();
    StatReportTest::cleanup();
}

void KvTextDocumentNodeOptionsWidgetTest::edit(const QString &html, int position, int selected)
{
    m_window.reset();
    m_text.reset();
    m_cfg = std::make_unique<KvTextDocumentNodeCfg>(m_context.get());
    m_cfg->setText(html);
    m_text = std::make_unique<KvTextDocumentNodeWidget>(nullptr, m_cfg.get());
    m_window = std::make_unique<QWidget>();
    auto *layout = new QVBoxLayout(m_window.get());
    layout->setContentsMargins(0, 0, 0, 0);
    m_panel =
        qobject_cast<KvTextDocumentNodeOptionsWidget *>(m_text->createOptionsWidget(m_window.get(), true));
    layout->addWidget(m_panel);
    layout->addStretch(1);
    m_window->resize(290, 600);
    QVERIFY(PanelProbe::show(m_window.get()));
    m_text->show();
    QTextCursor cursor = m_text->textCursor();
    cursor.setPosition(position);
    cursor.setPosition(position + selected, QTextCursor::KeepAnchor);
    m_text->setTextCursor(cursor);
}

void KvTextDocumentNodeOptionsWidgetTest::hasItsSignals()
{
    QCOMPARE(
        ownMethods(KvTextDocumentNodeOptionsWidget::staticMetaObject, QMetaMethod::Signal),
        (QStringList{"signalFontSizeChanged(uint)", "signalTextColorChanged(QColor)",
                     "signalAlignmentChanged(Qt::Alignment)",
                     "signalVAlignmentChanged(QTextCharFormat::VerticalAlignment)", "signalBoldChanged(bool)",
                     "signalItalicChanged(bool)", "signalUnderlineChanged(bool)"}));
    QVERIFY(m_panel->metaObject()->indexOfSlot("slotStateChanged()") >= 0);
    QVERIFY(m_panel->inherits("KvBaseOptionsWidget"));
    QVERIFY(m_panel->inherits("QFrame"));
}

void KvTextDocumentNodeOptionsWidgetTest::isHeadedByTheTextsName()
{
    const auto *header = m_panel->findChild<QLabel *>(QStringLiteral("sideHeader"));
    QVERIFY(header);
    QCOMPARE(header->text(), QStringLiteral("Text"));
}

void KvTextDocumentNodeOptionsWidgetTest::controlsAreInOrder()
{
    QStringList tips;
    for (const QPushButton *candidate : PanelProbe::controls<QPushButton>(m_panel)) {
        tips.append(candidate->toolTip());
        QCOMPARE(candidate->accessibleName(), candidate->toolTip());
    }
    QCOMPARE(tips, (QStringList{"Text color", "Bold (Ctrl+B)", "Italic (Ctrl+I)", "Underline (Ctrl+U)",
                                "Align left", "Align center", "Align right", "Justify", "Superscript",
                                "Subscript", "Insert link (Ctrl+K)", "Insert picture"}));
    for (int i = 0; i <= Gallery; ++i)
        QCOMPARE(button(i)->isCheckable(), i >= Bold && i <= Sub);
    QVERIFY(qobject_cast<KvColorLabel *>(button(Color)));

    QCOMPARE(PanelProbe::controls<QComboBox>(m_panel).size(), 2);
    for (const QComboBox *box : {sizeBox(), tagBox()}) {
        QVERIFY(!box->isEditable());
        QVERIFY(!box->toolTip().isEmpty());
        QVERIFY(!box->accessibleName().isEmpty());
    }
    const auto top = [this](const QWidget *control) { return control->mapTo(m_panel, QPoint(0, 0)).y(); };
    QVERIFY(top(sizeBox()) < top(button(Bold)));
    QVERIFY(top(tagBox()) > top(button(Gallery)));
}

void KvTextDocumentNodeOptionsWidgetTest::lettersLookLikeTheirFormats()
{
    QCOMPARE(button(Bold)->text(), QStringLiteral("B"));
    QCOMPARE(button(Italic)->text(), QStringLiteral("I"));
    QCOMPARE(button(Underline)->text(), QStringLiteral("U"));
    QCOMPARE(button(Bold)->styleSheet(), QStringLiteral("QPushButton { font: bold 14px; }"));
    QCOMPARE(button(Italic)->styleSheet(), QStringLiteral("QPushButton { font: italic 14px; }"));
    QCOMPARE(button(Underline)->styleSheet(),
             QStringLiteral("QPushButton{font: 14px; text-decoration: underline; }"));
}

void KvTextDocumentNodeOptionsWidgetTest::buttonsHaveIcons_data()
{
    QTest::addColumn<int>("which");
    QTest::addColumn<QString>("path");
    QTest::newRow("left") << int(Left) << "Icons/IconTextAlignLeft.svg";
    QTest::newRow("center") << int(Center) << "Icons/IconTextAlignCenter.svg";
    QTest::newRow("right") << int(Right) << "Icons/IconTextAlignRight.svg";
    QTest::newRow("justify") << int(Justify) << "Icons/IconTextAlignScatter.svg";
    QTest::newRow("superscript") << int(Super) << "Icons/IconTextSuperscript.svg";
    QTest::newRow("subscript") << int(Sub) << "Icons/IconTextSubscript.svg";
    QTest::newRow("link") << int(Link) << "Icons/IconLink.svg";
    QTest::newRow("gallery") << int(Gallery) << "Icons/IconGallery.svg";
}

void KvTextDocumentNodeOptionsWidgetTest::buttonsHaveIcons()
{
    QFETCH(int, which);
    QFETCH(QString, path);
    const QSize size(24, 24);
    QCOMPARE(button(which)->iconSize(), size);
    QVERIFY(!button(which)->icon().isNull());
    QCOMPARE(button(which)->icon().pixmap(size).toImage(),
             acss::createIcon(6, path, size).pixmap(size).toImage());
}

void KvTextDocumentNodeOptionsWidgetTest::nothingIsClipped_data()
{
    QTest::addColumn<QString>("theme");
    QTest::newRow("dark") << "Dark";
    QTest::newRow("light") << "Light";
}

void KvTextDocumentNodeOptionsWidgetTest::nothingIsClipped()
{
    QFETCH(QString, theme);
    const ProgramStyle style(theme);
    edit(QString());
    QVERIFY2(m_panel->minimumSizeHint().width() <= 290,
             qPrintable(QString::number(m_panel->minimumSizeHint().width())));
    for (QPushButton *candidate : PanelProbe::controls<QPushButton>(m_panel)) {
        QCOMPARE(candidate->size(), QSize(32, 32));
        for (const bool hasFocus : {false, true}) {
            if (hasFocus)
                candidate->setFocus();
            QStyleOptionButton option;
            option.initFrom(candidate);
            const QRect contents =
                candidate->style()->subElementRect(QStyle::SE_PushButtonContents, &option, candidate);
            QVERIFY2(contents.width() >= 24 && contents.height() >= 24, qPrintable(candidate->toolTip()));
        }
    }
}

void KvTextDocumentNodeOptionsWidgetTest::tabsThroughAllControls()
{
    QWidgetList expected{sizeBox()};
    for (QPushButton *candidate : PanelProbe::controls<QPushButton>(m_panel))
        expected.append(candidate);
    expected.append(tagBox());
    m_window->activateWindow();
    QVERIFY(QTest::qWaitForWindowActive(m_window.get()));
    expected.first()->setFocus();
    for (QWidget *control : qAsConst(expected)) {
        QCOMPARE(m_window->focusWidget(), control);
        QTest::keyClick(control, Qt::Key_Tab);
    }
    QCOMPARE(m_window->focusWidget(), expected.first());
}

void KvTextDocumentNodeOptionsWidgetTest::offersTheStandardSizes()
{
    const QList<int> sizes = QFontDatabase::standardSizes();
    QCOMPARE(sizeBox()->count(), sizes.size());
    for (int i = 0; i < sizes.size(); ++i) {
        QCOMPARE(sizeBox()->itemText(i), QString::number(sizes.at(i)));
        QCOMPARE(sizeBox()->itemData(i).toInt(), sizes.at(i));
    }
}

void KvTextDocumentNodeOptionsWidgetTest::showsTheFormatAtTheCursor_data()
{
    QTest::addColumn<QString>("html");
    QTest::addColumn<QVector<int>>("checked"); // of the formats of characters
    QTest::addColumn<QString>("size");
    QTest::addColumn<QColor>("color");
    const QColor black(Qt::black);
    QTest::newRow("plain") << "abc" << QVector<int>{} << "9" << black; // 12 pixels
    QTest::newRow("bold") << "<b>abc</b>" << QVector<int>{Bold} << "9" << black;
    QTest::newRow("light") << "<span style=\"font-weight:300\">abc</span>" << QVector<int>{} << "9" << black;
    QTest::newRow("italic") << "<i>abc</i>" << QVector<int>{Italic} << "9" << black;
    QTest::newRow("underlined") << "<u>abc</u>" << QVector<int>{Underline} << "9" << black;
    QTest::newRow("raised") << "<sup>abc</sup>" << QVector<int>{Super} << "9" << black;
    QTest::newRow("lowered") << "<sub>abc</sub>" << QVector<int>{Sub} << "9" << black;
    QTest::newRow("all") << "<b><i><u><sup>abc</sup></u></i></b>"
                         << QVector<int>{Bold, Italic, Underline, Super} << "9" << black;
    QTest::newRow("points") << "<span style=\"font-size:20pt\">abc</span>" << QVector<int>{} << "20" << black;
    QTest::newRow("pixels") << "<span style=\"font-size:16px\">abc</span>" << QVector<int>{} << "12" << black;
    QTest::newRow("odd size") << "<span style=\"font-size:13pt\">abc</span>" << QVector<int>{} << "" << black;
    QTest::newRow("colored") << "<span style=\"color:#102030\">abc</span>" << QVector<int>{} << "9"
                             << QColor(0x10, 0x20, 0x30);
}

void KvTextDocumentNodeOptionsWidgetTest::showsTheFormatAtTheCursor()
{
    QFETCH(QString, html);
    QFETCH(QVector<int>, checked);
    edit(html, 2);
    for (const int which : {Bold, Italic, Underline, Super, Sub})
        QVERIFY2(button(which)->isChecked() == checked.contains(which), qPrintable(button(which)->toolTip()));
    QTEST(sizeBox()->currentText(), "size");
    QTEST(qobject_cast<KvColorLabel *>(button(Color))->color(), "color");
}

void KvTextDocumentNodeOptionsWidgetTest::showsTheParagraphsAlignment_data()
{
    QTest::addColumn<QString>("html");
    QTest::addColumn<int>("checked");
    QTest::newRow("default") << "<p>a</p>" << int(Left);
    QTest::newRow("left") << "<p align=\"left\">a</p>" << int(Left);
    QTest::newRow("center") << "<p align=\"center\">a</p>" << int(Center);
    QTest::newRow("right") << "<p align=\"right\">a</p>" << int(Right);
    QTest::newRow("justify") << "<p align=\"justify\">a</p>" << int(Justify);
}

void KvTextDocumentNodeOptionsWidgetTest::showsTheParagraphsAlignment()
{
    QFETCH(QString, html);
    QFETCH(int, checked);
    edit(html);
    for (const int which : {Left, Center, Right, Justify})
        QCOMPARE(button(which)->isChecked(), which == checked);
}

void KvTextDocumentNodeOptionsWidgetTest::refreshEmitsNothing()
{
    edit(QStringLiteral("<p>plain</p><p align=\"right\"><b><i><u><sup><span style=\"font-size:20pt; "
                        "color:red\">all</span></sup></u></i></b></p>"));
    QVector<QSignalSpy *> spies;
    const QMetaObject &meta = KvTextDocumentNodeOptionsWidget::staticMetaObject;
    for (const QString &signature : ownMethods(meta, QMetaMethod::Signal))
        spies.append(new QSignalSpy(m_panel, ("2" + signature.toLatin1()).constData()));
    QCOMPARE(spies.size(), 7);
    m_text->moveCursor(QTextCursor::End);
    QVERIFY(button(Bold)->isChecked());
    m_panel->slotStateChanged();
    m_panel->setFromConfig(m_cfg.get());
    m_text->moveCursor(QTextCursor::Start);
    QVERIFY(!button(Bold)->isChecked());
    for (const QSignalSpy *spy : qAsConst(spies))
        QCOMPARE(spy->count(), 0);
    qDeleteAll(spies);
}

void KvTextDocumentNodeOptionsWidgetTest::followsTheCursor()
{
    edit(QStringLiteral("<p>ab<b>cd</b></p><p align=\"center\">e</p>"));
    QVERIFY(!button(Bold)->isChecked());
    m_text->moveCursor(QTextCursor::EndOfBlock);
    QVERIFY(button(Bold)->isChecked());
    QVERIFY(button(Left)->isChecked());
    m_text->moveCursor(QTextCursor::Down);
    QVERIFY(!button(Bold)->isChecked());
    QVERIFY(!button(Left)->isChecked());
    QVERIFY(button(Center)->isChecked());
    // Also a format that comes from the keyboard.
    QTest::keyClick(m_text.get(), Qt::Key_B, Qt::ControlModifier);
    QVERIFY(button(Bold)->isChecked());
}

void KvTextDocumentNodeOptionsWidgetTest::buttonsEmit_data()
{
    QTest::addColumn<int>("which");
    QTest::addColumn<QByteArray>("signal");
    QTest::newRow("bold") << int(Bold) << QByteArray(SIGNAL(signalBoldChanged(bool)));
    QTest::newRow("italic") << int(Italic) << QByteArray(SIGNAL(signalItalicChanged(bool)));
    QTest::newRow("underline") << int(Underline) << QByteArray(SIGNAL(signalUnderlineChanged(bool)));
}

void KvTextDocumentNodeOptionsWidgetTest::buttonsEmit()
{
    QFETCH(int, which);
    QFETCH(QByteArray, signal);
    QSignalSpy changed(m_panel, signal.constData());
    for (const bool on : {true, false, true}) {
        QTest::mouseClick(button(which), Qt::LeftButton);
        QCOMPARE(changed.count(), 1);
        QCOMPARE(changed.takeFirst().first().toBool(), on);
        QCOMPARE(button(which)->isChecked(), on);
    }
}

void KvTextDocumentNodeOptionsWidgetTest::sizeEmits()
{
    QSignalSpy changed(m_panel, SIGNAL(signalFontSizeChanged(uint)));
    sizeBox()->setCurrentIndex(sizeBox()->findData(24));
    QCOMPARE(changed.count(), 1);
    QCOMPARE(changed.first().first().toUInt(), 24U);
    QCOMPARE(m_text->fontPointSize(), 24.0);
    QCOMPARE(sizeBox()->currentText(), QStringLiteral("24"));
}

void KvTextDocumentNodeOptionsWidgetTest::colorEmits()
{
    QSignalSpy changed(m_panel, SIGNAL(signalTextColorChanged(QColor)));
    const QColor color(1, 2, 3);
    emit qobject_cast<KvColorLabel *>(button(Color))->signalColorChanged(color);
    QCOMPARE(changed.count(), 1);
    QCOMPARE(changed.first().first().value<QColor>(), color);
    QCOMPARE(m_text->textColor(), color);
}

void KvTextDocumentNodeOptionsWidgetTest::alignmentEmits_data()
{
    QTest::addColumn<int>("which");
    QTest::addColumn<Qt::Alignment>("alignment");
    QTest::newRow("left") << int(Left) << Qt::Alignment(Qt::AlignLeft);
    QTest::newRow("center") << int(Center) << Qt::Alignment(Qt::AlignCenter);
    QTest::newRow("right") << int(Right) << Qt::Alignment(Qt::AlignRight);
    QTest::newRow("justify") << int(Justify) << Qt::Alignment(Qt::AlignJustify);
}

void KvTextDocumentNodeOptionsWidgetTest::alignmentEmits()
{
    QFETCH(int, which);
    QFETCH(Qt::Alignment, alignment);
    edit(which == Left ? QStringLiteral("<p align=\"right\">a</p>") : QStringLiteral("<p>a</p>"));
    QSignalSpy changed(m_panel, SIGNAL(signalAlignmentChanged(Qt::Alignment)));
    for (int click = 0; click < 2; ++click) {
        QTest::mouseClick(button(which), Qt::LeftButton);
        QCOMPARE(changed.count(), click + 1);
        QCOMPARE(changed.last().first().value<Qt::Alignment>(), alignment);
        QCOMPARE(m_text->alignment(), alignment);
        for (const int other : {Left, Center, Right, Justify})
            QCOMPARE(button(other)->isChecked(), other == which);
    }
    m_panel->slotStateChanged();
    QVERIFY(button(which)->isChecked());
}

void KvTextDocumentNodeOptionsWidgetTest::superscriptAndSubscriptExclude()
{
    QSignalSpy changed(m_panel, SIGNAL(signalVAlignmentChanged(QTextCharFormat::VerticalAlignment)));
    const auto last = [&changed]() {
        const QVariant argument = changed.takeLast().first();
        return *static_cast<const QTextCharFormat::VerticalAlignment *>(argument.constData());
    };
    QTest::mouseClick(button(Super), Qt::LeftButton);
    QCOMPARE(last(), QTextCharFormat::AlignSuperScript);
    QCOMPARE(m_text->currentCharFormat().verticalAlignment(), QTextCharFormat::AlignSuperScript);
    QTest::mouseClick(button(Sub), Qt::LeftButton);
    QCOMPARE(last(), QTextCharFormat::AlignSubScript);
    QVERIFY(!button(Super)->isChecked());
    QVERIFY(button(Sub)->isChecked());
    QTest::mouseClick(button(Sub), Qt::LeftButton);
    QCOMPARE(last(), QTextCharFormat::AlignNormal);
    QVERIFY(!button(Sub)->isChecked());
    QCOMPARE(m_text->currentCharFormat().verticalAlignment(), QTextCharFormat::AlignNormal);
    QCOMPARE(changed.count(), 0);
}

void KvTextDocumentNodeOptionsWidgetTest::offersTheKeywords()
{
    const auto &keywords = m_context->keywords().keywords();
    QCOMPARE(tagBox()->count(), keywords.size() + 1);
    QCOMPARE(tagBox()->itemText(0), QStringLiteral("Insert tag"));
    QVERIFY(!tagBox()->itemData(0).isValid());
    QCOMPARE(tagBox()->itemText(3), QStringLiteral("Creation time"));
    QCOMPARE(tagBox()->itemData(3).toString(), QStringLiteral("${CREATION_TIME}"));
    for (int i = 0; i < keywords.size(); ++i) {
        QCOMPARE(tagBox()->itemText(i + 1), keywords.at(i).label);
        QCOMPARE(tagBox()->itemData(i + 1).toString(), keywords.at(i).keyword);
    }
    QCOMPARE(tagBox()->currentIndex(), 0);
}

void KvTextDocumentNodeOptionsWidgetTest::insertsAKeyword()
{
    edit(QStringLiteral("<p>ab</p>"), 1);
    const QSignalSpy focusBack(m_text->displaySignals(), SIGNAL(signalFocusBackToPageView()));
    for (int i = 1; i < tagBox()->count(); ++i) {
        tagBox()->setFocus();
        tagBox()->setCurrentIndex(i);
        QCOMPARE(tagBox()->currentIndex(), 0);
        QVERIFY(m_text->toPlainText().endsWith(m_context->keywords().keywords().at(i - 1).keyword +
                                               QLatin1Char('b')));
        QCOMPARE(focusBack.count(), i);
        QCOMPARE(m_text->focusWidget() ? m_text->focusWidget() : m_text.get(), m_text.get());
    }
    QVERIFY(m_text->toPlainText().startsWith(QStringLiteral("a${CREATION_DATE_ISO}${CREATION_DATE_TEXT}")));
    QVERIFY(m_cfg->text().contains(QStringLiteral("${PROGRAM_VENDOR}")));
}

void KvTextDocumentNodeOptionsWidgetTest::tagBoxIgnoresTheWheel()
{
    tagBox()->setFocus();
    QWheelEvent down(QPointF(10, 10), tagBox()->mapToGlobal(QPoint(10, 10)), QPoint(), QPoint(0, -120),
                     Qt::NoButton, Qt::NoModifier, Qt::NoScrollPhase, false);
    QCoreApplication::sendEvent(tagBox(), &down);
    QVERIFY(!down.isAccepted());
    QCOMPARE(m_text->toPlainText(), QString());
}

void KvTextDocumentNodeOptionsWidgetTest::tagBoxOpensByKeys()
{
    // What the off-screen platform says of every popup.
    expectWarning(QRegularExpression(QStringLiteral("does not support raise")));
    expectWarning(QRegularExpression(QStringLiteral("does not support grabbing the keyboard")));
    tagBox()->setFocus();
    QTest::keyClick(tagBox(), Qt::Key_Down);
    QCOMPARE(m_text->toPlainText(), QString());
    QTRY_VERIFY(tagBox()->view()->isVisible());
    QTest::keyClick(tagBox()->view(), Qt::Key_Down);
    QTest::keyClick(tagBox()->view(), Qt::Key_Down);
    QTest::keyClick(tagBox()->view(), Qt::Key_Return);
    QTRY_COMPARE(m_text->toPlainText(), QStringLiteral("${CREATION_DATE_TEXT}"));
    QVERIFY(!tagBox()->view()->isVisible());
}

void KvTextDocumentNodeOptionsWidgetTest::insertsALink()
{
    edit(QStringLiteral("<p>ab</p>"), 1);
    const QSignalSpy focusBack(m_text->displaySignals(), SIGNAL(signalFocusBackToPageView()));
    QString suggested = QStringLiteral("none seen");
    const LinkProbe probe([&](KvAddLinkDialog *dialog) {
        auto *title = dialog->findChild<QLineEdit *>(QStringLiteral("titleInput"));
        suggested = title->text();
        title->setText(QStringLiteral("Home"));
        dialog->findChild<QLineEdit *>(QStringLiteral("urlInput"))->setText(QStringLiteral("http://x.org"));
        dialog->accept();
    });
    QTest::mouseClick(button(Link), Qt::LeftButton);
    QCOMPARE(probe.count(), 1);
    QCOMPARE(suggested, QString());
    QCOMPARE(m_text->toPlainText(), QStringLiteral("aHome b"));
    QVERIFY(m_cfg->text().contains(QStringLiteral("<a href=\"http://x.org\">")));
    QCOMPARE(focusBack.count(), 1);
    QTextCursor cursor(m_text->document());
    cursor.setPosition(3);
    QVERIFY(cursor.charFormat().isAnchor());
    QCOMPARE(cursor.charFormat().anchorHref(), QStringLiteral("http://x.org"));
    QCOMPARE(cursor.charFormat().fontPointSize(), 9.0);
    QVERIFY(m_window->findChildren<KvAddLinkDialog *>().isEmpty()); // not kept
}

void KvTextDocumentNodeOptionsWidgetTest::linkTakesTheSelectionAsTitle()
{
    edit(QStringLiteral("<p>see here</p><p>and on</p>"), 4, 8);
    QString suggested;
    const LinkProbe probe([&](KvAddLinkDialog *dialog) {
        suggested = dialog->findChild<QLineEdit *>(QStringLiteral("titleInput"))->text();
        dialog->accept();
    });
    button(Link)->click();
    QCOMPARE(suggested, QStringLiteral("here and"));
    QCOMPARE(m_text->toPlainText(), QStringLiteral("see here and  on"));
}

void KvTextDocumentNodeOptionsWidgetTest::linkHasTheSizeAtTheCursor_data()
{
    QTest::addColumn<QString>("html");
    QTest::addColumn<qreal>("size");
    QTest::newRow("new block") << QString() << 9.0; // 12 pixels
    QTest::newRow("points") << "<span style=\"font-size:20pt\">a</span>" << 20.0;
    QTest::newRow("pixels") << "<span style=\"font-size:24px\">a</span>" << 18.0;
}

void KvTextDocumentNodeOptionsWidgetTest::linkHasTheSizeAtTheCursor()
{
    QFETCH(QString, html);
    edit(html, html.isEmpty() ? 0 : 1);
    const LinkProbe probe([](KvAddLinkDialog *dialog) {
        dialog->setTitle(QStringLiteral("L"));
        dialog->accept();
    });
    button(Link)->click();
    QTextCursor cursor(m_text->document());
    cursor.setPosition(m_text->toPlainText().indexOf(QLatin1Char('L')) + 1);
    QVERIFY(cursor.charFormat().isAnchor());
    QTEST(cursor.charFormat().fontPointSize(), "size");
}

void KvTextDocumentNodeOptionsWidgetTest::emptyOrCancelledLinkInsertsNothing_data()
{
    QTest::addColumn<bool>("accepted");
    QTest::newRow("no title") << true;
    QTest::newRow("cancelled") << false;
}

void KvTextDocumentNodeOptionsWidgetTest::emptyOrCancelledLinkInsertsNothing()
{
    QFETCH(bool, accepted);
    edit(QStringLiteral("<p>abc</p>"), 1, 1);
    const QSignalSpy focusBack(m_text->displaySignals(), SIGNAL(signalFocusBackToPageView()));
    const LinkProbe probe([&](KvAddLinkDialog *dialog) {
        dialog->setTitle(accepted ? QString() : QStringLiteral("title"));
        accepted ? dialog->accept() : dialog->reject();
    });
    button(Link)->click();
    QCOMPARE(probe.count(), 1);
    QCOMPARE(m_text->toPlainText(), QStringLiteral("abc"));
    QVERIFY(!m_text->document()->isModified());
    QCOMPARE(focusBack.count(), accepted ? 1 : 0);
}

void KvTextDocumentNodeOptionsWidgetTest::textBehindALinkIsNone()
{
    const LinkProbe probe([](KvAddLinkDialog *dialog) {
        dialog->setTitle(QStringLiteral("link"));
        dialog->accept();
    });
    button(Link)->click();
    QTest::keyClicks(m_text.get(), QStringLiteral("after"));
    QCOMPARE(m_text->toPlainText(), QStringLiteral("link after"));
    const QTextCharFormat format = m_text->textCursor().charFormat();
    QVERIFY(!format.isAnchor());
    QVERIFY(!format.fontUnderline());
    QCOMPARE(format.fontPointSize(), 9.0);
    // It comes back like that.
    QTextDocument again;
    again.setHtml(m_cfg->text());
    QCOMPARE(again.toPlainText(), QStringLiteral("link after"));
}

void KvTextDocumentNodeOptionsWidgetTest::choose(KvAddImageDialog *dialog, const QString &path, int percent,
                                                 int placeIndex)
{
    dialog->setDirectory(QFileInfo(path).path());
    dialog->findChild<QLineEdit *>(QStringLiteral("fileNameEdit"))->setText(path);
    dialog->findChild<QSpinBox *>(QStringLiteral("widthSpinBox"))->setValue(percent);
    dialog->findChild<QComboBox *>(QStringLiteral("floatComboBox"))->setCurrentIndex(placeIndex);
    static_cast<QDialog *>(dialog)->accept();
}

void KvTextDocumentNodeOptionsWidgetTest::insertsAPicture_data()
{
    QTest::addColumn<QSize>("size");
    QTest::addColumn<int>("percent");
    QTest::addColumn<int>("place");
    QTest::addColumn<int>("width"); // of 724
    QTest::addColumn<int>("kept");
    QTest::newRow("default") << QSize(60, 30) << 25 << 0 << 181 << 60;
    QTest::newRow("truncated") << QSize(60, 30) << 33 << 0 << 238 << 60;
    QTest::newRow("full width") << QSize(60, 30) << 100 << 0 << 724 << 60;
    QTest::newRow("reduced") << QSize(2000, 1000) << 25 << 0 << 181 << 543;
    QTest::newRow("left") << QSize(60, 30) << 10 << 1 << 72 << 60;
    QTest::newRow("right") << QSize(60, 30) << 1 << 2 << 7 << 21;
}

void KvTextDocumentNodeOptionsWidgetTest::insertsAPicture()
{
    QFETCH(QSize, size);
    QFETCH(int, percent);
    QFETCH(int, place);
    QFETCH(int, width);
    const QString path = temporaryPath(QStringLiteral("picture.png"));
    QImage image(size, QImage::Format_RGB32);
    image.fill(Qt::red);
    QVERIFY(image.save(path));
    edit(QStringLiteral("<p>ab</p>"), 1);
    const ImageProbe probe([&](KvAddImageDialog *dialog) { choose(dialog, path, percent, place); });
    QTest::mouseClick(button(Gallery), Qt::LeftButton);
    QCOMPARE(probe.count(), 1);
    QCOMPARE(m_text->toPlainText(), QStringLiteral("a") + QChar(0xFFFC) + QStringLiteral("b"));

    QTextCursor cursor(m_text->document());
    cursor.setPosition(2);
    const QTextImageFormat format = cursor.charFormat().toImageFormat();
    QVERIFY(format.isValid());
    QCOMPARE(format.width(), qreal(width));
    QVERIFY(format.name().startsWith(QStringLiteral("data:image/png;base64, ")));
    const QByteArray data = QByteArray::fromBase64(format.name().section(QLatin1Char(' '), 1).toLatin1());
    const QImage stored = QImage::fromData(data, "PNG");
    QTEST(stored.width(), "kept");
    QVERIFY(m_cfg->text().contains(format.name()));
    const QString floated = place == 1 ? "float: left" : "float: right";
    QCOMPARE(m_cfg->text().contains(floated), place > 0);
    QVERIFY(m_window->findChildren<KvAddImageDialog *>().isEmpty()); // not kept
}

void KvTextDocumentNodeOptionsWidgetTest::noPictureInsertsNothing_data()
{
    QTest::addColumn<bool>("accepted");
    QTest::newRow("cancelled") << false;
    QTest::newRow("no image in the file") << true;
}

void KvTextDocumentNodeOptionsWidgetTest::noPictureInsertsNothing()
{
    QFETCH(bool, accepted);
    const QString path = temporaryPath(QStringLiteral("broken.png"));
    QFile file(path);
    QVERIFY(file.open(QIODevice::WriteOnly));
    file.write("no picture");
    file.close();
    const ImageProbe probe([&](KvAddImageDialog *dialog) {
        if (accepted)
            choose(dialog, path, 25, 0);
        else
            dialog->reject();
    });
    button(Gallery)->click();
    QCOMPARE(probe.count(), 1);
    QVERIFY(m_text->document()->isEmpty());
    QVERIFY(!m_text->document()->isModified());
    QCOMPARE(m_cfg->text(), QString());
}

void KvTextDocumentNodeOptionsWidgetTest::panelMayDieUnderItsDialog()
{
    const QPointer<QWidget> panel(m_panel);
    const LinkProbe links([&](KvAddLinkDialog *dialog) {
        dialog->setTitle(QStringLiteral("title"));
        delete panel;
        dialog->accept();
    });
    m_panel->slotLinkClicked();
    QVERIFY(!panel);
    QCOMPARE(m_text->toPlainText(), QString());

    edit(QString());
    const ImageProbe images([&](KvAddImageDialog *) { m_window.reset(); });
    m_panel->slotGalleryClicked();
    QVERIFY(!m_text->isEditing());
    QVERIFY(m_text->document()->isEmpty());
}

void KvTextDocumentNodeOptionsWidgetTest::printingUnderADialogInsertsNothing()
{
    const QString stored = QStringLiteral("<p>${CREATION_TIME}</p>");
    const auto print = [this]() {
        m_context->setPrinting(true);
        m_text->subWidgetAt(0);
        m_context->setPrinting(false);
    };
    edit(stored);
    const LinkProbe links([&](KvAddLinkDialog *dialog) {
        dialog->setTitle(QStringLiteral("title"));
        print();
        dialog->accept();
    });
    m_panel->slotLinkClicked();
    QCOMPARE(links.count(), 1);
    QCOMPARE(m_cfg->text(), stored); // the values that are shown now are not stored

    const QString path = temporaryPath(QStringLiteral("picture.png"));
    QVERIFY(QImage(20, 10, QImage::Format_RGB32).save(path));
    edit(stored);
    const ImageProbe images([&](KvAddImageDialog *dialog) {
        print();
        choose(dialog, path, 25, 0);
    });
    m_panel->slotGalleryClicked();
    QCOMPARE(images.count(), 1);
    QCOMPARE(m_cfg->text(), stored);
}

void KvTextDocumentNodeOptionsWidgetTest::worksWithoutAText()
{
    m_text.reset();
    const QSignalSpy bold(m_panel, SIGNAL(signalBoldChanged(bool)));
    m_panel->slotStateChanged();
    m_panel->setFromConfig(m_cfg.get());
    button(Link)->click();
    button(Gallery)->click();
    button(Bold)->click();
    tagBox()->setCurrentIndex(2);
    QCOMPARE(tagBox()->currentIndex(), 0);
    QCOMPARE(bold.count(), 1);

    QWidget parent;
    const KvTextDocumentNodeCfg cfg(nullptr);
    const auto *panel = new KvTextDocumentNodeOptionsWidget(&cfg, nullptr, &parent);
    QCOMPARE(panel->findChild<QLabel *>(QStringLiteral("sideHeader"))->text(), QStringLiteral("Text"));
    QCOMPARE(PanelProbe::controls<QComboBox>(panel).last()->count(), 1);
}

STATREPORT_TEST_MAIN(KvTextDocumentNodeOptionsWidgetTest)
#include "KvTextDocumentNodeOptionsWidgetTest.moc"
