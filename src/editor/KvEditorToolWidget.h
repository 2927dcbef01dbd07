// SPDX-License-Identifier: MIT
#pragma once

#include <QFrame>
#include <QPoint>

class KvBaseEditorNodeFactory;
class QLabel;

/** Row of the editor's palette for one block type: icon, name, and dots that say "drag me". */
class KvEditorToolWidget : public QFrame
{
    Q_OBJECT
public:
    /** \a factory is not owned and outlives the widget. */
    explicit KvEditorToolWidget(KvBaseEditorNodeFactory *factory, QWidget *parent = nullptr);

    KvBaseEditorNodeFactory *factory() const { return m_factory; }
    QString text() const;
    void setText(const QString &text);
    void setIcon(const QIcon &icon);

protected:
    void mousePressEvent(QMouseEvent *event) override;
    void mouseMoveEvent(QMouseEvent *event) override;

private:
    void startDrag();

    KvBaseEditorNodeFactory *m_factory;
    QLabel *m_iconLabel;
    QLabel *m_nameLabel;
    QPoint m_pressPosition;
    bool m_isPressed = false;
};
