// SPDX-License-Identifier: MIT
#include "editor/KvTemplatesEditorWindow.h"
#include "FakeEditor.h"
#include "editor/KvEditorToolWidget.h"
#include "editor/KvPrintProgressDialog.h"
#include "gui/QtAdvancedStylesheet.h"
#include "kernel/ZtAppSettings.h"
#include "report/KvPageCountWidget.h"
#include "report/PdfFile.h"
#include "support/BracketTranslator.h"
#include "support/FileDialogAnswerer.h"
#include "support/MessageBoxAnswerer.h"
#include "support/MetaMethods.h"
#include "support/RightToLeft.h"
#include "support/StatReportTest.h"
#include "widgets/KvWindowTitleBar.h"

#include <QGuiApplication>
#include <QJsonDocument>
#include <QLabel>
#include <QLineEdit>
#include <QScreen>
#include <QScrollArea>
#include <QVBoxLayout>

namespace {

const QString kQuestion = QStringLiteral("The template is modified, do you want to save it first?");

QList<QWidget *> optionsOf(const FakeEditor &editor)
{
    const auto *frame = editor.findChild<QFrame *>(QStringLiteral("nodeOptionsFrame"));
    return frame->findChildren<QWidget *>(QString(), Qt::FindDirectChildrenOnly);
}

QByteArray storedGeometry()
{
    ZtAppSettings::beginGroupAbsolute(QStringLiteral("EditorWindow"));
    const QByteArray bytes = ZtAppSettings::value(QStringLiteral("geometry")).toByteArray();
    ZtAppSettings::endGroup();
    return bytes;
}

void storeGeometry(const QByteArray &bytes)
{
    ZtAppSettings::beginGroupAbsolute(QStringLiteral("EditorWindow"));
    ZtAppSettings::setValue(QStringLiteral("geometry"), bytes);
    ZtAppSettings::endGroup();
}

bool show(QWidget &window)
{
    window.show();
    window.activateWindow();
    return QTest::qWaitForWindowActive(&window);
}

/// Whether the block's piece is on one of the view's pages.
bool isOnPage(const FakeEditor &editor, KvReportNode *node)
{
    const QGraphicsProxyWidget *proxy = FakeEditor::pieceOf(node)->window()->graphicsProxyWidget();
    return proxy && proxy->scene() == editor.pagedView()->scene();
}

} // namespace

class KvTemplatesEditorWindowTest : public StatReportTest
{
    Q_OBJECT

private slots:
    void init();
    void cleanup();

    void methodsAreInTheDeclaredOrder();
    void isAFramelessWindow();
    void widthIsFixed_data();
    void widthIsFixed();
    void reachesTheBottomOfItsScreen();
    void geometryIsRestored();
    void comesDownFromAboveTheScreen();
    void opensQuickly();

    void titleTellsTheTemplate_data();
    void titleTellsTheTemplate();
    void titleFollowsTheModel();
    void toolbarIsInOrder();
    void toolTipsNameTheShortcuts_data();
    void toolTipsNameTheShortcuts();
    void shortcutsPressTheButtons();
    void sidePanelIsInOrder();
    void pagesFillTheRest();
    void pageControlsLookLikeThat();
    void pageControlsSwitchTheModel_data();
    void pageControlsSwitchTheModel();
    void tabGoesFromTheToolbarToThePages();
    void isTranslated();

    void selectionShowsItsOptions();
    void blocksWithoutOptionsLeaveTheFrameEmpty();
    void optionsDieAtOnce();
    void optionsComeBeforeThePagesInTabOrder();
    void saveTakesOverWhatOptionsCommit();

    void clearOfAnUnmodifiedTemplateNeverAsks();
    void clearAsks_data();
    void clearAsks();
    void escapeIsNo();

    void openLoadsTheFile();
    void openAsksFirst();
    void openCancelledChangesNothing();
    void saveWritesTheFile();
    void saveAlwaysAsks_data();
    void saveAlwaysAsks();
    void saveCancelledChangesNothing();
    void aFailedSaveLeavesItModified();

    void printWritesAPdf();
    void printStartsInItsOwnDirectory();
    void printCancelledInTheDialogDoesNothing();
    void printOfAHiddenWindowIsLive();
    void printOfAVisibleWindowBringsTheBlocksBack();
    void aFailedPrintIsTold_data();
    void aFailedPrintIsTold();
    void aCancelledPrintLeavesNothing_data();
    void aCancelledPrintLeavesNothing();

    void closeOfAnUnmodifiedTemplateNeverAsks();
    void closeAsks_data();
    void closeAsks();
    void closeStaysOpenWithoutASave_data();
    void closeStaysOpenWithoutASave();
    void closeOfAHiddenWindowAsksToo();
    void titleBarCloses();
    void closeStoresTheGeometry();

    void shownIsLive();
    void minimisingIsPairedToo();
    void aShownWindowEndsLiveDataWhenItDies();
    void outlivesItsMeasurements();

    void deleteRemovesTheSelectedBlock();
    void deleteInATextIsTheTexts();
    void escapeClearsTheSelection();
    void activatedToolsAreAppended();
    void anEmptyTemplateSaysWhatToDo();
    void changesItsTheme();

private:
    QString newPath(const char *name) const { return QDir(m_directory).filePath(QLatin1String(name)); }

    QString m_directory;
};

void KvTemplatesEditorWindowTest::init()
{
    StatReportTest::init();
    ZtAppSettings::getInstance()->setStoragePath(QString()); // forgets all values
    static int count = 0;
    m_directory = temporaryPath(QStringLiteral("editor%1").arg(++count));
    QVERIFY(QDir().mkpath(m_directory));
}

void KvTemplatesEditorWindowTest::cleanup()
{
    acss::QtAdvancedStylesheet::getInstance()->setCurrentTheme(QStringLiteral("Dark"));
    StatReportTest::cleanup();
}

// ---- window ----

void KvTemplatesEditorWindowTest::methodsAreInTheDeclaredOrder()
{
    const QMetaObject &meta = KvTemplatesEditorWindow::staticMetaObject;
    QCOMPARE(ownMethods(meta, QMetaMethod::Signal), QStringList(QStringLiteral("editorClosed()")));
    const QStringList expected{QStringLiteral("slotNewTemplate()"),
                               QStringLiteral("slotOpenTemplate()"),
                               QStringLiteral("slotSaveTemplate()"),
                               QStringLiteral("slotSaveTemplateAs()"),
                               QStringLiteral("slotPrintReport()"),
                               QStringLiteral("slotTemplateStatusChanged(QString,bool)"),
                               QStringLiteral("slotEditorSelectionChanged(KvBaseDisplayWidget*)"),
                               QStringLiteral("slotHeaderButtonClicked(bool)"),
                               QStringLiteral("slotFooterButtonClicked(bool)"),
                               QStringLiteral("slotPageNumberButtonClicked(bool)"),
                               QStringLiteral("slotHeaderStateChanged(bool)"),
                               QStringLiteral("slotFooterStateChanged(bool)"),
                               QStringLiteral("slotPageNumberingStateChanged(bool)")};
    QCOMPARE(ownMethods(meta, QMetaMethod::Slot).mid(0, expected.size()), expected);
}

