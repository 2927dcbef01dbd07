// SPDX-License-Identifier: MIT
#include "KvDeskRecoveryBar.h"

#include "KvDeskElidedLabel.h"
#include "KvDeskRecovery.h"
#include "kernel/ZtLeftToRight.h"

#include <QAction>
#include <QHBoxLayout>
#include <QLabel>
#include <QLocale>
#include <QMenu>
#include <QPushButton>
#include <QToolButton>
#include <QVariant>

namespace {

constexpr int margin = 8;
constexpr int leastTextWidth = 320; ///< beside the buttons; with less, these go below the text

} // namespace

KvDeskRecoveryBar::KvDeskRecoveryBar(KvDeskRecovery *recovery, QWidget *parent)
    : QFrame(parent)
    , m_recovery(recovery)
{
    setObjectName(QStringLiteral("DeskRecoveryBar"));
    setProperty("panel", true);
    setAutoFillBackground(true);
    createWidgets();
    connect(recovery, SIGNAL(signalChanged()), this, SLOT(slotUpdate()));
    connect(m_restore, SIGNAL(clicked()), this, SLOT(slotRestore()));
    connect(m_discard, SIGNAL(clicked()), this, SLOT(slotDiscard()));
    connect(m_menu, SIGNAL(triggered(QAction*)), this, SLOT(slotChosen(QAction*)));
    slotUpdate();
}

void KvDeskRecoveryBar::createWidgets()
{
    m_text = new QLabel(this);
    m_text->setWordWrap(true);
    m_session = new KvDeskElidedLabel(this);
    m_session->setProperty("caption", true);
    m_menu = new QMenu(this);
    m_others = new QToolButton(this);
    m_others->setMenu(m_menu);
    m_others->setPopupMode(QToolButton::InstantPopup);
    m_others->setToolButtonStyle(Qt::ToolButtonTextOnly);
    m_others->setToolTip(tr("Show other measurements that were not saved"));
    m_restore = new QPushButton(tr("Restore"), this);
    m_restore->setToolTip(tr("Open these measurements as a session with unsaved changes"));
    m_discard = new QPushButton(tr("Discard"), this);
    m_discard->setToolTip(tr("Delete these measurements for good"));
    auto *const texts = new QHBoxLayout;
    texts->setSpacing(margin);
    texts->addWidget(m_text, 1);
    texts->addWidget(m_session);
    texts->addWidget(m_others);
    m_buttons = new QHBoxLayout;
    m_buttons->setSpacing(margin);
    m_buttons->addStretch();
    m_buttons->addWidget(m_restore);
    m_buttons->addWidget(m_discard);
    m_layout = new QBoxLayout(QBoxLayout::LeftToRight, this);
    m_layout->setContentsMargins(2 * margin, margin, margin, margin);
    m_layout->setSpacing(margin);
    m_layout->addLayout(texts, 1);
    m_layout->addLayout(m_buttons);
}

// Of the buttons below the text.
QSize KvDeskRecoveryBar::minimumSizeHint() const
{
    return QSize(m_buttons->minimumSize().width() + 3 * margin, QFrame::minimumSizeHint().height());
}

void KvDeskRecoveryBar::resizeEvent(QResizeEvent *event)
{
    QFrame::resizeEvent(event);
    placeButtons();
}

void KvDeskRecoveryBar::placeButtons()
{
    const int besideButtons = width() - m_buttons->minimumSize().width() - 4 * margin;
    const bool isNarrow = besideButtons < leastTextWidth;
    m_layout->setDirection(isNarrow ? QBoxLayout::TopToBottom : QBoxLayout::LeftToRight);
    // The menu of the others names it, too.
    m_session->setVisible(!isNarrow);
    updateGeometry();
}

QString KvDeskRecoveryBar::text() const
{
    return m_text->text();
}

QString KvDeskRecoveryBar::timeText(int index) const
{
    const QDateTime time = m_recovery->at(index).time.toLocalTime();
    const bool isToday = time.date() == QDate::currentDate();
    return isToday ? QLocale().toString(time.time(), QLocale::ShortFormat)
                   : QLocale().toString(time, QLocale::ShortFormat);
}

void KvDeskRecoveryBar::slotUpdate()
{
    m_current = 0;
    m_menu->clear();
    for (int i = 0; i < m_recovery->count(); ++i) {
        //: %1 is a time, %2 a session
        const QString text = tr("%1: %2").arg(timeText(i), m_recovery->describe(i));
        // An ampersand would underline the letter after it.
        m_menu->addAction(QString(text).replace(QLatin1Char('&'), QLatin1String("&&")))->setData(i);
    }
    m_others->setVisible(m_recovery->count() > 1);
    m_others->setText(tr("%n more", "measurements that were not saved", m_recovery->count() - 1));
    setVisible(m_recovery->count() > 0);
    showCurrent();
    placeButtons();
}

void KvDeskRecoveryBar::showCurrent()
{
    if (m_current >= m_recovery->count())
        return;
    m_text->setText(tr("Measurements from %1 were not saved.").arg(timeText(m_current)));
    m_session->setText(m_recovery->describe(m_current));
    m_session->setToolTip(ZtLeftToRight::isolated(m_recovery->at(m_current).sessionPath));
}

void KvDeskRecoveryBar::slotChosen(QAction *aAction)
{
    m_current = aAction->data().toInt();
    showCurrent();
}

void KvDeskRecoveryBar::slotRestore()
{
    m_recovery->restore(m_current);
}

void KvDeskRecoveryBar::slotDiscard()
{
    m_recovery->discard(m_current);
}
