// SPDX-License-Identifier: MIT
#include "KvDeskNotice.h"

#include "KvDeskElidedLabel.h"
#include "gui/acss.h"

#include <QAccessible>
#include <QAction>
#include <QEvent>
#include <QHBoxLayout>
#include <QLabel>
#include <QPushButton>
#include <QToolButton>

namespace {

constexpr int toolIconStyle = 6;
constexpr int spacing = 8;
constexpr QSize iconSize(20, 20);
constexpr QSize buttonSize(28, 28);

} // namespace

KvDeskNotice::KvDeskNotice(QAction *action, QWidget *parent)
    : QFrame(parent)
    , m_icon(new QLabel(this))
    , m_text(new KvDeskElidedLabel(this))
    , m_button(new QPushButton(action->text(), this))
    , m_close(new QToolButton(this))
{
    setProperty("panel", true);
    setAutoFillBackground(true);
    setCursor(Qt::ArrowCursor);
    // Clicks beside the button are not meant for what lies below.
    setAttribute(Qt::WA_NoMousePropagation);
    m_button->setAutoDefault(false);
    m_button->setToolTip(action->toolTip());
    m_close->setAutoRaise(true);
    m_close->setIcon(acss::createIcon(toolIconStyle, QStringLiteral("Icons/close-panel"), iconSize));
    m_close->setIconSize(iconSize);
    m_close->setFixedSize(buttonSize);
    m_close->setToolTip(tr("Close this message"));
    m_close->setAccessibleName(m_close->toolTip());
    auto *const layout = new QHBoxLayout(this);
    layout->setContentsMargins(spacing, 4, spacing, 4);
    layout->setSpacing(spacing);
    layout->addWidget(m_icon);
    layout->addWidget(m_text, 1);
    layout->addWidget(m_button);
    layout->addWidget(m_close);
    connect(m_button, SIGNAL(clicked()), action, SLOT(trigger()));
    connect(m_close, SIGNAL(clicked()), this, SLOT(slotHide()));
    parent->installEventFilter(this);
    hide();
}

QString KvDeskNotice::text() const
{
    return m_text->text();
}

void KvDeskNotice::place()
{
    setGeometry(0, 0, parentWidget()->width(), sizeHint().height());
}

void KvDeskNotice::slotShow(const QString &aText)
{
    const QIcon icon = acss::createIcon(toolIconStyle, QStringLiteral("Icons/status-info"), iconSize);
    m_icon->setPixmap(icon.pixmap(window()->windowHandle(), iconSize));
    m_text->setText(aText);
    setAccessibleName(aText);
    place();
    show();
    raise();
    QAccessibleEvent event(this, QAccessible::Alert);
    QAccessible::updateAccessibility(&event);
}

void KvDeskNotice::slotHide()
{
    hide();
}

bool KvDeskNotice::eventFilter(QObject *watched, QEvent *event)
{
    if (watched == parent() && event->type() == QEvent::Resize)
        place();
    return QFrame::eventFilter(watched, event);
}