void KvTemplatesEditorWindowTest::isAFramelessWindow()
{
    FakeMeasurements measurements;
    QWidget host;
    const FakeEditor editor(measurements.kernelData(), &host);
    QVERIFY(editor.isWindow());
    QVERIFY(editor.windowFlags() & Qt::FramelessWindowHint);
    QVERIFY(editor.testAttribute(Qt::WA_TranslucentBackground));
    QVERIFY(editor.hasMouseTracking());
    QVERIFY(editor.findChild<KvWindowTitleBar *>());
    QVERIFY(editor.isCloseCancellable());
    QVERIFY(!editor.isVisible());
}

void KvTemplatesEditorWindowTest::widthIsFixed_data()
{
    QTest::addColumn<int>("storedWidth");
    QTest::newRow("nothing stored") << 0;
    QTest::newRow("narrow") << 700;
    QTest::newRow("wide") << 1900;
}

void KvTemplatesEditorWindowTest::widthIsFixed()
{
    QFETCH(int, storedWidth);
    if (storedWidth > 0) {
        QWidget other;
        other.setGeometry(10, 20, storedWidth, 500);
        storeGeometry(other.saveGeometry());
    }
    FakeMeasurements measurements;
    FakeEditor editor(measurements.kernelData());
    QCOMPARE(editor.minimumWidth(), 1316);
    QCOMPARE(editor.maximumWidth(), 1316);
    QVERIFY(show(editor));
    QCOMPARE(editor.width(), 1316);
}

void KvTemplatesEditorWindowTest::reachesTheBottomOfItsScreen()
{
    FakeMeasurements measurements;
    const FakeEditor editor(measurements.kernelData());
    const QRect available = editor.screen()->availableGeometry();
    QCOMPARE(editor.geometry().bottom(), available.bottom());
    QCOMPARE(editor.geometry().top(), available.top());
    QCOMPARE(editor.width(), 1316);
}

void KvTemplatesEditorWindowTest::geometryIsRestored()
{
    const QRect available = QGuiApplication::primaryScreen()->availableGeometry();
    QWidget other;
    other.setGeometry(available.left() + 30, available.top() + 40, 1316, 500);
    storeGeometry(other.saveGeometry());
    FakeMeasurements measurements;
    const FakeEditor editor(measurements.kernelData());
    QCOMPARE(editor.geometry().top(), available.top() + 40);
    QCOMPARE(editor.geometry().bottom(), available.bottom());
}

void KvTemplatesEditorWindowTest::comesDownFromAboveTheScreen()
{
    FakeMeasurements measurements;
    FakeEditor editor(measurements.kernelData());
    editor.move(12, -5);
    QVERIFY(show(editor));
    QCOMPARE(editor.frameGeometry().topLeft(), QPoint(12, 30));
    editor.hide();
    editor.move(12, 0);
    QVERIFY(show(editor));
    QCOMPARE(editor.frameGeometry().topLeft(), QPoint(12, 0));
}

void KvTemplatesEditorWindowTest::opensQuickly()
{
    FakeMeasurements measurements;
    QElapsedTimer elapsed;
    elapsed.start();
    FakeEditor editor(measurements.kernelData());
    editor.show();
    QVERIFY(QTest::qWaitForWindowExposed(&editor));
    editor.grab();
    qDebug() << "made, shown and painted in" << elapsed.elapsed() << "ms";
    // Generous: test machines are busy.
    QVERIFY(elapsed.elapsed() < 3000);
}

// ---- looks ----

void KvTemplatesEditorWindowTest::titleTellsTheTemplate_data()
{
    QTest::addColumn<QString>("path");
    QTest::addColumn<bool>("modified");
    QTest::addColumn<QString>("title");
    const QString path = QStringLiteral("/reports/plate.rtp");
    QTest::newRow("new") << QString() << false << QStringLiteral("Fake editor - [new]");
    QTest::newRow("new, modified") << QString() << true << QStringLiteral("Fake editor - *[new]");
    QTest::newRow("file") << path << false << QStringLiteral("Fake editor - /reports/plate.rtp");
    QTest::newRow("file, modified") << path << true << QStringLiteral("Fake editor - */reports/plate.rtp");
}

void KvTemplatesEditorWindowTest::titleTellsTheTemplate()
{
    QFETCH(QString, path);
    QFETCH(bool, modified);
    QFETCH(QString, title);
    FakeMeasurements measurements;
    FakeEditor editor(measurements.kernelData());
    editor.slotTemplateStatusChanged(path, modified);
    QCOMPARE(editor.windowTitle(), title);
    QCOMPARE(editor.findChild<KvWindowTitleBar *>()->title(), title);
    if (path.isEmpty())
        return;
    const RightToLeft arabic;
    editor.slotTemplateStatusChanged(path, modified);
    QCOMPARE(editor.windowTitle(), QString(title).replace(path, RightToLeft::isolated(path)));
}

void KvTemplatesEditorWindowTest::titleFollowsTheModel()
{
    FakeMeasurements measurements;
    FakeEditor editor(measurements.kernelData());
    QCOMPARE(editor.windowTitle(), QStringLiteral("Fake editor - [new]"));
    editor.addBlock();
    QCOMPARE(editor.windowTitle(), QStringLiteral("Fake editor - *[new]"));
    const QString path = newPath("a.fake");
    QVERIFY(editor.templateModel()->save(path));
    QCOMPARE(editor.windowTitle(), QStringLiteral("Fake editor - ") + path);
    editor.templateModel()->setHeaderEnabled(true);
    QCOMPARE(editor.windowTitle(), QStringLiteral("Fake editor - *") + path);
}

void KvTemplatesEditorWindowTest::toolbarIsInOrder()
{
    FakeMeasurements measurements;
    FakeEditor editor(measurements.kernelData());
    QVERIFY(show(editor));
    const auto *toolbar = editor.findChild<QFrame *>(QStringLiteral("toolbarFrame"));
    const auto buttons = toolbar->findChildren<QPushButton *>(QString(), Qt::FindDirectChildrenOnly);
    QStringList texts;
    int right = 0;
    for (const QPushButton *button : buttons) {
        texts.append(button->text());
        QVERIFY(button->x() > right);
        right = button->geometry().right();
    }
    QCOMPARE(texts, QStringList({QStringLiteral("Open File"), QStringLiteral("Clear"),
                                 QStringLiteral("Save as ..."), QStringLiteral("Save")}));
    const QPushButton *print = editor.button("printButton");
    QCOMPARE(print->text(), QStringLiteral("Print"));
    QCOMPARE(print->parentWidget()->objectName(), QStringLiteral("printFrame"));
}

