// SPDX-License-Identifier: MIT
#pragma once

#include <QColor>
#include <QPushButton>

/** Button that shows a colour and lets the user choose another one in a dialog. */
class KvColorLabel : public QPushButton
{
    Q_OBJECT
public:
    explicit KvColorLabel(QWidget *parent = nullptr);

    QColor color() const { return m_color; }
    /** Shows \a color; emits nothing. */
    void setColor(const QColor &color);

signals:
    void signalColorChanged(const QColor &aColor); ///< the user chose another colour

private slots:
    void slotClicked();

private:
    QColor m_color;
};
