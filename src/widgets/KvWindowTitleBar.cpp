// SPDX-License-Identifier: MIT
#include "widgets/KvWindowTitleBar.h"

#include "gui/acss.h"
#include "resources/KvReportResources.h"
#include "widgets/KvElidedLabel.h"

#include <QEvent>
#include <QHBoxLayout>
#include <QMouseEvent>
#include <QToolButton>

#include <algorithm>

namespace {
constexpr int kIconMode = 6;
constexpr QSize kCloseIconSize(36, 24);
constexpr int kHeight = 40;
constexpr int kLeftMargin = 16;
constexpr int kRightMargin = 4;
constexpr int kResizeEdge = 3; // pixels at the top
} // namespace

KvWindowTitleBar::KvWindowTitleBar(QWidget *parent)
    : QFrame(parent)
    , m_titleLabel(new KvElidedLabel(this))
{
    KvReportResources::ensure();
    setMinimumHeight(kHeight);
    setMouseTracking(true);
    m_titleLabel->setObjectName(QStringLiteral("titleLabel"));
    m_titleLabel->setProperty("groupTitle", true);
    m_titleLabel->setAttribute(Qt::WA_TransparentForMouseEvents);
    auto *row = new QHBoxLayout(this);
    row->setContentsMargins(kLeftMargin, 0, kRightMargin, 0);
    row->addWidget(m_titleLabel, 1);
    addCloseButton();
    retranslate();
}

void KvWindowTitleBar::addCloseButton()
{
    m_closeButton = new QToolButton(this);
    m_closeButton->setObjectName(QStringLiteral("closeButton"));
    m_closeButton->setAutoRaise(true);
    m_closeButton->setIconSize(kCloseIconSize);
    m_closeButton->setIcon(
        acss::createIcon(kIconMode, QStringLiteral("Icons/titlebar-close"), kCloseIconSize));
    m_closeButton->setCursor(Qt::ArrowCursor);
    layout()->addWidget(m_closeButton);
    setFocusProxy(m_closeButton);
    connect(m_closeButton, SIGNAL(clicked(bool)), this, SIGNAL(closeClicked()));
}

void KvWindowTitleBar::retranslate()
{
    m_closeButton->setToolTip(tr("Close"));
    m_closeButton->setAccessibleName(tr("Close"));
}

QString KvWindowTitleBar::title() const
{
    return m_titleLabel->text();
}

void KvWindowTitleBar::setTitle(const QString &title)
{
    m_titleLabel->setText(title);
}

void KvWindowTitleBar::mousePressEvent(QMouseEvent *event)
{
    if (event->button() != Qt::LeftButton)
        return;
    m_gesture = event->pos().y() < kResizeEdge ? Gesture::Resize : Gesture::Move;
    m_pressPosition = event->globalPos();
    m_startGeometry = window()->geometry();
}

void KvWindowTitleBar::mouseMoveEvent(QMouseEvent *event)
{
    const QPoint delta = event->globalPos() - m_pressPosition;
    if (m_gesture == Gesture::None)
        updateCursor(event->pos());
    else if (m_gesture == Gesture::Move)
        window()->move(m_startGeometry.topLeft() + delta);
    else
        resizeWindow(delta.y());
}

void KvWindowTitleBar::mouseReleaseEvent(QMouseEvent *event)
{
    if (event->button() != Qt::LeftButton)
        return;
    m_gesture = Gesture::None;
    updateCursor(event->pos());
}

void KvWindowTitleBar::updateCursor(const QPoint &position)
{
    if (position.y() < kResizeEdge)
        setCursor(Qt::SizeVerCursor);
    else
        unsetCursor();
}

void KvWindowTitleBar::resizeWindow(int deltaY)
{
    // From the geometry at the press: the lower edge stays where it is, also after the limit was met.
    QRect geometry = m_startGeometry;
    geometry.setTop(std::min(geometry.top() + deltaY, geometry.bottom() + 1 - window()->minimumHeight()));
    window()->setGeometry(geometry);
}

void KvWindowTitleBar::changeEvent(QEvent *event)
{
    QFrame::changeEvent(event);
    if (event->type() == QEvent::LanguageChange)
        retranslate();
}
