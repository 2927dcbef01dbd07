// SPDX-License-Identifier: MIT
#include "KvDeskInlineEditor.h"

#include "KvDeskImageView.h"
#include "KvDeskObjectEditor.h"
#include "KvDeskObjectPlaces.h"
#include "KvDeskObjectState.h"
#include "measuring/ZtDrawnType.h"

#include <QKeyEvent>

namespace {

constexpr QSize fieldSize(176, 28);
constexpr int longestText = 500;

} // namespace

KvDeskInlineEditor::KvDeskInlineEditor(KvDeskImageView *view)
    : QLineEdit(view->viewport())
    , m_view(view)
{
    resize(fieldSize);
    setMaxLength(longestText);
    // Files are dropped on the window.
    setAcceptDrops(false);
    setCursor(Qt::IBeamCursor);
    hide();
}

void KvDeskInlineEditor::edit(const KvDeskObjectId &object)
{
    const KvDeskObjectState state = KvDeskObjectState::of(object);
    if (object.type != ZtDrawnType::TextNote || !state.exists) {
        rename(object);
        return;
    }
    m_object = object;
    start(ChangeText, state.points.value(0), state.text, tr("Text"));
}

void KvDeskInlineEditor::rename(const KvDeskObjectId &object)
{
    const KvDeskObjectState state = KvDeskObjectState::of(object);
    if (!state.exists)
        return;
    m_object = object;
    // An object of a table has no place on the image.
    const QPointF place = state.points.isEmpty() ? m_view->centre() : state.points.first();
    start(Rename, place, KvDeskObjectEditor::describe({object}), tr("Name"));
}

void KvDeskInlineEditor::writeNote(const QPointF &place)
{
    m_object = KvDeskObjectId();
    m_place = place;
    start(WriteNote, place, QString(), tr("Text"));
}

void KvDeskInlineEditor::start(Purpose purpose, const QPointF &place, const QString &text,
                               const QString &label)
{
    m_purpose = purpose;
    setAccessibleName(label);
    setPlaceholderText(label);
    setText(text);
    selectAll();
    m_view->bringIntoView(QRectF(place, QSizeF()));
    const QRect page = m_view->viewport()->rect();
    const QPoint corner = m_view->viewportTransform().map(place).toPoint() - QPoint(0, height());
    move(qBound(0, corner.x(), qMax(0, page.width() - width())),
         qBound(0, corner.y(), qMax(0, page.height() - height())));
    show();
    raise();
    setFocus();
    emit signalEditingChanged();
}

void KvDeskInlineEditor::slotAccept()
{
    const Purpose purpose = m_purpose;
    const QString written = text();
    finish();
    if (purpose == Rename)
        m_view->editor()->rename(m_object, written);
    else if (purpose == ChangeText && !written.trimmed().isEmpty())
        m_view->editor()->setText(m_object, written);
    else if (purpose == WriteNote && !written.trimmed().isEmpty())
        m_view->editor()->create(ZtDrawnType::TextNote, QPolygonF(QVector<QPointF>{m_place}), QString(),
                                 written);
}

void KvDeskInlineEditor::slotCancel()
{
    finish();
}

void KvDeskInlineEditor::finish()
{
    if (m_purpose == Nothing)
        return;
    // First: hiding the field takes the focus away from it.
    m_purpose = Nothing;
    const bool hadFocus = hasFocus();
    hide();
    if (hadFocus)
        m_view->setFocus();
    emit signalEditingChanged();
}

void KvDeskInlineEditor::keyPressEvent(QKeyEvent *event)
{
    if (event->key() == Qt::Key_Escape)
        slotCancel();
    else if (event->key() == Qt::Key_Return || event->key() == Qt::Key_Enter)
        slotAccept();
    else
        QLineEdit::keyPressEvent(event);
    // Nothing is left to the image below: its keys mean tools there.
    event->accept();
}

void KvDeskInlineEditor::focusOutEvent(QFocusEvent *event)
{
    QLineEdit::focusOutEvent(event);
    // A menu of the field, or another program, is no end.
    if (event->reason() != Qt::PopupFocusReason && event->reason() != Qt::ActiveWindowFocusReason &&
        m_purpose != Nothing)
        slotAccept();
}
