// SPDX-License-Identifier: MIT
#include "kernel/ZtAppSettings.h"

#include "common/ZtAppStatus.h"
#include "kernel/ZtLeftToRight.h"

#include <QCoreApplication>
#include <QDir>
#include <QFile>
#include <QFileInfo>
#include <QLocale>
#include <QSettings>
#include <QStandardPaths>
#include <QTimer>
#include <QUrl>

#include <algorithm>
#include <utility>

namespace {

const QLatin1String defaultProfilePrefix("DefaultProfile/");
const QLatin1String profilesPrefix("Profiles/");
const QLatin1String currentProfileKey("Settings/CurrentProfile");

constexpr int storageStatusCode = 1;
constexpr int syncDelay = 1000; ///< milliseconds

QString shownPath(const QString &path)
{
    return ZtLeftToRight::isolated(QDir::toNativeSeparators(path));
}

QString defaultStoragePath()
{
    const char *const variable = "STATREPORT_SETTINGS";
    if (qEnvironmentVariableIsSet(variable))
        return qEnvironmentVariable(variable);
    const QString folder = QStandardPaths::writableLocation(QStandardPaths::GenericConfigLocation);
    return folder + QStringLiteral("/StatReport/settings.ini");
}

/// Asked for every value that is read, so it looks at each character once.
bool isNormal(const QString &path)
{
    bool afterSlash = true;
    for (const QChar c : path) {
        const bool slash = c == QLatin1Char('/');
        if (slash && afterSlash)
            return false;
        afterSlash = slash;
    }
    return path.isEmpty() || !afterSlash;
}

/// Names as the file knows them: without slashes at the ends, and single ones between.
QString normalized(const QString &path)
{
    if (isNormal(path))
        return path;
    return path.split(QLatin1Char('/'), Qt::SkipEmptyParts).join(QLatin1Char('/'));
}

QString asPrefix(const QString &group)
{
    const QString name = normalized(group);
    return name.isEmpty() ? QString() : name + QLatin1Char('/');
}

QString prefixOfProfile(const QString &profile)
{
    if (profile.isEmpty())
        return defaultProfilePrefix;
    return profilesPrefix + QString::fromLatin1(QUrl::toPercentEncoding(profile)) + QLatin1Char('/');
}

/// The file keeps texts only, so a number or a flag equals its text.
bool isSameValue(const QVariant &a, const QVariant &b)
{
    if (a.userType() == b.userType())
        return a == b;
    if (!a.isValid() || !b.isValid())
        return false;
    if (a.canConvert(QMetaType::QString) && b.canConvert(QMetaType::QString))
        return a.toString() == b.toString();
    return a == b;
}

void logStorageError(const QString &message)
{
    ZtAppStatus().setAndLogStatus(ZtAppStatus::Error, storageStatusCode, message,
                                  QStringLiteral("ZtAppSettings"));
}

void syncAtApplicationEnd()
{
    ZtAppSettings::getInstance()->sync();
}

QString chineseName(const QLocale &locale)
{
    const QLocale::Country country = locale.country();
    const bool traditional = locale.script() == QLocale::TraditionalHanScript || country == QLocale::Taiwan ||
                             country == QLocale::HongKong || country == QLocale::Macau;
    return traditional ? QStringLiteral("ChineseTraditional") : QStringLiteral("ChineseSimple");
}

} // namespace

ZtAppSettings::ZtAppSettings()
    : m_path(defaultStoragePath())
    , m_profilePrefix(defaultProfilePrefix)
{
    // The end of the event loop comes first; a program without one writes when its application object dies.
    if (QCoreApplication::instance() != nullptr)
        connect(QCoreApplication::instance(), SIGNAL(aboutToQuit()), this, SLOT(slotAboutToQuit()));
    qAddPostRoutine(syncAtApplicationEnd);
}

ZtAppSettings::~ZtAppSettings() = default;

ZtAppSettings *ZtAppSettings::getInstance()
{
    // Made first, so that it dies last: errors go there.
    ZtStatusLog::getInstance();
    static ZtAppSettings instance;
    return &instance;
}

void ZtAppSettings::beginGroup(const QString &group)
{
    ZtAppSettings *const self = getInstance();
    self->ensureLoaded();
    self->m_groups.append(self->prefix() + asPrefix(group));
}

void ZtAppSettings::beginGroupAbsolute(const QString &group)
{
    ZtAppSettings *const self = getInstance();
    self->ensureLoaded();
    self->m_groups.append(asPrefix(group));
}

void ZtAppSettings::endGroup()
{
    ZtAppSettings *const self = getInstance();
    if (self->m_groups.isEmpty()) {
        qWarning("ZtAppSettings::endGroup: no group is open");
        return;
    }
    self->m_groups.removeLast();
    self->announceModified();
}