void KvTemplatesEditorWindowTest::toolTipsNameTheShortcuts_data()
{
    QTest::addColumn<QByteArray>("name");
    QTest::addColumn<QString>("toolTip");
    QTest::addColumn<QString>("keys");
    QTest::newRow("open") << QByteArray("openButton") << QStringLiteral("Open a template file (Ctrl+O)")
                          << QStringLiteral("Ctrl+O");
    QTest::newRow("clear") << QByteArray("clearButton")
                           << QStringLiteral("Start a new, empty template (Ctrl+N)")
                           << QStringLiteral("Ctrl+N");
    QTest::newRow("save as") << QByteArray("saveAsButton")
                             << QStringLiteral("Save the template to another file (Ctrl+Shift+S)")
                             << QStringLiteral("Ctrl+Shift+S");
    QTest::newRow("save") << QByteArray("saveButton") << QStringLiteral("Save the template (Ctrl+S)")
                          << QStringLiteral("Ctrl+S");
    QTest::newRow("print") << QByteArray("printButton")
                           << QStringLiteral("Print the report to a PDF file (Ctrl+P)")
                           << QStringLiteral("Ctrl+P");
}

void KvTemplatesEditorWindowTest::toolTipsNameTheShortcuts()
{
    QFETCH(QByteArray, name);
    QFETCH(QString, toolTip);
    QFETCH(QString, keys);
    FakeMeasurements measurements;
    const FakeEditor editor(measurements.kernelData());
    QCOMPARE(editor.button(name)->toolTip(), toolTip);
    QCOMPARE(editor.button(name)->shortcut(), QKeySequence(keys));
    QVERIFY(!editor.button(name)->icon().isNull());
}

void KvTemplatesEditorWindowTest::shortcutsPressTheButtons()
{
    FakeMeasurements measurements;
    FakeEditor editor(measurements.kernelData());
    QVERIFY(show(editor));
    const FileDialogAnswerer answerer;
    QTest::keyClick(&editor, Qt::Key_S, Qt::ControlModifier | Qt::ShiftModifier);
    QTRY_COMPARE(answerer.dialogs().size(), 1);
    QTRY_VERIFY(!QApplication::activeModalWidget());
    editor.activateWindow();
    QVERIFY(QTest::qWaitForWindowActive(&editor));
    QTest::keyClick(&editor, Qt::Key_P, Qt::ControlModifier);
    QTRY_COMPARE(answerer.dialogs().size(), 2);
    QCOMPARE(answerer.dialogs().at(0).caption, QStringLiteral("Choose file to save"));
    QCOMPARE(answerer.dialogs().at(1).caption, QStringLiteral("Choose file to print to"));
}

void KvTemplatesEditorWindowTest::sidePanelIsInOrder()
{
    FakeMeasurements measurements;
    FakeEditor editor(measurements.kernelData());
    QVERIFY(show(editor));
    const auto *area = editor.findChild<QScrollArea *>();
    QVERIFY(area->widgetResizable());
    QCOMPARE(area->horizontalScrollBarPolicy(), Qt::ScrollBarAlwaysOff);
    QCOMPARE(area->verticalScrollBarPolicy(), Qt::ScrollBarAsNeeded);
    QCOMPARE(area->widget()->objectName(), QStringLiteral("sideScrollContents"));
    const auto *column = qobject_cast<QVBoxLayout *>(area->widget()->layout());
    QVERIFY(column);
    QCOMPARE(column->contentsMargins(), QMargins(9, 9, 9, 9));
    QCOMPARE(column->spacing(), 0);
    QCOMPARE(column->alignment(), Qt::Alignment(Qt::AlignTop));

    int bottom = 0;
    for (const char *name : {"toolsFrame", "pageControlsFrame", "nodeOptionsFrame"}) {
        const auto *frame = area->widget()->findChild<QFrame *>(QLatin1String(name));
        QVERIFY2(frame, name);
        QCOMPARE(frame->frameShape(), QFrame::NoFrame);
        QCOMPARE(frame->sizePolicy().horizontalPolicy(), QSizePolicy::Expanding);
        QVERIFY2(frame->y() >= bottom, name);
        bottom = frame->geometry().bottom();
    }
    const auto *toolsFrame = editor.findChild<QFrame *>(QStringLiteral("toolsFrame"));
    QCOMPARE(toolsFrame->layout()->spacing(), 9);
    const auto *header = toolsFrame->findChild<QLabel *>(QStringLiteral("sideHeader"));
    QCOMPARE(header->text(), QStringLiteral("Add block"));
    QCOMPARE(header->font().pixelSize(), 26);
    QCOMPARE(header->minimumHeight(), 20);
    QVERIFY(header->y() < editor.toolsList()->y());
    const auto *options = editor.findChild<QFrame *>(QStringLiteral("nodeOptionsFrame"));
    QCOMPARE(options->layout()->spacing(), 0);
    QCOMPARE(options->layout()->contentsMargins(), QMargins());
}

void KvTemplatesEditorWindowTest::pagesFillTheRest()
{
    FakeMeasurements measurements;
    FakeEditor editor(measurements.kernelData());
    QVERIFY(show(editor));
    const auto *frame = editor.findChild<QFrame *>(QStringLiteral("reportPagesFrame"));
    QCOMPARE(frame->sizePolicy().horizontalPolicy(), QSizePolicy::Expanding);
    QCOMPARE(frame->sizePolicy().verticalPolicy(), QSizePolicy::Expanding);
    QCOMPARE(frame->sizePolicy().verticalStretch(), 1);
    QCOMPARE(frame->frameShape(), QFrame::NoFrame);
    QCOMPARE(frame->frameShadow(), QFrame::Raised);
    QVERIFY(frame->isAncestorOf(editor.pagedView()));
    QCOMPARE(editor.pagedView()->size(), frame->size());
    QCOMPARE(editor.pagedView()->model(), editor.templateModel());
    QVERIFY(frame->width() > 900);
}

void KvTemplatesEditorWindowTest::pageControlsLookLikeThat()
{
    FakeMeasurements measurements;
    const FakeEditor editor(measurements.kernelData());
    const auto *frame = editor.findChild<QFrame *>(QStringLiteral("pageControlsFrame"));
    QCOMPARE(frame->layout()->spacing(), 12);
    QCOMPARE(frame->layout()->alignment(), Qt::Alignment(Qt::AlignLeft));
    const auto buttons = frame->findChildren<QPushButton *>();
    QCOMPARE(buttons.size(), 3);
    const QStringList names{QStringLiteral("Header on every page"), QStringLiteral("Footer on every page"),
                            QStringLiteral("Page numbers")};
    for (int i = 0; i < buttons.size(); ++i) {
        QVERIFY(buttons.at(i)->isCheckable());
        QVERIFY(!buttons.at(i)->isChecked());
        QVERIFY(!buttons.at(i)->icon().isNull());
        QCOMPARE(buttons.at(i)->iconSize(), QSize(24, 24));
        QCOMPARE(buttons.at(i)->toolTip(), names.at(i));
        QCOMPARE(buttons.at(i)->accessibleName(), names.at(i));
    }
}

void KvTemplatesEditorWindowTest::pageControlsSwitchTheModel_data()
{
    QTest::addColumn<QByteArray>("name");
    QTest::newRow("header") << QByteArray("headerButton");
    QTest::newRow("footer") << QByteArray("footerButton");
    QTest::newRow("page number") << QByteArray("pageNumberButton");
}

