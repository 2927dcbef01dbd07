// SPDX-License-Identifier: MIT
#include "KvDeskFieldKeys.h"

#include "KvDeskActions.h"
#include "support/StatReportTest.h"

#include <QAction>
#include <QDialog>
#include <QDoubleSpinBox>
#include <QKeyEvent>
#include <QLineEdit>
#include <QVBoxLayout>

namespace {

/** A field of a system that takes every key with Ctrl for editing. */
class GreedyField : public QLineEdit
{
public:
    using QLineEdit::QLineEdit;

protected:
    bool event(QEvent *event) override
    {
        if (event->type() != QEvent::ShortcutOverride)
            return QLineEdit::event(event);
        event->accept();
        return true;
    }
};

} // namespace

class KvDeskFieldKeysTest : public StatReportTest
{
    Q_OBJECT
private slots:
    void init();
    void cleanup();

    void shortcutsWorkInFields_data();
    void shortcutsWorkInFields();
    void lettersAreTyped();
    void numbersAreFieldsToo();
    void dialogsKeepTheirKeys();

private:
    bool isClaimed(QWidget *field, int key, Qt::KeyboardModifiers modifiers) const;

    std::unique_ptr<QWidget> m_window;
    std::unique_ptr<KvDeskActions> m_actions;
    GreedyField *m_field = nullptr;
};

void KvDeskFieldKeysTest::init()
{
    StatReportTest::init();
    m_window = std::make_unique<QWidget>();
    m_actions = std::make_unique<KvDeskActions>();
    auto *const layout = new QVBoxLayout(m_window.get());
    m_field = new GreedyField(m_window.get());
    layout->addWidget(m_field);
    new KvDeskFieldKeys(m_actions.get(), m_window.get());
    for (int id = 0; id < KvDeskActions::Count; ++id)
        m_window->addAction(m_actions->action(static_cast<KvDeskActions::Id>(id)));
    m_window->show();
    m_window->activateWindow();
    m_field->setFocus();
    QVERIFY(QTest::qWaitForWindowActive(m_window.get()));
}

void KvDeskFieldKeysTest::cleanup()
{
    m_window.reset();
    m_actions.reset();
    StatReportTest::cleanup();
}

bool KvDeskFieldKeysTest::isClaimed(QWidget *field, int key, Qt::KeyboardModifiers modifiers) const
{
    QKeyEvent event(QEvent::ShortcutOverride, key, modifiers);
    event.ignore();
    QApplication::sendEvent(field, &event);
    return event.isAccepted();
}

void KvDeskFieldKeysTest::shortcutsWorkInFields_data()
{
    QTest::addColumn<int>("id");
    QTest::addColumn<int>("key");
    QTest::addColumn<int>("modifiers");
    QTest::addColumn<bool>("isShortcut");
    const int control = Qt::ControlModifier;
    QTest::newRow("export") << int(KvDeskActions::ExportTable) << int(Qt::Key_E) << control << true;
    QTest::newRow("calibration") << int(KvDeskActions::Calibrate) << int(Qt::Key_K) << control << true;
    QTest::newRow("zoom") << int(KvDeskActions::ZoomFit) << int(Qt::Key_0) << control << true;
    QTest::newRow("save as") << int(KvDeskActions::SaveSessionAs) << int(Qt::Key_S)
                             << int(Qt::ControlModifier | Qt::ShiftModifier) << true;
    QTest::newRow("undo") << int(KvDeskActions::Undo) << int(Qt::Key_Z) << control << false;
    QTest::newRow("redo") << int(KvDeskActions::Redo) << int(Qt::Key_Z)
                          << int(Qt::ControlModifier | Qt::ShiftModifier) << false;
    QTest::newRow("copy") << int(KvDeskActions::Copy) << int(Qt::Key_C) << control << false;
    QTest::newRow("all") << int(KvDeskActions::SelectAll) << int(Qt::Key_A) << control << false;
}

void KvDeskFieldKeysTest::shortcutsWorkInFields()
{
    QFETCH(int, id);
    QFETCH(int, key);
    QFETCH(int, modifiers);
    QFETCH(bool, isShortcut);
    QAction *const action = m_actions->action(static_cast<KvDeskActions::Id>(id));
    action->setEnabled(true);
    QSignalSpy triggered(action, SIGNAL(triggered()));
    QTest::keyClick(m_field, static_cast<Qt::Key>(key), Qt::KeyboardModifiers(modifiers));
    QCOMPARE(triggered.count(), isShortcut ? 1 : 0);
    QCOMPARE(isClaimed(m_field, key, Qt::KeyboardModifiers(modifiers)), !isShortcut);
}

void KvDeskFieldKeysTest::lettersAreTyped()
{
    m_actions->action(KvDeskActions::LineTool)->setShortcutContext(Qt::WidgetWithChildrenShortcut);
    QTest::sendKeyEvent(QTest::Click, m_field, Qt::Key_B, QStringLiteral("B"), Qt::ShiftModifier);
    QTest::keyClicks(m_field, QStringLiteral("lv"));
    QCOMPARE(m_field->text(), QStringLiteral("Blv"));
    // A key that is no shortcut stays the field's.
    QVERIFY(isClaimed(m_field, Qt::Key_U, Qt::ControlModifier));
}

void KvDeskFieldKeysTest::numbersAreFieldsToo()
{
    auto *const number = new QDoubleSpinBox(m_window.get());
    number->show();
    number->setFocus();
    QSignalSpy triggered(m_actions->action(KvDeskActions::ExportTable), SIGNAL(triggered()));
    QTest::keyClick(number, Qt::Key_E, Qt::ControlModifier);
    QCOMPARE(triggered.count(), 1);
}

// The window's shortcuts do nothing there.
void KvDeskFieldKeysTest::dialogsKeepTheirKeys()
{
    QDialog dialog(m_window.get());
    GreedyField field(&dialog);
    QVERIFY(isClaimed(&field, Qt::Key_E, Qt::ControlModifier));
}

STATREPORT_TEST_MAIN(KvDeskFieldKeysTest)
#include "KvDeskFieldKeysTest.moc"
