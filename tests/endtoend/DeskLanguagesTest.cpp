// SPDX-License-Identifier: MIT
#include "support/StatReportTest.h"

#include "DeskUser.h"
#include "KvDeskActions.h"
#include "KvDeskCalibrationDialog.h"
#include "KvDeskCalibrator.h"
#include "KvDeskExportDialog.h"
#include "KvDeskGuideCommand.h"
#include "KvDeskGuideWindow.h"
#include "KvDeskImageView.h"
#include "KvDeskLanguages.h"
#include "KvDeskLiveBar.h"
#include "KvDeskSettingsDialog.h"
#include "KvDeskToolColumn.h"
#include "KvDeskTranslation.h"
#include "KvDeskValueTable.h"
#include "KvDeskValueTableModel.h"
#include "RunningDesk.h"
#include "ShortcutLetters.h"
#include "TextFit.h"
#include "host/desk/FakeCamera.h"
#include "host/desk/RecoveryCopies.h"
#include "kernel/ZtAppSettings.h"
#include "measuring/ZtDrawnObjectPainter.h"

namespace {

constexpr int kSettlingTime = 500; ///< milliseconds

QByteArray lines(const QStringList &texts)
{
    return '\n' + texts.join(QLatin1Char('\n')).toUtf8();
}

/// Layouts show what they are given in the next round of events.
bool hasShownAll(const QWidget *window)
{
    for (QWidget *widget : window->findChildren<QWidget *>()) {
        const QWidget *const parent = widget->parentWidget();
        if (parent->isVisible() && parent->layout() && parent->layout()->indexOf(widget) >= 0 &&
            widget->isHidden() && !widget->testAttribute(Qt::WA_WState_ExplicitShowHide))
            return false;
    }
    return true;
}

} // namespace

/** Walks through the windows of the Measuring Desk with the plug-in in it, in every language. */
class DeskLanguagesTest : public StatReportTest
{
    Q_OBJECT

private slots:
    void init();
    void cleanup();

    void everyTextHasRoom_data() { addLanguages(); }
    void everyTextHasRoom();
    void everyStatisticsViewHasRoom_data() { addLanguages(); }
    void everyStatisticsViewHasRoom();
    void everyPanelOfTheEditorHasRoom_data() { addLanguages(); }
    void everyPanelOfTheEditorHasRoom();
    void everyDialogHasRoom_data() { addLanguages(); }
    void everyDialogHasRoom();
    void lettersAreUnique_data() { addLanguages(); }
    void lettersAreUnique();
    void arabicMirrorsTheInterfaceOnly();
    void labelsOfObjectsReadAlike();

private:
    static void addLanguages()
    {
        QTest::addColumn<QString>("language");
        for (const KvDeskLanguage &language : KvDeskLanguages::all())
            QTest::newRow(qPrintable(language.name)) << language.name;
    }
    void start(const QString &language);
    void showAllPanels();
    void openSession();
    void showLiveImage();
    void openEditor();
    void composeAll();
    void openStatistics();
    void lookAtDialogsOfTexts();
    void lookAtModalDialog(const char *slot);
    void look(QWidget *window, const char *name);

    std::unique_ptr<KvDeskTranslation> m_translation;
    std::unique_ptr<RunningDesk> m_desk;
    DeskUser m_user;
    QStringList m_faults;
};

void DeskLanguagesTest::init()
{
    StatReportTest::init();
    ZtAppSettings::getInstance()->setStoragePath(QString());
    m_faults.clear();
}

void DeskLanguagesTest::cleanup()
{
    m_desk.reset();
    m_translation.reset();
    QLocale::setDefault(QLocale::c());
    QGuiApplication::setLayoutDirection(Qt::LeftToRight);
    ZtAppSettings::setValue(QStringLiteral("GEN_Language"), QStringLiteral("English"));
    StatReportTest::cleanup();
}

void DeskLanguagesTest::start(const QString &language)
{
    ZtAppSettings::setValue(QStringLiteral("GEN_Language"), language);
    QLocale::setDefault(KvDeskLanguages::localeOf(language));
    m_translation = std::make_unique<KvDeskTranslation>(language);
    QVERIFY(m_translation->isLoaded());
    m_desk = std::make_unique<RunningDesk>();
    m_desk->window()->resize(1280, 800);
    QVERIFY(QTest::qWaitForWindowExposed(m_desk->window()));
}

