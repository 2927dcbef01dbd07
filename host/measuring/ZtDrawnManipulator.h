// SPDX-License-Identifier: MIT
#pragma once

#include "measuring/ZtMeasuringManipulator.h"

#include <memory>

class QPainterPath;
class ZtCalibration;
class ZtDrawnObjectData;
struct ZtDrawnType;
struct ZtDrawnValue;

/** Manipulator of every built-in type: measures the points of a ZtDrawnObjectData as the type's row in the
 * table says. */
class ZT_MEASURING_EXPORT ZtDrawnManipulator : public ZtMeasuringManipulator
{
public:
    /** \a type is one of ZtDrawnType::all(); \a calibration is shared with whoever changes it. */
    ZtDrawnManipulator(const ZtDrawnType &type, std::shared_ptr<const ZtCalibration> calibration);

    int typeFlags(int reserved) const override;
    QString objectTypeName(int id) const override;
    /** An int for counts, else a double; invalid for an unknown name and for points that the type refuses. */
    QVariant value(const QString &valueName, const ZtKernelObjectData *object,
                   int &measureKind) const override;
    QString valueText(const QString &valueName, const ZtKernelObjectData *object) const override;
    void draw(QPainter *painter, int id, const ZtKernelObjectData *object) const override;

    /** As draw(), without the label. */
    void drawShape(QPainter *painter, int id, const ZtKernelObjectData *object) const;
    /** What the object's label reads: its name and the first value that is shown; of types without values
     * what they are there for. May be empty. */
    QString labelText(int id, const ZtKernelObjectData *object) const;

    const ZtDrawnType &type() const { return m_type; }

    /** The lines of an object with these points, in image pixels: a circle is one in reality, and an ellipse
     * on an image whose pixels are not square. Empty for types without lines. */
    QPainterPath outline(const QPolygonF &points) const;
    /** The same by the manipulator that is registered for the type; with square pixels where there is none.
     */
    static QPainterPath outlineOf(const ZtDrawnType &type, const QPolygonF &points);

    /** Fetches the names again after the language changed. */
    void retranslate();

protected:
    void appendValues(const ZtMeasuredObjectData &object,
                      std::vector<ZtMeasuredValue> *values) const override;

private:
    bool measure(const QString &valueName, const ZtKernelObjectData *object, double *baseValue,
                 const ZtDrawnValue **definition) const;
    double inBaseUnits(const ZtDrawnValue &definition, const ZtDrawnObjectData &object) const;
    QString firstValueText(const ZtDrawnObjectData &object) const;
    QString lengthText(const ZtDrawnObjectData &object) const;
    double countShare(const ZtDrawnObjectData &counter) const;
    double countOfAll() const;

    const ZtDrawnType &m_type;
    std::shared_ptr<const ZtCalibration> m_calibration;
    QString m_typeName;
    mutable double m_countOfAll = 0.0;   ///< places of all counters
    mutable quint64 m_countRevision = 0; ///< of the kernel's objects when they were counted
    mutable bool m_isCountKnown = false;
};
