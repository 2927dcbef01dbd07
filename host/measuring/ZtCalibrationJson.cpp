// SPDX-License-Identifier: MIT
#include "measuring/ZtCalibrationJson.h"

#include "measuring/ZtCalibration.h"
#include "measuring/ZtFault.h"

#include <iterator>

namespace {

const QString pixelSizeXKey = QStringLiteral("micrometresPerPixelX");
const QString pixelSizeYKey = QStringLiteral("micrometresPerPixelY");
const QString dateKey = QStringLiteral("date");
const QString originKey = QStringLiteral("origin");

struct TextMember
{
    const char *key;
    QString (ZtCalibration::*get)() const;
    void (ZtCalibration::*set)(const QString &);
};

constexpr TextMember textMembers[] = {
    {"name", &ZtCalibration::name, &ZtCalibration::setName},
    {"objective", &ZtCalibration::objective, &ZtCalibration::setObjective},
    {"author", &ZtCalibration::author, &ZtCalibration::setAuthor},
    {"note", &ZtCalibration::note, &ZtCalibration::setNote},
};

// In the order of ZtCalibration::Origin.
constexpr const char *originNames[] = {"knownDistance", "metadata", "typed"};

bool fail(const QString &place, const QString &message, ZtFault *fault)
{
    fault->place = place;
    fault->message = message;
    return false;
}

} // namespace

QJsonObject ZtCalibrationJson::toJson(const ZtCalibration &calibration)
{
    QJsonObject json{{pixelSizeXKey, calibration.micrometresPerPixelX()},
                     {pixelSizeYKey, calibration.micrometresPerPixelY()},
                     {originKey, QLatin1String(originNames[static_cast<int>(calibration.origin())])}};
    if (calibration.date().isValid())
        json.insert(dateKey, calibration.date().toString(Qt::ISODateWithMs));
    for (const TextMember &member : textMembers) {
        const QString text = (calibration.*member.get)();
        if (!text.isEmpty())
            json.insert(QLatin1String(member.key), text);
    }
    return json;
}

bool ZtCalibrationJson::read(const QJsonObject &json, ZtCalibration *calibration, ZtFault *fault)
{
    double x = 0.0;
    double y = 0.0;
    if (!readPixelSize(json, pixelSizeXKey, &x, fault) || !readPixelSize(json, pixelSizeYKey, &y, fault))
        return false;
    ZtCalibration result(x, y);
    if (!readTexts(json, &result, fault) || !readDate(json, &result, fault) ||
        !readOrigin(json, &result, fault))
        return false;
    *calibration = result;
    return true;
}

bool ZtCalibrationJson::readPixelSize(const QJsonObject &json, const QString &key, double *size,
                                      ZtFault *fault)
{
    const QJsonValue value = json.value(key);
    if (!value.isDouble() || !ZtCalibration::isValidPixelSize(value.toDouble()))
        return fail(key, tr("This must be a number greater than 0"), fault);
    *size = value.toDouble();
    return true;
}

bool ZtCalibrationJson::readText(const QJsonObject &json, const QString &key, QString *text, ZtFault *fault)
{
    const QJsonValue value = json.value(key);
    if (!value.isString() && !value.isUndefined())
        return fail(key, tr("This must be a text"), fault);
    *text = value.toString();
    return true;
}

bool ZtCalibrationJson::readTexts(const QJsonObject &json, ZtCalibration *calibration, ZtFault *fault)
{
    for (const TextMember &member : textMembers) {
        QString text;
        if (!readText(json, QLatin1String(member.key), &text, fault))
            return false;
        (calibration->*member.set)(text);
    }
    return true;
}

bool ZtCalibrationJson::readDate(const QJsonObject &json, ZtCalibration *calibration, ZtFault *fault)
{
    QString text;
    if (!readText(json, dateKey, &text, fault))
        return false;
    const QDateTime date = QDateTime::fromString(text, Qt::ISODateWithMs);
    if (!text.isEmpty() && !date.isValid())
        return fail(dateKey, tr("This must be a date such as 2026-01-31T12:00:00Z"), fault);
    calibration->setDate(date);
    return true;
}

bool ZtCalibrationJson::readOrigin(const QJsonObject &json, ZtCalibration *calibration, ZtFault *fault)
{
    const QJsonValue value = json.value(originKey);
    if (value.isUndefined())
        return true;
    for (int i = 0; i < static_cast<int>(std::size(originNames)); ++i) {
        if (value == QJsonValue(QLatin1String(originNames[i]))) {
            calibration->setOrigin(static_cast<ZtCalibration::Origin>(i));
            return true;
        }
    }
    return fail(originKey, tr("This must be \"knownDistance\", \"metadata\" or \"typed\""), fault);
}