void KvTemplatesEditorWindowTest::pageControlsSwitchTheModel()
{
    QFETCH(QByteArray, name);
    FakeMeasurements measurements;
    FakeEditor editor(measurements.kernelData());
    KvTemplateModel *model = editor.templateModel();
    QPushButton *button = editor.button(name);
    const auto isEnabled = [model, name]() {
        if (name == "headerButton")
            return model->isHeaderEnabled();
        return name == "footerButton" ? model->isFooterEnabled() : model->isPageNumberingEnabled();
    };
    QTest::mouseClick(button, Qt::LeftButton);
    QVERIFY(isEnabled());
    QVERIFY(button->isChecked());
    QCOMPARE(int(model->isHeaderEnabled()) + int(model->isFooterEnabled()) +
                 int(model->isPageNumberingEnabled()),
             1);
    QTest::mouseClick(button, Qt::LeftButton);
    QVERIFY(!isEnabled());
    // And the other way round, as when a file is loaded.
    model->setHeaderEnabled(true);
    model->setFooterEnabled(true);
    model->setPageNumberingEnabled(true);
    QVERIFY(button->isChecked());
    model->newTemplate();
    QVERIFY(!button->isChecked());
}

void KvTemplatesEditorWindowTest::tabGoesFromTheToolbarToThePages()
{
    FakeMeasurements measurements;
    FakeEditor editor(measurements.kernelData());
    QVERIFY(show(editor));
    QCOMPARE(editor.focusWidget(), editor.pagedView());
    QWidget *tool = editor.factory()->toolWidget(nullptr);
    QWidget *close = editor.findChild<KvWindowTitleBar *>()->focusProxy();
    QList<QWidget *> expected;
    for (const char *name : {"openButton", "clearButton", "saveAsButton", "saveButton", "printButton"})
        expected.append(editor.button(name));
    expected.append(tool);
    for (const char *name : {"headerButton", "footerButton", "pageNumberButton"})
        expected.append(editor.button(name));
    expected += {editor.pagedView(), close};
    editor.button("openButton")->setFocus();
    QList<QWidget *> reached;
    for (int i = 0; i < expected.size(); ++i) {
        reached.append(editor.focusWidget());
        QTest::keyClick(editor.focusWidget(), Qt::Key_Tab);
    }
    for (int i = 0; i < expected.size(); ++i)
        QVERIFY2(reached.at(i) == expected.at(i),
                 qPrintable(QStringLiteral("%1: %2").arg(i).arg(reached.at(i)->objectName())));
}

void KvTemplatesEditorWindowTest::isTranslated()
{
    FakeMeasurements measurements;
    FakeEditor editor(measurements.kernelData());
    {
        const BracketTranslator texts(QStringLiteral("KvTemplatesEditorWindow"));
        QTRY_COMPARE(editor.windowTitle(), QStringLiteral("Fake editor - [[new]]"));
        QCOMPARE(editor.button("saveButton")->toolTip(), QStringLiteral("[Save the template] (Ctrl+S)"));
    }
    const BracketTranslator form(QStringLiteral("KvTemplatesEditorWindowUi"));
    QTRY_COMPARE(editor.button("saveButton")->text(), QStringLiteral("[Save]"));
    QCOMPARE(editor.button("saveButton")->shortcut(), QKeySequence(Qt::CTRL + Qt::Key_S));
}

// ---- options ----

void KvTemplatesEditorWindowTest::selectionShowsItsOptions()
{
    FakeMeasurements measurements;
    FakeEditor editor(measurements.kernelData());
    KvReportNode *first = editor.addBlock();
    KvReportNode *second = editor.addBlock();
    QVERIFY(optionsOf(editor).isEmpty());
    editor.pagedView()->selectNode(first);
    QCOMPARE(optionsOf(editor).size(), 1);
    const QPointer<QWidget> options = optionsOf(editor).first();
    QVERIFY(static_cast<FakeOptions *>(options.data())->withPlacement());
    editor.pagedView()->selectNode(second);
    QVERIFY(!options);
    QCOMPARE(optionsOf(editor).size(), 1);
    editor.pagedView()->slotCloseAllEditors();
    QVERIFY(optionsOf(editor).isEmpty());
}

void KvTemplatesEditorWindowTest::blocksWithoutOptionsLeaveTheFrameEmpty()
{
    FakeMeasurements measurements;
    FakeEditor editor(measurements.kernelData());
    KvReportNode *node = editor.addBlock();
    editor.pagedView()->selectNode(node);
    QCOMPARE(optionsOf(editor).size(), 1);
    KvPageCountWidget pageCount(nullptr, 0);
    editor.slotEditorSelectionChanged(&pageCount);
    QVERIFY(optionsOf(editor).isEmpty());
}

void KvTemplatesEditorWindowTest::optionsDieAtOnce()
{
    FakeMeasurements measurements;
    FakeEditor editor(measurements.kernelData());
    KvReportNode *node = editor.addBlock();
    editor.slotEditorSelectionChanged(node->displayWidget());
    const QPointer<QWidget> options = optionsOf(editor).first();
    editor.slotEditorSelectionChanged(nullptr);
    QVERIFY(!options);
}

void KvTemplatesEditorWindowTest::optionsComeBeforeThePagesInTabOrder()
{
    FakeMeasurements measurements;
    FakeEditor editor(measurements.kernelData());
    QVERIFY(show(editor));
    KvReportNode *node = editor.addBlock();
    editor.pagedView()->selectNode(node);
    QList<QWidget *> chain;
    QWidget *widget = editor.button("pageNumberButton");
    do {
        if (widget->focusPolicy() & Qt::TabFocus)
            chain.append(widget);
        widget = widget->nextInFocusChain();
    } while (widget != editor.button("pageNumberButton"));
    const auto controls = optionsOf(editor).first()->findChildren<QPushButton *>();
    QCOMPARE(controls.size(), 2);
    QCOMPARE(chain.mid(1, 2), QList<QWidget *>({controls.at(0), controls.at(1)}));
    QVERIFY(chain.indexOf(editor.pagedView()) > 2);
    QVERIFY(chain.indexOf(editor.findChild<KvWindowTitleBar *>()->focusProxy()) >
            chain.indexOf(editor.pagedView()));
}

void KvTemplatesEditorWindowTest::saveTakesOverWhatOptionsCommit()
{
    FakeMeasurements measurements;
    FakeEditor editor(measurements.kernelData());
    KvReportNode *node = editor.addBlock();
    auto *cfg = static_cast<FakeBlockCfg *>(node->config());
    editor.pagedView()->selectNode(node);
    static_cast<FakeOptions *>(optionsOf(editor).first())->setWhenDying([cfg, &editor]() {
        cfg->setHeights({321});
        editor.templateModel()->slotTemplateModified();
    });
    const QString path = newPath("committed.fake");
    const FileDialogAnswerer answerer(path);
    QVERIFY(editor.slotSaveTemplate());
    QVERIFY(!editor.templateModel()->isModified());
    QFile file(path);
    QVERIFY(file.open(QIODevice::ReadOnly));
    QVERIFY(file.readAll().contains("321"));
}

// ---- new and open ----

