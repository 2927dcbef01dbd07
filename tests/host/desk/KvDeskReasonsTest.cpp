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

#include <algorithm>

/** Whatever cannot be used says why, whatever is open. */
class KvDeskReasonsTest : public StatReportTest
{
    Q_OBJECT

private slots:
    void init();
    void cleanup();

    void everyState_data();
    void everyState();
    void reasonsComeAndGo();

private:
    enum State { Nothing, ImageOnly, NothingSelected, OneSelected, Live };

    void enter(State state);
    void look(QWidget *window);
    void lookAt(const QAction *action);
    void lookAt(const QWidget *widget);
    void lookAtDialogs();
    void lookAtCommands();
    void note(const QString &what, bool isEnabled, const QString &toolTip, const QString &name);

    std::unique_ptr<ZtMeasuringDocument> m_document;
    std::unique_ptr<KvDeskMainWindow> m_window;
    QStringList m_silent; ///< what cannot be used and says nothing
    int m_disabled = 0;
    QMap<QString, QString> m_enabledTips; ///< of all states so far
    QMap<QString, QString> m_disabledTips;
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

void KvDeskReasonsTest::note(const QString &what, bool isEnabled, const QString &toolTip, const QString &name)
{
    (isEnabled ? m_enabledTips : m_disabledTips).insert(what, toolTip);
    if (isEnabled)
        return;
    ++m_disabled;
    if (!saysMore(toolTip, name))
        m_silent.append(what);
}

void KvDeskReasonsTest::lookAt(const QAction *action)
{
    // An entry that stands for none is a reason itself.
    const QStringList remarks{QStringLiteral("None yet"), QStringLiteral("Looking for cameras..."),
                              QStringLiteral("No camera is connected")};
    if (!action->isSeparator() && !action->text().isEmpty() && !remarks.contains(action->text()))
        note(QStringLiteral("action ") + action->text(), action->isEnabled(), action->toolTip(),
             action->text());
}

void KvDeskReasonsTest::lookAt(const QWidget *widget)
{
    if (widget->isHidden() || (!widget->isEnabled() && !widget->testAttribute(Qt::WA_ForceDisabled)))
        return;
    const auto *const button = qobject_cast<const QAbstractButton *>(widget);
    const QString name = button ? button->text() : widget->accessibleName();
    const QString owner = QLatin1String(widget->parentWidget()->metaObject()->className());
    note(owner + QLatin1Char('/') + QLatin1String(widget->metaObject()->className()) + QLatin1Char(' ') +
             name,
         widget->isEnabled(), widget->toolTip(), button ? name : QString());
}

// The command of the program knows what it says while it is possible.
void KvDeskReasonsTest::lookAtCommands()
{
    const KvDeskActions *const actions = m_window->actions();
    for (int i = 0; i < KvDeskActions::Count; ++i) {
        const auto id = static_cast<KvDeskActions::Id>(i);
        if (!actions->action(id)->isEnabled() && actions->action(id)->toolTip() == actions->toolTip(id))
            m_silent.append(actions->toolTip(id));
    }
}

void KvDeskReasonsTest::look(QWidget *window)
{
    for (const QMenu *const menu : window->findChildren<QMenu *>())
        emit const_cast<QMenu *>(menu)->aboutToShow();
    for (const QMenu *const menu : window->findChildren<QMenu *>()) {
        const QList<QAction *> actions = menu->actions();
        const bool hasDisabled = std::any_of(actions.begin(), actions.end(), [](const QAction *action) {
            return !action->isEnabled() && !action->isSeparator();
        });
        if (hasDisabled && !menu->toolTipsVisible() && !menu->title().isEmpty())
            m_silent.append(QStringLiteral("menu ") + menu->title());
    }
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
    lookAtCommands();
    QVERIFY2(m_silent.isEmpty(), qPrintable(m_silent.join(QLatin1Char('\n'))));
    QVERIFY(m_disabled >= 3);
}

// What was possible in one state and was not in another said so.
void KvDeskReasonsTest::reasonsComeAndGo()
{
    int compared = 0;
    for (auto it = m_disabledTips.cbegin(); it != m_disabledTips.cend(); ++it) {
        if (!m_enabledTips.contains(it.key()))
            continue;
        ++compared;
        QVERIFY2(it.value() != m_enabledTips.value(it.key()), qPrintable(it.key()));
    }
    QVERIFY(compared >= 10);
}

STATREPORT_TEST_MAIN(KvDeskReasonsTest)
#include "KvDeskReasonsTest.moc"
