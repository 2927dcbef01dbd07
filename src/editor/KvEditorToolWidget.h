// SPDX-License-Identifier: MIT
#pragma once

#include "editor/KvEditorPaletteRow.h"

#include <QPoint>

class KvBaseEditorNodeFactory;
class QDrag;

/**
 * Row of the editor's palette for one block type: icon, name, and dots that say "drag me".
 *
 * Dragged it offers a new block of its type; a double click or Enter asks for one at the template's end.
 */
class KvEditorToolWidget : public KvEditorPaletteRow
{
    Q_OBJECT
public:
    /** \a factory is not owned and outlives the widget. */
    explicit KvEditorToolWidget(KvBaseEditorNodeFactory *factory, QWidget *parent = nullptr);

    KvBaseEditorNodeFactory *factory() const { return m_factory; }

signals:
    void signalToolActivated(const QString &aTypeName);

protected:
    /** Runs a drag until the drop. */
    virtual void runDrag(QDrag *drag);

    void activate() override;
    void mousePressEvent(QMouseEvent *event) override;
    void mouseMoveEvent(QMouseEvent *event) override;
    void mouseReleaseEvent(QMouseEvent *event) override;
    void mouseDoubleClickEvent(QMouseEvent *event) override;
    void changeEvent(QEvent *event) override;

private:
    void retranslate();
    void startDrag();

    KvBaseEditorNodeFactory *m_factory;
    QPoint m_pressPosition;
    bool m_isPressed = false;
};
