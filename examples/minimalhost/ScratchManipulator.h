// SPDX-License-Identifier: MIT
#pragma once

#include "kernel/ZtGsManipulator.h"
#include "kernel/ZtKernelObjectData.h"

#include <QLineF>
#include <QPainter>

/** Pixels of the image to micrometres, as a calibration would tell. */
constexpr double micrometresPerPixel = 0.5;

/** What the host knows of one scratch: where it lies on the image, in pixels. */
struct Scratch : ZtKernelObjectData
{
    explicit Scratch(const QLineF &place)
        : line(place)
    {}

    const QLineF line;
};

/** The object type "Scratch": what it measures, as a number and as a text, and how it is drawn. */
class ScratchManipulator : public ZtGsManipulator
{
public:
    static constexpr int typeId = 90001; ///< any number that no other type has

    ScratchManipulator()
        : ZtGsManipulator({QStringLiteral("Length")})
    {}

    int objectTypeId() const override { return typeId; }
    int typeFlags(int) const override { return MeasurementFlag; }
    QString objectTypeName(int) const override { return QStringLiteral("Scratch"); }
    QStringList valueSet(int) const override { return getValueNames(); }
    bool isValueShown(const QString &valueName, const QStringList &valueSet) const override
    {
        return valueSet.contains(valueName);
    }

    QVariant value(const QString &, const ZtKernelObjectData *object, int &measureKind) const override
    {
        measureKind = Length;
        return lineOf(object).length() * micrometresPerPixel;
    }
    QString valueText(const QString &valueName, const ZtKernelObjectData *object) const override
    {
        int kind = NoKind;
        return QStringLiteral("%1 µm").arg(value(valueName, object, kind).toDouble(), 0, 'f', 1);
    }
    void draw(QPainter *painter, int, const ZtKernelObjectData *object) const override
    {
        painter->setPen(QPen(Qt::yellow, 2));
        painter->drawLine(lineOf(object));
    }

private:
    /** Objects of this type are scratches and nothing else. */
    static QLineF lineOf(const ZtKernelObjectData *object)
    {
        return static_cast<const Scratch *>(object)->line;
    }
};
