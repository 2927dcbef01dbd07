// SPDX-License-Identifier: MIT
#pragma once

#include "measuring/ZtImportedType.h"
#include "measuring/ZtMeasuringManipulator.h"

#include <memory>

/** Manipulator of a type that came from a table. Its objects are ZtImportedObjectData, and are not drawn. */
class ZT_MEASURING_EXPORT ZtImportedManipulator : public ZtMeasuringManipulator
{
public:
    /** \a typeId may be 0 as long as the kernel does not know the type. */
    ZtImportedManipulator(int typeId, std::shared_ptr<const ZtImportedType> type);
    using ZtMeasuringManipulator::setObjectTypeId;

    int typeFlags(int reserved) const override;
    QString objectTypeName(int id) const override;
    /** An int for whole counts, else a double; invalid where the table has no number. */
    QVariant value(const QString &valueName, const ZtKernelObjectData *object,
                   int &measureKind) const override;
    QString valueText(const QString &valueName, const ZtKernelObjectData *object) const override;

    /** The value's text where people look at many of them; valueText() has all digits. */
    QString shortText(const QString &valueName, const ZtKernelObjectData *object) const;

    const ZtImportedType &type() const { return *m_type; }
    std::shared_ptr<const ZtImportedType> sharedType() const { return m_type; }

protected:
    void appendValues(const ZtMeasuredObjectData &object,
                      std::vector<ZtMeasuredValue> *values) const override;

private:
    const ZtImportedCell *cell(const QString &valueName, const ZtKernelObjectData *object) const;

    std::shared_ptr<const ZtImportedType> m_type;
};