void KvTemplatesEditorWindowTest::clearOfAnUnmodifiedTemplateNeverAsks()
{
    FakeMeasurements measurements;
    FakeEditor editor(measurements.kernelData());
    editor.addBlock();
    QVERIFY(editor.templateModel()->save(newPath("a.fake")));
    const MessageBoxAnswerer answerer;
    QTest::mouseClick(editor.button("clearButton"), Qt::LeftButton);
    QCOMPARE(editor.templateModel()->nodeCount(), 0);
    QVERIFY(editor.templateModel()->filePath().isEmpty());
    QCOMPARE(answerer.boxes().size(), 0);
}

void KvTemplatesEditorWindowTest::clearAsks_data()
{
    QTest::addColumn<int>("answer");
    QTest::addColumn<bool>("fileIsChosen");
    QTest::addColumn<bool>("isCleared");
    QTest::addColumn<bool>("isSaved");
    QTest::newRow("no") << int(QMessageBox::No) << false << true << false;
    QTest::newRow("yes") << int(QMessageBox::Yes) << true << true << true;
    QTest::newRow("yes, file dialog cancelled") << int(QMessageBox::Yes) << false << false << false;
}

void KvTemplatesEditorWindowTest::clearAsks()
{
    QFETCH(int, answer);
    QFETCH(bool, fileIsChosen);
    QFETCH(bool, isCleared);
    QFETCH(bool, isSaved);
    FakeMeasurements measurements;
    FakeEditor editor(measurements.kernelData());
    editor.addBlock();
    const QString path = newPath("a.fake");
    const MessageBoxAnswerer boxes(static_cast<QMessageBox::StandardButton>(answer));
    const FileDialogAnswerer dialogs(fileIsChosen ? QStringList(path) : QStringList());
    editor.slotNewTemplate();
    QCOMPARE(boxes.boxes().size(), 1);
    const SeenMessageBox &box = boxes.boxes().first();
    QCOMPARE(box.title, QStringLiteral("Are you sure?"));
    QCOMPARE(box.text, kQuestion);
    QCOMPARE(box.icon, QMessageBox::Question);
    QCOMPARE(box.buttons, QMessageBox::Yes | QMessageBox::No);
    QVERIFY(box.isModal);
    QCOMPARE(editor.templateModel()->nodeCount(), isCleared ? 0 : 1);
    QCOMPARE(editor.templateModel()->isModified(), !isCleared);
    QCOMPARE(QFile::exists(path), isSaved);
}

void KvTemplatesEditorWindowTest::escapeIsNo()
{
    FakeMeasurements measurements;
    FakeEditor editor(measurements.kernelData());
    editor.addBlock();
    QTimer timer;
    connect(&timer, &QTimer::timeout, &timer, []() {
        if (auto *box = qobject_cast<QMessageBox *>(QApplication::activeModalWidget()))
            QTest::keyClick(box, Qt::Key_Escape);
    });
    timer.start(5);
    editor.slotNewTemplate();
    QCOMPARE(editor.templateModel()->nodeCount(), 0);
}

void KvTemplatesEditorWindowTest::openLoadsTheFile()
{
    FakeMeasurements measurements;
    FakeEditor editor(measurements.kernelData());
    editor.addBlock();
    editor.addBlock();
    const QString path = newPath("two.fake");
    QVERIFY(editor.templateModel()->save(path));
    editor.templateModel()->newTemplate();
    editor.setTemplatesDirectory(temporaryPath(QString()));
    const FileDialogAnswerer answerer(path);
    QTest::mouseClick(editor.button("openButton"), Qt::LeftButton);
    QCOMPARE(answerer.dialogs().size(), 1);
    const SeenFileDialog &dialog = answerer.dialogs().first();
    QCOMPARE(dialog.caption, QStringLiteral("Choose file to open"));
    QCOMPARE(dialog.filters, QStringList(QStringLiteral("Fake file (*.fake)")));
    QCOMPARE(dialog.directory, QDir(temporaryPath(QString())).absolutePath());
    QCOMPARE(dialog.acceptMode, QFileDialog::AcceptOpen);
    QCOMPARE(editor.templateModel()->nodeCount(), 2);
    QCOMPARE(editor.templateModel()->filePath(), path);
    QCOMPARE(editor.templatesDirectory(), m_directory);
}

void KvTemplatesEditorWindowTest::openAsksFirst()
{
    FakeMeasurements measurements;
    FakeEditor editor(measurements.kernelData());
    editor.addBlock();
    const MessageBoxAnswerer boxes(QMessageBox::Yes);
    const FileDialogAnswerer dialogs;
    editor.slotOpenTemplate();
    QCOMPARE(boxes.boxes().size(), 1);
    QCOMPARE(boxes.boxes().first().text, kQuestion);
    QCOMPARE(dialogs.dialogs().size(), 1);
    QCOMPARE(dialogs.dialogs().first().caption, QStringLiteral("Choose file to save"));
    QCOMPARE(editor.templateModel()->nodeCount(), 1);
}

void KvTemplatesEditorWindowTest::openCancelledChangesNothing()
{
    FakeMeasurements measurements;
    FakeEditor editor(measurements.kernelData());
    editor.addBlock();
    editor.setTemplatesDirectory(m_directory);
    const QString title = editor.windowTitle();
    const MessageBoxAnswerer boxes(QMessageBox::No);
    const FileDialogAnswerer dialogs;
    editor.slotOpenTemplate();
    QCOMPARE(dialogs.dialogs().size(), 1);
    QCOMPARE(editor.templateModel()->nodeCount(), 1);
    QCOMPARE(editor.windowTitle(), title);
    QCOMPARE(editor.templatesDirectory(), m_directory);
}

// ---- save ----

void KvTemplatesEditorWindowTest::saveWritesTheFile()
{
    FakeMeasurements measurements;
    FakeEditor editor(measurements.kernelData());
    editor.addBlock();
    editor.setTemplatesDirectory(temporaryPath(QString()));
    const FileDialogAnswerer answerer(newPath("plate"));
    QVERIFY(editor.slotSaveTemplate());
    const SeenFileDialog &dialog = answerer.dialogs().first();
    QCOMPARE(dialog.caption, QStringLiteral("Choose file to save"));
    QCOMPARE(dialog.filters, QStringList(QStringLiteral("Fake file (*.fake)")));
    QCOMPARE(dialog.defaultSuffix, QStringLiteral("fake"));
    QCOMPARE(dialog.directory, QDir(temporaryPath(QString())).absolutePath());
    QCOMPARE(editor.templateModel()->filePath(), newPath("plate.fake"));
    QVERIFY(QFile::exists(newPath("plate.fake")));
    QCOMPARE(editor.templatesDirectory(), m_directory);
    QVERIFY(!editor.templateModel()->isModified());
}

void KvTemplatesEditorWindowTest::saveAlwaysAsks_data()
{
    QTest::addColumn<QByteArray>("name");
    QTest::newRow("save") << QByteArray("saveButton");
    QTest::newRow("save as") << QByteArray("saveAsButton");
}

