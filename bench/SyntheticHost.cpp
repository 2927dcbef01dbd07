// SPDX-License-Identifier: MIT
#include "SyntheticHost.h"

#include "kernel/ZtGsManipulator.h"
#include "kernel/ZtKernelData.h"
#include "kernel/ZtKernelObjectData.h"
#include "kernel/ZtKernelObjectDataDescr.h"

namespace {

constexpr int kFirstType = 70000;
constexpr int kTypes = 8;

constexpr int kValues = 4;

class LengthsData : public ZtKernelObjectData
{
public:
    explicit LengthsData(double first)
        : m_first(first)
    {}
    double length(int index) const { return m_first + 250.5 * index; }

private:
    double m_first;
};

class LengthsManipulator : public ZtGsManipulator
{
public:
    explicit LengthsManipulator(int type)
        : ZtGsManipulator({QStringLiteral("Length"), QStringLiteral("Width"), QStringLiteral("Height"),
                           QStringLiteral("Depth")})
        , m_type(type)
        , m_typeName(QStringLiteral("Kind %1").arg(QChar(u'A' + type - kFirstType)))
    {}
    int objectTypeId() const override { return m_type; }
    int typeFlags(int) const override { return MeasurementFlag; }
    QString objectTypeName(int) const override { return m_typeName; }
    bool isValueShown(const QString &valueName, const QStringList &valueSet) const override
    {
        return valueSet.contains(valueName);
    }
    QVariant value(const QString &valueName, const ZtKernelObjectData *object,
                   int &measureKind) const override
    {
        measureKind = Length;
        return length(valueName, object);
    }
    QString valueText(const QString &valueName, const ZtKernelObjectData *object) const override
    {
        return QString::number(length(valueName, object) / 1000.0, 'f', 3) + QStringLiteral(" mm");
    }
    QStringList valueSet(int) const override { return getValueNames(); }

private:
    double length(const QString &valueName, const ZtKernelObjectData *object) const
    {
        return static_cast<const LengthsData *>(object)->length(getValueNames().indexOf(valueName));
    }

    int m_type;
    QString m_typeName;
};

} // namespace

void fillSyntheticHost(int count)
{
    const ZtKernelData::SignalBlocker blocker;
    ZtKernelData *kernel = ZtKernelData::getInstance();
    for (int i = 0; i < kTypes; ++i) {
        const int type = kFirstType + i;
        kernel->unregisterType(type);
        kernel->registerType(
            type, std::make_unique<LengthsManipulator>(type),
            std::make_unique<ZtKernelObjectDataDescr>(type, QStringLiteral("kind%1").arg(i)));
    }
    for (int i = 0; i < count / kValues; ++i) {
        const double length = 1000.0 + (i * 7919) % 9000 + 0.125 * (i % 8);
        kernel->addObject(kFirstType + i % kTypes, std::make_unique<LengthsData>(length));
    }
}