void DeskLanguagesTest::look(QWidget *window, const char *name)
{
    QVERIFY(QTest::qWaitForWindowExposed(window));
    QTRY_VERIFY(hasShownAll(window));
    // Layouts take a few rounds of events after a change.
    const bool isSettled =
        QTest::qWaitFor([window]() { return TextFit::faults(window).isEmpty(); }, kSettlingTime);
    if (isSettled)
        return;
    for (const QString &fault : TextFit::faults(window))
        m_faults.append(QLatin1String(name) + QStringLiteral(": ") + fault);
}

void DeskLanguagesTest::showAllPanels()
{
    using A = KvDeskActions;
    for (const A::Id id : {A::ShowValues, A::ShowGallery, A::ShowLog, A::ShowRulers, A::ShowLabels})
        m_desk->window()->actions()->action(id)->setChecked(true);
}

void DeskLanguagesTest::openSession()
{
    QVERIFY(
        m_desk->window()->files()->openSession(sourcePath(QStringLiteral("examples/sessions/demo.json"))));
    QTRY_VERIFY(m_desk->window()->valueTable()->model()->rowCount() > 0);
}

void DeskLanguagesTest::showLiveImage()
{
    auto camera = std::make_unique<FakeCamera>();
    FakeCamera *const live = camera.get();
    m_desk->document()->setFrameSource(std::move(camera));
    live->start();
    live->deliver();
    QTRY_VERIFY(m_desk->window()->liveBar()->isVisible());
}

void DeskLanguagesTest::openEditor()
{
    m_desk->button("theEditorButton")->click();
    QTRY_VERIFY(m_desk->editor() && m_desk->editor()->isVisible());
}

/// Adds every block of the palette by its key, and looks at its options.
void DeskLanguagesTest::composeAll()
{
    const QList<QWidget *> palette = m_desk->palette();
    QCOMPARE(palette.size(), 8);
    for (QWidget *row : palette) {
        const int before = m_desk->pieces().size();
        row->setFocus();
        QTest::keyClick(row, Qt::Key_Return);
        QTRY_VERIFY(m_desk->pieces().size() > before);
        const QGraphicsProxyWidget *added = m_desk->pieces().at(before);
        m_desk->pages()->centerOn(m_desk->centerOf(added));
        m_user.clickScene(m_desk->pages(), m_desk->centerOf(added));
        QTRY_VERIFY(m_desk->options() && m_desk->options()->isVisible());
        look(m_desk->editor(), m_desk->options()->metaObject()->className());
        if (m_desk->options()->inherits("KvTextDocumentNodeOptionsWidget"))
            lookAtDialogsOfTexts();
    }
}

void DeskLanguagesTest::lookAtDialogsOfTexts()
{
    for (const char *slot : {"slotLinkClicked", "slotGalleryClicked"})
        lookAtModalDialog(slot);
}

/// \a slot of the options runs a dialog, in which this looks and which it closes.
void DeskLanguagesTest::lookAtModalDialog(const char *slot)
{
    bool hasLooked = false;
    QTimer::singleShot(0, this, [this, slot, &hasLooked]() {
        QWidget *dialog = QApplication::activeModalWidget();
        if (!dialog)
            return;
        look(dialog, slot);
        hasLooked = true;
        dialog->close();
    });
    QVERIFY(QMetaObject::invokeMethod(m_desk->options(), slot));
    QVERIFY2(hasLooked, slot);
}

void DeskLanguagesTest::openStatistics()
{
    m_desk->button("theStatisticsButton")->click();
    QTRY_VERIFY(m_desk->statisticsWindow() && m_desk->statisticsWindow()->isVisible());
}

/// The main window: empty, with what it offers after a crash, with measurements, and with a live image.
void DeskLanguagesTest::everyTextHasRoom()
{
    QFETCH(QString, language);
    start(language);
    const QString copies = temporaryPath(QStringLiteral("copies"));
    RecoveryCopies::add(copies, QStringLiteral("a"), 2, 90);
    RecoveryCopies::add(copies, QStringLiteral("b"), 2, 9000);
    m_desk->window()->startRecovery(copies);
    showAllPanels();
    look(m_desk->window(), "empty");
    openSession();
    look(m_desk->window(), "session");
    showLiveImage();
    look(m_desk->window(), "live");
    QVERIFY2(m_faults.isEmpty(), lines(m_faults));
}

void DeskLanguagesTest::everyStatisticsViewHasRoom()
{
    QFETCH(QString, language);
    start(language);
    openSession();
    openStatistics();
    look(m_desk->statisticsWindow(), "no view");
    int views = 0;
    for (auto *button : m_desk->statisticsWindow()->findChildren<QAbstractButton *>()) {
        if (!button->isCheckable() || !button->isVisible())
            continue;
        button->click();
        look(m_desk->statisticsWindow(), qPrintable(button->toolTip()));
        ++views;
    }
    QVERIFY(views >= 4);
    QVERIFY2(m_faults.isEmpty(), lines(m_faults));
}

