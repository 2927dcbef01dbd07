// SPDX-License-Identifier: MIT
#include "measuring/ZtCalibrationStore.h"

#include "common/ZtAppStatus.h"
#include "kernel/ZtAppSettings.h"
#include "measuring/ZtCalibrationJson.h"
#include "measuring/ZtFault.h"

#include <QCollator>
#include <QJsonDocument>
#include <QRandomGenerator>
#include <QSet>

#include <algorithm>

namespace {

const QString groupName = QStringLiteral("Calibrations");
const QString historyName = QStringLiteral("History");
const QString authorKey = QStringLiteral("Author");
const QString objectiveKey = QStringLiteral("Objective");

const QString timeFormat = QStringLiteral("yyyyMMddhhmmsszzz");
constexpr int timeLength = 17;

QString textValue(const QString &key)
{
    ZtAppSettings::beginGroup(groupName);
    const QString text = ZtAppSettings::value(key).toString();
    ZtAppSettings::endGroup();
    return text;
}

void storeText(const QString &key, const QString &text)
{
    ZtAppSettings::beginGroup(groupName);
    ZtAppSettings::setValue(key, text);
    ZtAppSettings::endGroup();
}

QDateTime timeOf(const QString &key)
{
    QDateTime time = QDateTime::fromString(key.left(timeLength), timeFormat);
    time.setTimeSpec(Qt::UTC);
    return time;
}

} // namespace

ZtCalibrationStore::ZtCalibrationStore(QObject *parent)
    : QObject(parent)
{
    connect(ZtAppSettings::getInstance(), SIGNAL(signalProfileChanged()), this, SLOT(slotProfileChanged()));
    load();
}

void ZtCalibrationStore::load()
{
    m_entries.clear();
    ZtAppSettings::beginGroup(groupName);
    ZtAppSettings::beginGroup(historyName);
    const QStringList keys = ZtAppSettings::childKeys();
    for (const QString &key : keys)
        readEntry(key, ZtAppSettings::value(key).toString());
    ZtAppSettings::endGroup();
    ZtAppSettings::endGroup();
}

void ZtCalibrationStore::readEntry(const QString &key, const QString &text)
{
    ZtFault fault;
    ZtCalibration calibration;
    const QJsonDocument document = QJsonDocument::fromJson(text.toUtf8());
    if (!document.isObject())
        fault.message = tr("This is not a calibration");
    else
        ZtCalibrationJson::read(document.object(), &calibration, &fault);
    if (fault.isNull()) {
        m_entries.insert(key, calibration);
        return;
    }
    ZtAppStatus().setAndLogStatus(
        ZtAppStatus::Warning, 0,
        tr("A calibration in the settings is damaged and was left out (%1: %2)").arg(key, fault.text()),
        QStringLiteral("ZtCalibrationStore::readEntry"));
}

void ZtCalibrationStore::slotProfileChanged()
{
    load();
    emit signalChanged();
}

QStringList ZtCalibrationStore::objectives() const
{
    QSet<QString> names;
    for (const ZtCalibration &calibration : m_entries)
        names.insert(calibration.objective());
    names.remove(QString());
    QStringList sorted(names.constBegin(), names.constEnd());
    QCollator collator{QLocale(QLocale::English)};
    collator.setNumericMode(true);
    std::sort(sorted.begin(), sorted.end(), collator);
    return sorted;
}

QVector<ZtCalibration> ZtCalibrationStore::history(const QString &objective) const
{
    QVector<ZtCalibration> result;
    for (const ZtCalibration &calibration : m_entries) {
        if (calibration.objective() == objective)
            result.prepend(calibration);
    }
    return result;
}

ZtCalibration ZtCalibrationStore::current(const QString &objective) const
{
    const QVector<ZtCalibration> all = history(objective);
    return all.isEmpty() ? ZtCalibration() : all.first();
}

// Later than all others, even where the clock was set back.
QString ZtCalibrationStore::newKey() const
{
    QDateTime time = QDateTime::currentDateTimeUtc();
    for (auto it = m_entries.constBegin(); it != m_entries.constEnd(); ++it) {
        const QDateTime other = timeOf(it.key());
        if (other.isValid() && other >= time)
            time = other.addMSecs(1);
    }
    // Another program may add an entry at the same time.
    const uint unique = QRandomGenerator::global()->generate();
    return time.toString(timeFormat) + QStringLiteral("-%1").arg(unique, 8, 16, QLatin1Char('0'));
}

bool ZtCalibrationStore::append(const ZtCalibration &calibration)
{
    if (!calibration.isCalibrated())
        return false;
    const QString key = newKey();
    const QByteArray json =
        QJsonDocument(ZtCalibrationJson::toJson(calibration)).toJson(QJsonDocument::Compact);
    m_entries.insert(key, calibration);
    ZtAppSettings::beginGroup(groupName);
    ZtAppSettings::beginGroup(historyName);
    ZtAppSettings::setValue(key, QString::fromUtf8(json));
    ZtAppSettings::endGroup();
    ZtAppSettings::endGroup();
    emit signalChanged();
    return true;
}

QString ZtCalibrationStore::author() const
{
    return textValue(authorKey);
}

void ZtCalibrationStore::setAuthor(const QString &author)
{
    storeText(authorKey, author);
}

QString ZtCalibrationStore::lastObjective() const
{
    return textValue(objectiveKey);
}

void ZtCalibrationStore::setLastObjective(const QString &objective)
{
    storeText(objectiveKey, objective);
}