QVariant ZtAppSettings::value(const QString &key, const QVariant &defaultValue)
{
    ZtAppSettings *const self = getInstance();
    self->ensureLoaded();
    return self->m_values.value(self->fullKey(key), defaultValue);
}

void ZtAppSettings::setValue(const QString &key, const QVariant &value)
{
    ZtAppSettings *const self = getInstance();
    self->ensureLoaded();
    const QString name = normalized(key);
    if (name.isEmpty()) {
        qWarning("ZtAppSettings::setValue: empty key");
        return;
    }
    self->store(self->fullKey(name), name, value);
    self->announceModified();
}

bool ZtAppSettings::contains(const QString &key)
{
    ZtAppSettings *const self = getInstance();
    self->ensureLoaded();
    return self->m_values.contains(self->fullKey(key));
}

QStringList ZtAppSettings::childKeys()
{
    ZtAppSettings *const self = getInstance();
    self->ensureLoaded();
    const QString base = self->prefix();
    QStringList keys;
    for (auto it = self->m_values.constBegin(); it != self->m_values.constEnd(); ++it) {
        if (it.key().startsWith(base) && it.key().indexOf(QLatin1Char('/'), base.size()) < 0)
            keys.append(it.key().mid(base.size()));
    }
    keys.sort();
    return keys;
}

void ZtAppSettings::remove(const QString &key)
{
    ZtAppSettings *const self = getInstance();
    self->ensureLoaded();
    const QString base = self->prefix();
    const QString below = base + asPrefix(key);
    const QString itself = self->fullKey(key);
    const QStringList all = self->m_values.keys();
    for (const QString &candidate : all) {
        if (candidate == itself || candidate.startsWith(below))
            self->store(candidate, candidate.mid(base.size()), QVariant());
    }
    self->announceModified();
}

QString ZtAppSettings::getSystemLanguageName()
{
    return getLanguageName(QLocale::system());
}

QString ZtAppSettings::getLanguageName(const QLocale &locale)
{
    switch (locale.language()) {
    case QLocale::German:
        return QStringLiteral("German");
    case QLocale::French:
        return QStringLiteral("French");
    case QLocale::Spanish:
        return QStringLiteral("Spanish");
    case QLocale::Italian:
        return QStringLiteral("Italian");
    case QLocale::Russian:
        return QStringLiteral("Russian");
    case QLocale::Japanese:
        return QStringLiteral("Japanese");
    case QLocale::Korean:
        return QStringLiteral("Korean");
    case QLocale::Arabic:
        return QStringLiteral("Arabic");
    case QLocale::Slovak:
        return QStringLiteral("Slovakian");
    case QLocale::Chinese:
        return chineseName(locale);
    default:
        return QStringLiteral("English");
    }
}

QString ZtAppSettings::getProgramName()
{
    const QString &name = getInstance()->m_programName;
    return name.isEmpty() ? QCoreApplication::applicationName() : name;
}

QString ZtAppSettings::getProgramVersion()
{
    const QString &version = getInstance()->m_programVersion;
    return version.isEmpty() ? QCoreApplication::applicationVersion() : version;
}

QString ZtAppSettings::getVendor()
{
    const QString &vendor = getInstance()->m_vendor;
    return vendor.isEmpty() ? QCoreApplication::organizationName() : vendor;
}

void ZtAppSettings::setProgramInfo(const QString &name, const QString &version, const QString &vendor)
{
    ZtAppSettings *const self = getInstance();
    self->m_programName = name;
    self->m_programVersion = version;
    self->m_vendor = vendor;
}

void ZtAppSettings::setStoragePath(const QString &path)
{
    sync();
    m_path = path;
    m_hasSyncFailed = false;
    m_values.clear();
    m_changes.clear();
    m_unsaved.clear();
    load();
    emit signalProfileChanged();
}

bool ZtAppSettings::sync()
{
    if (m_unsaved.isEmpty())
        return true;
    if (m_path.isEmpty()) {
        m_unsaved.clear();
        return true;
    }
    if (!m_writable)
        return false;

    QDir().mkpath(QFileInfo(m_path).absolutePath());
    QSettings file(m_path, QSettings::IniFormat);
    file.setIniCodec("UTF-8");
    file.setAtomicSyncRequired(true);
    for (const QString &key : std::as_const(m_unsaved)) {
        const auto value = m_values.constFind(key);
        if (value == m_values.constEnd())
            file.remove(key);
        else
            file.setValue(key, *value);
    }
    file.sync();
    m_hasSyncFailed = file.status() != QSettings::NoError;
    if (m_hasSyncFailed) {
        logStorageError(tr("The settings could not be saved to %1. Check that the folder is writable.")
                            .arg(shownPath(m_path)));
        return false;
    }
    m_unsaved.clear();
    return true;
}

