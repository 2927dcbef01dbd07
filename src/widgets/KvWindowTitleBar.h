// SPDX-License-Identifier: MIT
#pragma once

#include <QFrame>
#include <QPoint>
#include <QRect>

class KvElidedLabel;
class QToolButton;

/**
 * Title bar of a frameless window: title and close button. Dragging moves the window; dragging the topmost
 * three pixels moves its upper edge.
 */
class KvWindowTitleBar : public QFrame
{
    Q_OBJECT
public:
    explicit KvWindowTitleBar(QWidget *parent = nullptr);

    QString title() const;
    void setTitle(const QString &title);

signals:
    void closeClicked();

protected:
    void mousePressEvent(QMouseEvent *event) override;
    void mouseMoveEvent(QMouseEvent *event) override;
    void mouseReleaseEvent(QMouseEvent *event) override;
    void changeEvent(QEvent *event) override;

private:
    enum class Gesture { None, Move, Resize };

    void addCloseButton();
    void retranslate();
    void updateCursor(const QPoint &position);
    void resizeWindow(int deltaY);

    KvElidedLabel *m_titleLabel;
    QToolButton *m_closeButton = nullptr;
    Gesture m_gesture = Gesture::None;
    QPoint m_pressPosition; ///< global
    QRect m_startGeometry;  ///< the window's at the press
};
