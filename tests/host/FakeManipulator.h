// SPDX-License-Identifier: MIT
#pragma once

#include "kernel/ZtGsManipulator.h"

#include <QPainter>

/** Manipulator of a made-up type whose objects are drawn as squares of 4 scene units with the corner at (id,
 * id). */
class FakeManipulator : public ZtGsManipulator
{
public:
    explicit FakeManipulator(int type, const QColor &color = Qt::red)
        : ZtGsManipulator({QStringLiteral("width"), QStringLiteral("height")})
        , m_type(type)
        , m_color(color)
    {}

    int objectTypeId() const override { return m_type; }
    int typeFlags(int reserved) const override { return reserved | MeasurementFlag; }
    QString objectTypeName(int id) const override
    {
        Q_UNUSED(id)
        return QStringLiteral("Square");
    }
    bool isValueShown(const QString &valueName, const QStringList &valueSet) const override
    {
        return valueSet.contains(valueName);
    }
    QVariant value(const QString &valueName, const ZtKernelObjectData *object,
                   int &measureKind) const override
    {
        Q_UNUSED(valueName)
        Q_UNUSED(object)
        measureKind = Length;
        return 4.0;
    }
    QString valueText(const QString &valueName, const ZtKernelObjectData *object) const override
    {
        Q_UNUSED(valueName)
        Q_UNUSED(object)
        return QStringLiteral("4 µm");
    }
    QStringList valueSet(int id) const override
    {
        Q_UNUSED(id)
        return getValueNames();
    }
    void draw(QPainter *painter, int id, const ZtKernelObjectData *object) const override
    {
        Q_UNUSED(object)
        painter->translate(id, id);
        painter->fillRect(0, 0, 4, 4, m_color);
    }

    using ZtGsManipulator::setValueNames;

private:
    int m_type;
    QColor m_color;
};