void KvTemplatesEditorWindowTest::saveAlwaysAsks()
{
    QFETCH(QByteArray, name);
    FakeMeasurements measurements;
    FakeEditor editor(measurements.kernelData());
    editor.addBlock();
    QVERIFY(editor.templateModel()->save(newPath("first.fake")));
    editor.setTemplatesDirectory(m_directory);
    const FileDialogAnswerer answerer(newPath("second.fake"));
    QTest::mouseClick(editor.button(name), Qt::LeftButton);
    QCOMPARE(answerer.dialogs().size(), 1);
    QCOMPARE(answerer.dialogs().first().caption, QStringLiteral("Choose file to save"));
    QCOMPARE(answerer.dialogs().first().suggestedName, QStringLiteral("first.fake"));
    QCOMPARE(editor.templateModel()->filePath(), newPath("second.fake"));
}

void KvTemplatesEditorWindowTest::saveCancelledChangesNothing()
{
    FakeMeasurements measurements;
    FakeEditor editor(measurements.kernelData());
    editor.addBlock();
    const FileDialogAnswerer answerer;
    QVERIFY(!editor.slotSaveTemplate());
    QVERIFY(!editor.slotSaveTemplateAs());
    QVERIFY(editor.templateModel()->isModified());
    QVERIFY(editor.templateModel()->filePath().isEmpty());
    QVERIFY(editor.templatesDirectory().isEmpty());
}

void KvTemplatesEditorWindowTest::aFailedSaveLeavesItModified()
{
    FakeMeasurements measurements;
    FakeEditor editor(measurements.kernelData());
    editor.addBlock();
    KvReportNode *bad = editor.addBlock();
    static_cast<FakeBlockCfg *>(bad->config())->setWritable(false);
    const FileDialogAnswerer answerer(newPath("bad.fake"));
    QVERIFY(!editor.slotSaveTemplate());
    QVERIFY(editor.templateModel()->isModified());
}

// ---- print ----

void KvTemplatesEditorWindowTest::printWritesAPdf()
{
    FakeMeasurements measurements;
    FakeEditor editor(measurements.kernelData());
    editor.addBlock(200);
    editor.addBlock(1200);
    const FileDialogAnswerer answerer(newPath("report"));
    QTest::mouseClick(editor.button("printButton"), Qt::LeftButton);
    const SeenFileDialog &dialog = answerer.dialogs().first();
    QCOMPARE(dialog.caption, QStringLiteral("Choose file to print to"));
    QCOMPARE(dialog.filters, QStringList(QStringLiteral("Pdf file (*.pdf)")));
    QCOMPARE(dialog.defaultSuffix, QStringLiteral("pdf"));
    QCOMPARE(dialog.acceptMode, QFileDialog::AcceptSave);
    QCOMPARE(PdfFile(newPath("report.pdf")).pageCount(), 2);
}

void KvTemplatesEditorWindowTest::printStartsInItsOwnDirectory()
{
    FakeMeasurements measurements;
    FakeEditor editor(measurements.kernelData());
    const QString templates = temporaryPath(QStringLiteral("never"));
    editor.setTemplatesDirectory(templates);
    editor.setPrintDirectory(temporaryPath(QString()));
    const FileDialogAnswerer answerer(newPath("report.pdf"));
    editor.slotPrintReport();
    QCOMPARE(answerer.dialogs().first().directory, QDir(temporaryPath(QString())).absolutePath());
    QCOMPARE(editor.printDirectory(), m_directory);
    QCOMPARE(editor.templatesDirectory(), templates);
}

void KvTemplatesEditorWindowTest::printCancelledInTheDialogDoesNothing()
{
    FakeMeasurements measurements;
    FakeEditor editor(measurements.kernelData());
    editor.addBlock();
    QSignalSpy closeEditors(editor.templateModel(), SIGNAL(signalCloseAllEditors()));
    const FileDialogAnswerer answerer;
    editor.slotPrintReport();
    QCOMPARE(answerer.dialogs().size(), 1);
    QCOMPARE(closeEditors.count(), 0);
    QVERIFY(editor.printDirectory().isEmpty());
}

void KvTemplatesEditorWindowTest::printOfAHiddenWindowIsLive()
{
    FakeMeasurements measurements;
    FakeEditor editor(measurements.kernelData());
    editor.addBlock();
    QVector<bool> live;
    editor.factory()->setWhenPainted([&]() { live.append(measurements.kernelData()->isActive()); });
    QSignalSpy listChanged(editor.templateModel(), SIGNAL(signalListChanged()));
    const FileDialogAnswerer answerer(newPath("report.pdf"));
    editor.slotPrintReport();
    QCOMPARE(live, QVector<bool>{true});
    QVERIFY(!measurements.kernelData()->isActive());
    QVERIFY(!editor.templateModel()->context()->isLiveUpdates());
    QVERIFY(!editor.isVisible());
    QCOMPARE(listChanged.count(), 0);
}

void KvTemplatesEditorWindowTest::printOfAVisibleWindowBringsTheBlocksBack()
{
    FakeMeasurements measurements;
    FakeEditor editor(measurements.kernelData());
    KvReportNode *node = editor.addBlock();
    QVERIFY(show(editor));
    QSignalSpy listChanged(editor.templateModel(), SIGNAL(signalListChanged()));
    const FileDialogAnswerer answerer(newPath("report.pdf"));
    editor.slotPrintReport();
    QCOMPARE(listChanged.count(), 1);
    QVERIFY(isOnPage(editor, node));
    QVERIFY(editor.templateModel()->context()->isLiveUpdates());
    QVERIFY(QFile::exists(newPath("report.pdf")));
    QVERIFY(editor.templateModel()->isModified());
}

void KvTemplatesEditorWindowTest::aFailedPrintIsTold_data()
{
    QTest::addColumn<bool>("visible");
    QTest::newRow("hidden") << false;
    QTest::newRow("visible") << true;
}

void KvTemplatesEditorWindowTest::aFailedPrintIsTold()
{
    QFETCH(bool, visible);
    FakeMeasurements measurements;
    FakeEditor editor(measurements.kernelData());
    KvReportNode *node = editor.addBlock();
    if (visible)
        QVERIFY(show(editor));
    const QString path = newPath("no/such/folder/report.pdf");
    expectWarning(QRegularExpression(QStringLiteral("^QPainter::begin\\(\\): Returned false$")));
    const FileDialogAnswerer dialogs(path);
    const MessageBoxAnswerer boxes;
    editor.slotPrintReport();
    QCOMPARE(boxes.boxes().size(), 1);
    const SeenMessageBox &box = boxes.boxes().first();
    QCOMPARE(box.title, QStringLiteral("Save failed"));
    QCOMPARE(box.text, QStringLiteral("Cannot write to file ") + path);
    QCOMPARE(box.icon, QMessageBox::Critical);
    QCOMPARE(box.buttons, QMessageBox::StandardButtons(QMessageBox::Ok));
    QVERIFY(box.isModal);
    QVERIFY(box.hasParent);
    QCOMPARE(isOnPage(editor, node), visible);
    QCOMPARE(editor.templateModel()->context()->isLiveUpdates(), visible);
    QVERIFY(editor.templateModel()->isModified());
}

