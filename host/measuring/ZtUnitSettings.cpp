// SPDX-License-Identifier: MIT
#include "measuring/ZtUnitSettings.h"

#include "kernel/ZtAppSettings.h"
#include "kernel/ZtGsManipulator.h"
#include "kernel/ZtSignalCenter.h"

namespace {

const char digitsKey[] = "MeasurementLabelsSignDigits";
const char lengthKey[] = "LengthUnit";
const char angleKey[] = "AngleUnit";

// A double has no more than 15 digits that mean something.
constexpr uint maximumDigits = 15;

// Any text that does not name a unit of the kind, "auto" among them, leaves the choice automatic.
ZtUnit readUnit(const char *key, int kind)
{
    const ZtUnit unit = ZtUnit::parse(ZtAppSettings::value(QLatin1String(key)).toString());
    return unit.kind() == kind ? unit : ZtUnit();
}

} // namespace

ZtUnitSettings *ZtUnitSettings::getInstance()
{
    static ZtUnitSettings settings;
    return &settings;
}

ZtUnitSettings::ZtUnitSettings()
{
    read();
    ZtAppSettings *source = ZtAppSettings::getInstance();
    connect(source, SIGNAL(signalValuesModified(QStringList, QList<QVariant>)), this,
                           SLOT(slotValuesModified(QStringList, QList<QVariant>)));
    connect(source, SIGNAL(signalProfileChanged()), this, SLOT(slotProfileChanged()));
}

const ZtUnit &ZtUnitSettings::chosenUnit(int measureKind) const
{
    static const ZtUnit none;
    switch (measureKind) {
    case ZtGsManipulator::Length:
        return m_length;
    case ZtGsManipulator::Area:
        return m_area;
    case ZtGsManipulator::Angle:
        return m_angle;
    default:
        return none;
    }
}

void ZtUnitSettings::reload()
{
    const ZtUnit oldLength = m_length;
    const ZtUnit oldAngle = m_angle;
    read();
    if (m_length != oldLength)
        emit ZtSignalCenter::getInstance()->signalLengthUnitChanged();
    if (m_angle != oldAngle)
        emit ZtSignalCenter::getInstance()->signalAngleUnitChanged();
}

void ZtUnitSettings::read()
{
    ZtAppSettings::beginGroup(QStringLiteral("Measurement"));
    m_digits =
        static_cast<int>(qMin(ZtAppSettings::value(QLatin1String(digitsKey), 0).toUInt(), maximumDigits));
    m_length = readUnit(lengthKey, ZtGsManipulator::Length);
    m_angle = readUnit(angleKey, ZtGsManipulator::Angle);
    ZtAppSettings::endGroup();
    m_area = m_length.squared();
}

void ZtUnitSettings::slotValuesModified(QStringList aKeys, QList<QVariant> aVals)
{
    Q_UNUSED(aVals)
    for (const char *key : {digitsKey, lengthKey, angleKey}) {
        if (aKeys.contains(QLatin1String(key))) {
            reload();
            return;
        }
    }
}

void ZtUnitSettings::slotProfileChanged()
{
    reload();
}
