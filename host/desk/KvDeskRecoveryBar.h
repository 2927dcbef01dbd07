// SPDX-License-Identifier: MIT
#pragma once

#include <QFrame>

class KvDeskElidedLabel;
class KvDeskRecovery;
class QBoxLayout;
class QHBoxLayout;
class QLabel;
class QMenu;
class QPushButton;
class QToolButton;

/** Offers the newest copy of unsaved work, and the others in a menu, until the user has decided about all. */
class KvDeskRecoveryBar : public QFrame
{
    Q_OBJECT
public:
    /** \a recovery has to outlive the bar. */
    explicit KvDeskRecoveryBar(KvDeskRecovery *recovery, QWidget *parent = nullptr);

    QString text() const;
    QPushButton *restoreButton() const { return m_restore; }
    QPushButton *discardButton() const { return m_discard; }
    /** Lists all copies; hidden when there is one only. */
    QToolButton *othersButton() const { return m_others; }

    QSize minimumSizeHint() const override; ///< with the buttons below the text

protected:
    void resizeEvent(QResizeEvent *event) override;

private slots:
    void slotUpdate();
    void slotRestore();
    void slotDiscard();
    void slotChosen(QAction *aAction);

private:
    void createWidgets();
    void placeButtons();
    void showCurrent();
    QString timeText(int index) const;

    KvDeskRecovery *m_recovery;
    QBoxLayout *m_layout = nullptr;
    QHBoxLayout *m_buttons = nullptr;
    QLabel *m_text = nullptr;
    KvDeskElidedLabel *m_session = nullptr;
    QToolButton *m_others = nullptr;
    QMenu *m_menu = nullptr;
    QPushButton *m_restore = nullptr;
    QPushButton *m_discard = nullptr;
    int m_current = 0;
};