void KvTemplatesEditorWindowTest::aCancelledPrintLeavesNothing_data()
{
    QTest::addColumn<bool>("isThereBefore");
    QTest::newRow("new file") << false;
    QTest::newRow("file that was there") << true;
}

void KvTemplatesEditorWindowTest::aCancelledPrintLeavesNothing()
{
    QFETCH(bool, isThereBefore);
    FakeMeasurements measurements;
    FakeEditor editor(measurements.kernelData());
    QVERIFY(show(editor));
    KvReportNode *node = editor.addBlock(1200);
    for (int i = 0; i < 9; ++i)
        editor.addBlock(1200);
    int painted = 0;
    // Pages that take their time; the user cancels as soon as that is possible.
    editor.factory()->setWhenPainted([&]() {
        if (!editor.templateModel()->context()->isPrinting())
            return;
        ++painted;
        if (auto *dialog = qobject_cast<KvPrintProgressDialog *>(QApplication::activeModalWidget()))
            QTest::mouseClick(dialog->findChild<QPushButton *>(), Qt::LeftButton);
        else
            QTest::qSleep(KvPrintProgressDialog::DefaultShowDelay / 2);
    });
    const QString path = newPath("report.pdf");
    if (isThereBefore) {
        QFile before(path);
        QVERIFY(before.open(QIODevice::WriteOnly) && before.write("before") == 6);
    }
    const FileDialogAnswerer dialogs(path);
    const MessageBoxAnswerer boxes(QMessageBox::Yes);
    editor.slotPrintReport();
    // Whether to replace the file was asked, and nothing else said.
    QCOMPARE(boxes.boxes().size(), isThereBefore ? 1 : 0);
    QFile after(path);
    QCOMPARE(after.open(QIODevice::ReadOnly), isThereBefore);
    QVERIFY(!isThereBefore || after.readAll() == "before");
    QVERIFY2(painted > 1 && painted < 10, qPrintable(QString::number(painted)));
    QVERIFY(isOnPage(editor, node));
    QVERIFY(!QApplication::overrideCursor());
    QVERIFY(!QApplication::activeModalWidget());
}

// ---- close ----

void KvTemplatesEditorWindowTest::closeOfAnUnmodifiedTemplateNeverAsks()
{
    FakeMeasurements measurements;
    FakeEditor editor(measurements.kernelData());
    QVERIFY(show(editor));
    QSignalSpy closed(&editor, SIGNAL(editorClosed()));
    const MessageBoxAnswerer boxes;
    QVERIFY(editor.close());
    QCOMPARE(boxes.boxes().size(), 0);
    QCOMPARE(closed.count(), 1);
    QVERIFY(!editor.isVisible());
}

void KvTemplatesEditorWindowTest::closeAsks_data()
{
    QTest::addColumn<bool>("cancellable");
    QTest::addColumn<int>("answer");
    QTest::addColumn<bool>("closes");
    QTest::addColumn<bool>("isSaved");
    QTest::newRow("yes") << true << int(QMessageBox::Yes) << true << true;
    QTest::newRow("no") << true << int(QMessageBox::No) << true << false;
    QTest::newRow("cancel") << true << int(QMessageBox::Cancel) << false << false;
    QTest::newRow("yes, no cancel") << false << int(QMessageBox::Yes) << true << true;
    QTest::newRow("no, no cancel") << false << int(QMessageBox::No) << true << false;
    // Escape, as there is no such button: that is No.
    QTest::newRow("escape, no cancel") << false << int(QMessageBox::Cancel) << true << false;
}

void KvTemplatesEditorWindowTest::closeAsks()
{
    QFETCH(bool, cancellable);
    QFETCH(int, answer);
    QFETCH(bool, closes);
    QFETCH(bool, isSaved);
    FakeMeasurements measurements;
    FakeEditor editor(measurements.kernelData());
    QVERIFY(show(editor));
    editor.addBlock();
    editor.setCloseCancellable(cancellable);
    QCOMPARE(editor.isCloseCancellable(), cancellable);
    QSignalSpy closed(&editor, SIGNAL(editorClosed()));
    const QString path = newPath("closed.fake");
    const MessageBoxAnswerer boxes(static_cast<QMessageBox::StandardButton>(answer));
    const FileDialogAnswerer dialogs(path);
    QCOMPARE(editor.close(), closes);
    QCOMPARE(boxes.boxes().size(), 1);
    const SeenMessageBox &box = boxes.boxes().first();
    QCOMPARE(box.title, QStringLiteral("Are you sure?"));
    QCOMPARE(box.text, kQuestion);
    QMessageBox::StandardButtons buttons = QMessageBox::Yes | QMessageBox::No;
    if (cancellable)
        buttons |= QMessageBox::Cancel;
    QCOMPARE(box.buttons, buttons);
    QCOMPARE(editor.isVisible(), !closes);
    QCOMPARE(closed.count(), closes ? 1 : 0);
    QCOMPARE(QFile::exists(path), isSaved);
    QVERIFY2(!storedGeometry().isEmpty(), "stored whatever the answer is");
}

void KvTemplatesEditorWindowTest::closeStaysOpenWithoutASave_data()
{
    QTest::addColumn<bool>("cancellable");
    QTest::addColumn<bool>("fails");
    QTest::newRow("file dialog cancelled") << true << false;
    QTest::newRow("file dialog cancelled, no cancel") << false << false;
    QTest::newRow("save failed") << true << true;
}

void KvTemplatesEditorWindowTest::closeStaysOpenWithoutASave()
{
    QFETCH(bool, cancellable);
    QFETCH(bool, fails);
    FakeMeasurements measurements;
    FakeEditor editor(measurements.kernelData());
    QVERIFY(show(editor));
    KvReportNode *node = editor.addBlock();
    static_cast<FakeBlockCfg *>(node->config())->setWritable(!fails);
    editor.setCloseCancellable(cancellable);
    QSignalSpy closed(&editor, SIGNAL(editorClosed()));
    const MessageBoxAnswerer boxes(QMessageBox::Yes);
    const FileDialogAnswerer dialogs(fails ? QStringList(newPath("closed.fake")) : QStringList());
    QVERIFY(!editor.close());
    QCOMPARE(dialogs.dialogs().size(), 1);
    QVERIFY(editor.isVisible());
    QCOMPARE(closed.count(), 0);
    QVERIFY(editor.templateModel()->isModified());
}

void KvTemplatesEditorWindowTest::closeOfAHiddenWindowAsksToo()
{
    FakeMeasurements measurements;
    FakeEditor editor(measurements.kernelData());
    editor.addBlock();
    QSignalSpy closed(&editor, SIGNAL(editorClosed()));
    const MessageBoxAnswerer boxes(QMessageBox::No);
    QVERIFY(editor.close());
    QCOMPARE(boxes.boxes().size(), 1);
    QCOMPARE(closed.count(), 1);
}

void KvTemplatesEditorWindowTest::titleBarCloses()
{
    FakeMeasurements measurements;
    FakeEditor editor(measurements.kernelData());
    QVERIFY(show(editor));
    QSignalSpy closed(&editor, SIGNAL(editorClosed()));
    QVERIFY(QMetaObject::invokeMethod(editor.findChild<KvWindowTitleBar *>(), "closeClicked"));
    QCOMPARE(closed.count(), 1);
    QVERIFY(!editor.isVisible());
}

