// SPDX-License-Identifier: MIT
#include "widgets/KvThemedFrame.h"

#include "widgets/KvThemePainting.h"

#include <QPainter>

KvThemedFrame::KvThemedFrame(QWidget *parent)
    : QFrame(parent)
    , m_colorName("window")
{}

void KvThemedFrame::setColorName(const char *colorName)
{
    m_colorName = colorName;
    update();
}

void KvThemedFrame::setLines(Qt::Edges edges)
{
    if (edges == m_lines)
        return;
    m_lines = edges;
    const auto pixel = [edges](Qt::Edge edge) { return edges.testFlag(edge) ? 1 : 0; };
    setContentsMargins(pixel(Qt::LeftEdge), pixel(Qt::TopEdge), pixel(Qt::RightEdge), pixel(Qt::BottomEdge));
    update();
}

void KvThemedFrame::paintEvent(QPaintEvent *event)
{
    Q_UNUSED(event)
    QPainter painter(this);
    painter.fillRect(rect(), KvThemePainting::color("line"));
    painter.fillRect(contentsRect(), KvThemePainting::color(m_colorName));
}