/// The editor with every block, and the options of each.
void DeskLanguagesTest::everyPanelOfTheEditorHasRoom()
{
    QFETCH(QString, language);
    start(language);
    openSession();
    openEditor();
    m_desk->editor()->resize(1280, 800);
    look(m_desk->editor(), "empty editor");
    composeAll();
    QVERIFY2(m_faults.isEmpty(), lines(m_faults));
}

void DeskLanguagesTest::everyDialogHasRoom()
{
    QFETCH(QString, language);
    start(language);
    openSession();
    KvDeskSettingsDialog settings(m_desk->window());
    settings.show();
    look(&settings, "settings");
    KvDeskExportDialog exporting({}, m_desk->window());
    exporting.show();
    look(&exporting, "export");
    m_desk->window()->actions()->action(KvDeskActions::Calibrate)->trigger();
    auto *const calibration = m_desk->window()->findChild<KvDeskCalibrationDialog *>();
    QVERIFY(calibration);
    for (const auto way : {KvDeskCalibrationDialog::KnownDistance, KvDeskCalibrationDialog::ImageFile,
                           KvDeskCalibrationDialog::Typed}) {
        calibration->wayButton(way)->setEnabled(true);
        calibration->wayButton(way)->click();
        look(calibration, "calibration");
    }
    KvDeskGuideWindow guide(KvDeskGuideCommand::guide());
    guide.show();
    look(&guide, "guide");
    QVERIFY2(m_faults.isEmpty(), lines(m_faults));
}

void DeskLanguagesTest::lettersAreUnique()
{
    QFETCH(QString, language);
    start(language);
    openSession();
    showLiveImage();
    openEditor();
    openStatistics();
    m_desk->window()->actions()->action(KvDeskActions::Calibrate)->trigger();
    QStringList clashes = ShortcutLetters::clashesInMenus(m_desk->window());
    for (QWidget *window : QApplication::topLevelWidgets()) {
        if (window->isVisible())
            clashes += ShortcutLetters::clashesInMenus(window) + ShortcutLetters::clashesInWindow(window);
    }
    clashes.removeDuplicates();
    QVERIFY2(clashes.isEmpty(), lines(clashes));
}

/// The windows are mirrored; the image, the pages of a report and what stands on them are as in every
/// language.
void DeskLanguagesTest::arabicMirrorsTheInterfaceOnly()
{
    start(QStringLiteral("Arabic"));
    openSession();
    openEditor();
    openStatistics();
    m_desk->window()->actions()->action(KvDeskActions::Calibrate)->trigger();
    for (const QWidget *window : QApplication::topLevelWidgets()) {
        if (window->isVisible() && !window->graphicsProxyWidget())
            QVERIFY2(window->layoutDirection() == Qt::RightToLeft, window->metaObject()->className());
    }
    const QPoint toolsAt = m_desk->window()->toolColumn()->mapTo(m_desk->window(), QPoint());
    const QPoint imageAt = m_desk->window()->imageView()->mapTo(m_desk->window(), QPoint());
    QVERIFY(toolsAt.x() > imageAt.x());
    QCOMPARE(m_desk->window()->imageView()->layoutDirection(), Qt::LeftToRight);

    composeAll();
    QCOMPARE(m_desk->pages()->layoutDirection(), Qt::LeftToRight);
    for (const QGraphicsProxyWidget *piece : m_desk->pieces()) {
        QList<QWidget *> parts = piece->widget()->findChildren<QWidget *>();
        parts.prepend(piece->widget());
        for (const QWidget *part : qAsConst(parts))
            QVERIFY2(part->layoutDirection() == Qt::LeftToRight, part->metaObject()->className());
    }
}

/// What is drawn on images is the same whatever the direction of the interface: the name, the value, its
/// unit.
void DeskLanguagesTest::labelsOfObjectsReadAlike()
{
    const auto label = [](Qt::LayoutDirection direction) {
        QGuiApplication::setLayoutDirection(direction);
        QImage image(300, 40, QImage::Format_RGB32);
        image.fill(Qt::gray);
        QPainter painter(&image);
        const QString text = QStringLiteral("\u062E\u0637 1  2.126 mm");
        ZtDrawnObjectPainter(&painter).drawLabelBox(QRectF(10, 5, 280, 30), text);
        return image;
    };
    QCOMPARE(label(Qt::RightToLeft), label(Qt::LeftToRight));
}

STATREPORT_TEST_MAIN(DeskLanguagesTest)
#include "DeskLanguagesTest.moc"