void KvTemplatesEditorWindowTest::closeStoresTheGeometry()
{
    FakeMeasurements measurements;
    FakeEditor editor(measurements.kernelData());
    QVERIFY(show(editor));
    editor.move(17, 44);
    const QByteArray expected = editor.saveGeometry();
    QVERIFY(editor.close());
    QCOMPARE(storedGeometry(), expected);
}

// ---- live data ----

void KvTemplatesEditorWindowTest::shownIsLive()
{
    FakeMeasurements measurements;
    FakeEditor editor(measurements.kernelData());
    QVERIFY(!measurements.kernelData()->isActive());
    editor.show();
    QVERIFY(measurements.kernelData()->isActive());
    QVERIFY(editor.templateModel()->context()->isLiveUpdates());
    editor.hide();
    QVERIFY(!measurements.kernelData()->isActive());
    QVERIFY(!editor.templateModel()->context()->isLiveUpdates());
}

void KvTemplatesEditorWindowTest::minimisingIsPairedToo()
{
    FakeMeasurements measurements;
    measurements.kernelData()->setActive(true); // somebody else's
    FakeEditor editor(measurements.kernelData());
    editor.show();
    for (int i = 0; i < 2; ++i) {
        QHideEvent hidden;
        QCoreApplication::sendEvent(&editor, &hidden);
    }
    QVERIFY(measurements.kernelData()->isActive());
    QVERIFY(!editor.templateModel()->context()->isLiveUpdates());
    for (int i = 0; i < 2; ++i) {
        QShowEvent shown;
        QCoreApplication::sendEvent(&editor, &shown);
    }
    editor.hide();
    measurements.kernelData()->setActive(false);
    QVERIFY(!measurements.kernelData()->isActive());
}

void KvTemplatesEditorWindowTest::aShownWindowEndsLiveDataWhenItDies()
{
    FakeMeasurements measurements;
    auto editor = std::make_unique<FakeEditor>(measurements.kernelData());
    editor->addBlock();
    editor->show();
    editor.reset();
    QVERIFY(!measurements.kernelData()->isActive());
    measurements.kernelData()->setActive(true);
    measurements.kernelData()->setActive(false);
    QVERIFY(!measurements.kernelData()->isActive());
}

void KvTemplatesEditorWindowTest::outlivesItsMeasurements()
{
    auto kernelData = std::make_unique<KvReportKernelData>();
    FakeEditor editor(kernelData.get());
    editor.addBlock();
    editor.show();
    kernelData.reset();
    editor.hide();
    editor.show();
    QVERIFY(editor.isVisible());
}

// ---- keys and palette ----

void KvTemplatesEditorWindowTest::deleteRemovesTheSelectedBlock()
{
    FakeMeasurements measurements;
    FakeEditor editor(measurements.kernelData());
    KvReportNode *first = editor.addBlock();
    KvReportNode *second = editor.addBlock();
    QVERIFY(show(editor));
    QTest::keyClick(editor.pagedView(), Qt::Key_Delete);
    QCOMPARE(editor.templateModel()->nodeCount(), 2);
    editor.pagedView()->selectNode(first);
    QTest::keyClick(editor.pagedView(), Qt::Key_Delete);
    QCOMPARE(editor.templateModel()->nodes(), QVector<KvReportNode *>{second});
    QVERIFY(optionsOf(editor).isEmpty());
}

void KvTemplatesEditorWindowTest::deleteInATextIsTheTexts()
{
    FakeMeasurements measurements;
    FakeEditor editor(measurements.kernelData());
    KvReportNode *node = editor.addBlock();
    QVERIFY(show(editor));
    editor.pagedView()->selectNode(node);
    auto *edit = new QLineEdit(QStringLiteral("abc"), optionsOf(editor).first());
    edit->show();
    edit->setFocus();
    edit->setCursorPosition(0);
    QTest::keyClick(edit, Qt::Key_Delete);
    QCOMPARE(edit->text(), QStringLiteral("bc"));
    QCOMPARE(editor.templateModel()->nodeCount(), 1);
}

void KvTemplatesEditorWindowTest::escapeClearsTheSelection()
{
    FakeMeasurements measurements;
    FakeEditor editor(measurements.kernelData());
    KvReportNode *node = editor.addBlock();
    QVERIFY(show(editor));
    editor.pagedView()->selectNode(node);
    QVERIFY(editor.pagedView()->selectedNode());
    QTest::keyClick(editor.pagedView(), Qt::Key_Escape);
    QVERIFY(!editor.pagedView()->selectedNode());
    QVERIFY(optionsOf(editor).isEmpty());
    QVERIFY(editor.isVisible());
}

void KvTemplatesEditorWindowTest::activatedToolsAreAppended()
{
    FakeMeasurements measurements;
    FakeEditor editor(measurements.kernelData());
    editor.addBlock();
    QVERIFY(show(editor));
    QTest::keyClick(editor.factory()->toolWidget(nullptr), Qt::Key_Return);
    QCOMPARE(editor.templateModel()->nodeCount(), 2);
    QCOMPARE(editor.pagedView()->selectedNode(), editor.templateModel()->node(1));
    QCOMPARE(optionsOf(editor).size(), 1);
    emit editor.toolsList()->signalToolActivated(QStringLiteral("no such type"));
    QCOMPARE(editor.templateModel()->nodeCount(), 2);
}

void KvTemplatesEditorWindowTest::anEmptyTemplateSaysWhatToDo()
{
    FakeMeasurements measurements;
    FakeEditor editor(measurements.kernelData());
    const auto *hint = editor.findChild<QLabel *>(QStringLiteral("emptyHint"));
    QVERIFY(show(editor));
    QVERIFY(hint->isVisible());
    QCOMPARE(hint->text(), QStringLiteral("The template is empty. Drag a block from here onto the page."));
    editor.addBlock();
    QVERIFY(!hint->isVisible());
    editor.templateModel()->newTemplate();
    QVERIFY(hint->isVisible());
}

void KvTemplatesEditorWindowTest::changesItsTheme()
{
    FakeMeasurements measurements;
    FakeEditor editor(measurements.kernelData());
    QVERIFY(show(editor));
    auto *style = acss::QtAdvancedStylesheet::getInstance();
    const auto colorAt = [&editor](const QPoint &point) { return editor.grab().toImage().pixelColor(point); };
    QCOMPARE(colorAt(QPoint(0, 0)), style->color(QStringLiteral("line")));
    QCOMPARE(colorAt(QPoint(3, 3)), style->color(QStringLiteral("window")));
    style->setCurrentTheme(QStringLiteral("Light"));
    QCOMPARE(colorAt(QPoint(0, 0)), style->color(QStringLiteral("line")));
    QCOMPARE(colorAt(QPoint(3, 3)), style->color(QStringLiteral("window")));
}

STATREPORT_TEST_MAIN(KvTemplatesEditorWindowTest)
#include "KvTemplatesEditorWindowTest.moc"