QStringList ZtAppSettings::profiles() const
{
    ensureLoaded();
    QSet<QString> names{QString()};
    for (auto it = m_values.constBegin(); it != m_values.constEnd(); ++it) {
        if (it.key().startsWith(profilesPrefix)) {
            const QString encoded = it.key().section(QLatin1Char('/'), 1, 1);
            names.insert(QUrl::fromPercentEncoding(encoded.toLatin1()));
        }
    }
    QStringList sorted(names.constBegin(), names.constEnd());
    sorted.sort();
    return sorted;
}

QString ZtAppSettings::currentProfile() const
{
    ensureLoaded();
    return m_profile;
}

void ZtAppSettings::setCurrentProfile(const QString &profile)
{
    ensureLoaded();
    if (profile == m_profile)
        return;

    selectProfile(profile);
    m_values.insert(currentProfileKey, profile);
    noteUnsaved(currentProfileKey);
    emit signalProfileChanged();
}

void ZtAppSettings::slotAboutToQuit()
{
    sync();
}

void ZtAppSettings::ensureLoaded() const
{
    if (!m_loaded)
        getInstance()->load();
}

void ZtAppSettings::load()
{
    m_loaded = true;
    m_writable = true;
    selectProfile(QString());
    if (m_path.isEmpty() || !QFileInfo::exists(m_path))
        return;

    if (!QFile(m_path).open(QIODevice::ReadOnly)) {
        m_writable = false;
        logStorageError(tr("The settings file %1 cannot be read. Changes to the settings will not be kept.")
                            .arg(shownPath(m_path)));
        return;
    }
    QSettings file(m_path, QSettings::IniFormat);
    file.setIniCodec("UTF-8");
    const QStringList keys = file.allKeys();
    if (file.status() != QSettings::NoError) {
        setAside(m_path);
        return;
    }
    m_values.reserve(keys.size());
    for (const QString &key : keys)
        m_values.insert(key, file.value(key));
    selectProfile(m_values.value(currentProfileKey).toString());
}

void ZtAppSettings::setAside(const QString &path)
{
    const QString aside = path + QStringLiteral(".broken");
    QFile::remove(aside);
    // Renamed, not copied: whatever is written later must not be merged with the broken text.
    m_writable = QFile::rename(path, aside);
    const QString text =
        m_writable ? tr("The settings file %1 is damaged. It was renamed to %2; all settings are "
                        "back at their defaults.")
                   : tr("The settings file %1 is damaged and could not be renamed to %2. Changes to "
                        "the settings will not be kept.");
    logStorageError(text.arg(shownPath(path), shownPath(aside)));
}

void ZtAppSettings::selectProfile(const QString &profile)
{
    m_profile = profile;
    m_profilePrefix = prefixOfProfile(profile);
}

const QString &ZtAppSettings::prefix() const
{
    return m_groups.isEmpty() ? m_profilePrefix : m_groups.constLast();
}

QString ZtAppSettings::fullKey(const QString &key) const
{
    return prefix() + normalized(key);
}

void ZtAppSettings::store(const QString &fullKey, const QString &key, const QVariant &value)
{
    const auto stored = m_values.constFind(fullKey);
    const bool known = stored != m_values.constEnd();
    const QVariant before = known ? *stored : QVariant();
    if (known == value.isValid() && isSameValue(before, value))
        return;

    const auto sameKey = [&fullKey](const Change &change) { return change.fullKey == fullKey; };
    if (std::none_of(m_changes.cbegin(), m_changes.cend(), sameKey))
        m_changes.append({fullKey, key, before});
    if (value.isValid())
        m_values.insert(fullKey, value);
    else
        m_values.remove(fullKey);
    noteUnsaved(fullKey);
}

void ZtAppSettings::noteUnsaved(const QString &fullKey)
{
    m_unsaved.insert(fullKey);
    // A program that is killed loses the last second at most. Settings that live in memory have nowhere to
    // go.
    if (m_syncIsDue || m_path.isEmpty() || !QCoreApplication::instance())
        return;
    m_syncIsDue = true;
    QTimer::singleShot(syncDelay, this, SLOT(slotSyncSoon()));
}

void ZtAppSettings::slotSyncSoon()
{
    m_syncIsDue = false;
    if (!m_hasSyncFailed)
        sync();
}

void ZtAppSettings::announceModified()
{
    if (!m_groups.isEmpty() || m_changes.isEmpty())
        return;

    // Receivers read and write settings themselves, so the list is empty before they are called.
    const QVector<Change> changes = std::exchange(m_changes, {});
    QStringList keys;
    QList<QVariant> values;
    for (const Change &change : changes) {
        const QVariant now = m_values.value(change.fullKey);
        if (isSameValue(change.before, now))
            continue;
        keys.append(change.key);
        values.append(now);
    }
    if (!keys.isEmpty())
        emit signalValuesModified(keys, values);
}
