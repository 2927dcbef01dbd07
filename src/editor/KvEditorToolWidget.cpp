// SPDX-License-Identifier: MIT
#include "editor/KvEditorToolWidget.h"

#include "gui/acss.h"
#include "templates/KvBaseEditorNodeFactory.h"

#include <QApplication>
#include <QDrag>
#include <QHBoxLayout>
#include <QLabel>
#include <QMimeData>
#include <QMouseEvent>

namespace {
constexpr int kIconExtent = 24;
constexpr int kIconMode = 6;
constexpr int kMargin = 4;
constexpr int kSpacing = 8;
} // namespace

KvEditorToolWidget::KvEditorToolWidget(KvBaseEditorNodeFactory *factory, QWidget *parent)
    : QFrame(parent)
    , m_factory(factory)
    , m_iconLabel(new QLabel(this))
    , m_nameLabel(new QLabel(this))
{
    auto *dotsLabel = new QLabel(this);
    const QSize dotsSize(kIconExtent, kIconExtent);
    dotsLabel->setPixmap(acss::createPixmap(kIconMode, QStringLiteral("Icons/ToolIconDots.svg"), dotsSize));
    auto *row = new QHBoxLayout(this);
    row->setContentsMargins(kMargin, kMargin, kMargin, kMargin);
    row->setSpacing(kSpacing);
    row->addWidget(m_iconLabel);
    row->addWidget(m_nameLabel, 1);
    row->addWidget(dotsLabel);
}

QString KvEditorToolWidget::text() const
{
    return m_nameLabel->text();
}

void KvEditorToolWidget::setText(const QString &text)
{
    m_nameLabel->setText(text);
    setAccessibleName(text);
}

void KvEditorToolWidget::setIcon(const QIcon &icon)
{
    m_iconLabel->setPixmap(icon.pixmap(kIconExtent, kIconExtent));
}

void KvEditorToolWidget::mousePressEvent(QMouseEvent *event)
{
    m_isPressed = event->button() == Qt::LeftButton;
    m_pressPosition = event->pos();
}

void KvEditorToolWidget::mouseMoveEvent(QMouseEvent *event)
{
    if (!m_isPressed ||
        (event->pos() - m_pressPosition).manhattanLength() < QApplication::startDragDistance())
        return;
    m_isPressed = false;
    startDrag();
}

void KvEditorToolWidget::startDrag()
{
    auto *drag = new QDrag(this);
    drag->setMimeData(m_factory->mimeData());
    drag->setPixmap(m_factory->dragPixmap());
    drag->setHotSpot(m_pressPosition);
    drag->exec(Qt::CopyAction);
}
