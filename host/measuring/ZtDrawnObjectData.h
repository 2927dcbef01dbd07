// SPDX-License-Identifier: MIT
#pragma once

#include "measuring/ZtMeasuredObjectData.h"

#include <QPolygonF>
#include <QString>

/** An object drawn on the image: its points in scene coordinates (image pixels), and a text where the type
 * has one. */
class ZT_MEASURING_EXPORT ZtDrawnObjectData : public ZtMeasuredObjectData
{
public:
    explicit ZtDrawnObjectData(const QPolygonF &points = QPolygonF(), const QString &text = QString());

    /** What the points mean is said by ZtDrawnType. */
    const QPolygonF &points() const { return m_points; }
    void setPoints(const QPolygonF &points) { m_points = points; }

    QString text() const { return m_text; }
    void setText(const QString &text) { m_text = text; }

private:
    QPolygonF m_points;
    QString m_text;
};
