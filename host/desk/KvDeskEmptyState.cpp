// SPDX-License-Identifier: MIT
#include "KvDeskEmptyState.h"

#include "KvDeskActionButton.h"
#include "gui/QtAdvancedStylesheet.h"

#include <QAction>
#include <QEvent>
#include <QHBoxLayout>
#include <QLabel>
#include <QPaintEvent>
#include <QPainter>
#include <QScrollArea>
#include <QVBoxLayout>

namespace {

constexpr int groupSpacing = 16;
constexpr int pageMargin = 24;

} // namespace

KvDeskEmptyState::KvDeskEmptyState(const QString &text, QWidget *parent)
    : QWidget(parent)
    , m_label(new QLabel(text, this))
{
    m_label->setProperty("emptyState", true);
    m_label->setAlignment(Qt::AlignCenter);
    m_label->setWordWrap(true);

    m_buttons = new QHBoxLayout;
    m_buttons->setSpacing(8);
    m_buttons->addStretch();
    m_buttons->addStretch();

    auto *const layout = new QVBoxLayout(this);
    layout->setContentsMargins(pageMargin, pageMargin, pageMargin, pageMargin);
    layout->setSpacing(groupSpacing);
    layout->addStretch();
    layout->addWidget(m_label);
    layout->addLayout(m_buttons);
    layout->addStretch();

    setGeometry(parent->rect());
    parent->installEventFilter(this);
}

void KvDeskEmptyState::setText(const QString &text)
{
    m_label->setText(text);
}

QString KvDeskEmptyState::text() const
{
    return m_label->text();
}

void KvDeskEmptyState::addAction(QAction *action, bool isPrimary)
{
    auto *const button = new KvDeskActionButton(action, this);
    button->setDefault(isPrimary);
    m_buttons->insertWidget(m_buttons->count() - 1, button);
}

void KvDeskEmptyState::setContent(QWidget *content)
{
    m_label->hide();
    m_scrollArea = new QScrollArea(this);
    m_scrollArea->setFrameShape(QFrame::NoFrame);
    m_scrollArea->setWidgetResizable(true);
    m_scrollArea->setAlignment(Qt::AlignHCenter);
    m_scrollArea->setFocusPolicy(Qt::NoFocus);
    m_scrollArea->setWidget(content);
    m_scrollArea->viewport()->setAutoFillBackground(false);
    content->setAutoFillBackground(false);
    setFocusProxy(content);
    m_scrollArea->setGeometry(rect());
    // What is hidden below it is not meant.
    setAttribute(Qt::WA_NoMousePropagation);
}

bool KvDeskEmptyState::eventFilter(QObject *watched, QEvent *event)
{
    if (watched == parent() && event->type() == QEvent::Resize)
        setGeometry(parentWidget()->rect());
    return QWidget::eventFilter(watched, event);
}

// What lies below a page need not be empty.
void KvDeskEmptyState::paintEvent(QPaintEvent *event)
{
    if (hasContent())
        QPainter(this).fillRect(event->rect(),
                                acss::QtAdvancedStylesheet::getInstance()->color(QStringLiteral("window")));
}

void KvDeskEmptyState::resizeEvent(QResizeEvent *event)
{
    QWidget::resizeEvent(event);
    if (m_scrollArea)
        m_scrollArea->setGeometry(rect());
}
