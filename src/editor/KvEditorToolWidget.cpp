// SPDX-License-Identifier: MIT
#include "editor/KvEditorToolWidget.h"

#include "templates/KvBaseEditorNodeFactory.h"

#include <QApplication>
#include <QDrag>
#include <QMimeData>
#include <QMouseEvent>

namespace {
constexpr QSize kDotsSize(24, 24);
}

KvEditorToolWidget::KvEditorToolWidget(KvBaseEditorNodeFactory *factory, QWidget *parent)
    : KvEditorPaletteRow(parent)
    , m_factory(factory)
{
    setCursor(Qt::OpenHandCursor);
    setMark(QStringLiteral("Icons/ToolIconDots.svg"), kDotsSize);
    retranslate();
}

void KvEditorToolWidget::retranslate()
{
    setToolTip(tr("Drag onto the page, or press Enter to append"));
}

void KvEditorToolWidget::activate()
{
    KvEditorPaletteRow::activate();
    emit signalToolActivated(m_factory->name());
}

void KvEditorToolWidget::mousePressEvent(QMouseEvent *event)
{
    m_isPressed = event->button() == Qt::LeftButton;
    m_pressPosition = event->pos();
}

void KvEditorToolWidget::mouseMoveEvent(QMouseEvent *event)
{
    // A release may have gone elsewhere, as to a popup.
    m_isPressed = m_isPressed && (event->buttons() & Qt::LeftButton);
    if (!m_isPressed ||
        (event->pos() - m_pressPosition).manhattanLength() < QApplication::startDragDistance())
        return;
    m_isPressed = false;
    startDrag();
}

void KvEditorToolWidget::mouseReleaseEvent(QMouseEvent *event)
{
    Q_UNUSED(event)
    m_isPressed = false;
}

void KvEditorToolWidget::mouseDoubleClickEvent(QMouseEvent *event)
{
    if (event->button() == Qt::LeftButton)
        activate();
}

void KvEditorToolWidget::startDrag()
{
    auto *drag = new QDrag(this);
    drag->setMimeData(m_factory->mimeData());
    drag->setPixmap(m_factory->dragPixmap());
    drag->setHotSpot(m_pressPosition);
    runDrag(drag);
}

void KvEditorToolWidget::runDrag(QDrag *drag)
{
    drag->exec(Qt::CopyAction);
}

void KvEditorToolWidget::changeEvent(QEvent *event)
{
    KvEditorPaletteRow::changeEvent(event);
    if (event->type() == QEvent::LanguageChange)
        retranslate();
}
