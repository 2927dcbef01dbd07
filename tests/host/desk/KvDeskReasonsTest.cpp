// SPDX-License-Identifier: MIT
#include "DeskFiles.h"
#include "KvDeskActions.h"
#include "KvDeskCalibrationDialog.h"
#include "KvDeskExportDialog.h"
#include "KvDeskFileCommands.h"
#include "KvDeskImageView.h"
#include "KvDeskMainWindow.h"
#include "KvDeskSelection.h"
#include "KvDeskSettingsDialog.h"
#include "KvDeskSourceCommands.h"
#include "KvDeskTheme.h"
#include "kernel/ZtAppSettings.h"
#include "measuring/ZtDrawnType.h"
#include "measuring/ZtFrameSourceCatalogue.h"
#include "measuring/ZtMeasuringDocument.h"

#include <QAction>
#include <QDir>
#include <QMenu>
#include <QTimer>

/** Whatever cannot be used says why, whatever is open. */
class KvDeskReasonsTest : public StatReportTest
{
    Q_OBJECT

private slots:
    void init();
    void cleanup();

    void everyState_data();
    void everyState();

private:
    enum State { Nothing, ImageOnly, NothingSelected, OneSelected, Live };

    void enter(State state);
    void look(QWidget *window);
    void lookAt(const QAction *action);
    void lookAt(const QWidget *widget);
    void lookAtDialogs();

    std::unique_ptr<ZtMeasuringDocument> m_document;
    std::unique_ptr<KvDeskMainWindow> m_window;
    QStringList m_silent; ///< what cannot be used and says nothing
    int m_disabled = 0;
};

namespace {

// What a tool tip says beyond the name of the thing.
bool saysMore(const QString &toolTip, QString name)
{
    name.remove(QLatin1Char('&'));
    name.remove(QStringLiteral("..."));
    return !toolTip.isEmpty() && toolTip != name && toolTip != QStringLiteral("%1.").arg(name);
}

} // namespace

void KvDeskReasonsTest::init()
{
    StatReportTest::init();
    ZtAppSettings::getInstance()->setStoragePath(QString());
    m_silent.clear();
    m_disabled = 0;
    m_document = std::make_unique<ZtMeasuringDocument>();
    m_window = std::make_unique<KvDeskMainWindow>(m_document.get());
    m_window->show();
    for (const KvDeskActions::Id id : {KvDeskActions::ShowGallery, KvDeskActions::ShowLog})
        m_window->actions()->action(id)->setChecked(true);
}

void KvDeskReasonsTest::cleanup()
{
    m_window.reset();
    m_document.reset();
    StatReportTest::cleanup();
}

void KvDeskReasonsTest::everyState_data()
{
    QTest::addColumn<int>("state");
    QTest::newRow("nothing open") << int(Nothing);
    QTest::newRow("an image only") << int(ImageOnly);
    QTest::newRow("nothing selected") << int(NothingSelected);
    QTest::newRow("an object selected") << int(OneSelected);
    QTest::newRow("live") << int(Live);
}

void KvDeskReasonsTest::enter(State state)
{
    KvDeskMainWindow &window = *m_window;
    if (state == ImageOnly)
        QVERIFY(window.files()->openImage(DeskFiles::image(QStringLiteral("image.png"))));
    if (state == NothingSelected || state == OneSelected)
        QVERIFY(window.files()->openSession(DeskFiles::demoSession()));
    if (state == OneSelected)
        window.selection()->select({ZtDrawnType::Line, 1});
    if (state == Live) {
        const QString folder = temporaryPath(QStringLiteral("frames"));
        QVERIFY(QDir().mkpath(folder));
        DeskFiles::image(QStringLiteral("frames/1.png"));
        QVERIFY(window.sources()->open(ZtFrameSourceCatalogue::infoOfPath(folder)));
    }
    QTRY_COMPARE(!window.imageView()->isAnythingOpen(), state == Nothing);
    QTRY_COMPARE(window.actions()->action(KvDeskActions::ExportTable)->isEnabled(),
                 state == NothingSelected || state == OneSelected);
}

void KvDeskReasonsTest::lookAt(const QAction *action)
{
    if (action->isEnabled() || action->isSeparator() || action->text().isEmpty())
        return;
    ++m_disabled;
    // An entry that stands for none, such as "None yet", is a reason itself.
    const QStringList remarks{QStringLiteral("None yet"), QStringLiteral("Looking for cameras..."),
                              QStringLiteral("No camera is connected")};
    if (!remarks.contains(action->text()) && !saysMore(action->toolTip(), action->text()))
        m_silent.append(QStringLiteral("action ") + action->text());
}

void KvDeskReasonsTest::lookAt(const QWidget *widget)
{
    if (widget->isEnabled() || !widget->testAttribute(Qt::WA_ForceDisabled) || widget->isHidden())
        return;
    ++m_disabled;
    const auto *const button = qobject_cast<const QAbstractButton *>(widget);
    if (!saysMore(widget->toolTip(), button ? button->text() : QString()))
        m_silent.append(QStringLiteral("%1 %2").arg(QLatin1String(widget->metaObject()->className()),
                                                    button ? button->text() : widget->accessibleName()));
}

void KvDeskReasonsTest::look(QWidget *window)
{
    for (const QMenu *const menu : window->findChildren<QMenu *>())
        emit const_cast<QMenu *>(menu)->aboutToShow();
    for (const QAction *const action : window->findChildren<QAction *>())
        lookAt(action);
    for (const QWidget *const widget : window->findChildren<QWidget *>()) {
        const bool isControl = widget->inherits("QAbstractButton") || widget->inherits("QLineEdit") ||
                               widget->inherits("QComboBox") || widget->inherits("QAbstractSpinBox") ||
                               widget->inherits("QAbstractSlider");
        // Parts of scroll bars and the like belong to Qt.
        if (isControl && !widget->inherits("QScrollBar"))
            lookAt(widget);
    }
}

void KvDeskReasonsTest::lookAtDialogs()
{
    KvDeskSettingsDialog settings;
    settings.show();
    look(&settings);
    KvDeskExportDialog table({});
    table.show();
    look(&table);
    m_window->actions()->action(KvDeskActions::Calibrate)->trigger();
    for (QWidget *const widget : QApplication::topLevelWidgets()) {
        if (widget->inherits("KvDeskCalibrationDialog")) {
            look(widget);
            widget->close();
        }
    }
}

void KvDeskReasonsTest::everyState()
{
    QFETCH(int, state);
    enter(static_cast<State>(state));
    look(m_window.get());
    lookAtDialogs();
    QVERIFY2(m_silent.isEmpty(), qPrintable(m_silent.join(QLatin1Char('\n'))));
    QVERIFY(m_disabled >= 3);
}

STATREPORT_TEST_MAIN(KvDeskReasonsTest)
#include "KvDeskReasonsTest.moc"
