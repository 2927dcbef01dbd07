// SPDX-License-Identifier: MIT
#pragma once

#include <QFrame>

/**
 * Frame filled with a colour of the current theme, with lines of one pixel along the edges that want them.
 * Needs no style sheet, which would go down to everything inside.
 */
class KvThemedFrame : public QFrame
{
    Q_OBJECT
public:
    explicit KvThemedFrame(QWidget *parent = nullptr);

    /** \a colorName, a literal, as for acss::QtAdvancedStylesheet::color(); "window" at first. */
    void setColorName(const char *colorName);
    /** None at first. The frame's layout leaves them their pixel. */
    void setLines(Qt::Edges edges);

protected:
    void paintEvent(QPaintEvent *event) override;

private:
    const char *m_colorName;
    Qt::Edges m_lines;
};
