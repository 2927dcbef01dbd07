// SPDX-License-Identifier: MIT
#pragma once

#include "kernel/ZtKernelGlobal.h"

#include <QHash>
#include <QList>
#include <QObject>
#include <QSet>
#include <QString>
#include <QStringList>
#include <QVariant>
#include <QVector>

class QLocale;

/**
 * The application's settings: one INI file per user, with profiles.
 *
 * A value lives under a path of groups and a key. beginGroup() opens a group relative to the current profile
 * and to the groups already open; beginGroupAbsolute() opens one at the file's root, whatever is open. With
 * no group open a key is relative to the current profile. Every begin needs an endGroup(). Names may hold
 * slashes, which open nested groups.
 *
 * The file's root holds
 *  - "DefaultProfile/<groups>/<key>"    the values of the default profile,
 *  - "Profiles/<name>/<groups>/<key>"   those of a named profile, the name percent-encoded,
 *  - "Settings/CurrentProfile"          the name of the current profile,
 *  - "<groups>/<key>"                   what was written in absolute groups (none of the names above).
 *
 * The file is read at the first use and written by sync(), soon after a change while there is an event loop,
 * and at the application's end. Only what changed is written, so that two running applications keep each
 * other's values. A file that cannot be understood is renamed to "<name>.broken" and reported to the status
 * log; one that cannot be read is reported and left alone. GUI thread only.
 */
class ZT_KERNEL_EXPORT ZtAppSettings : public QObject
{
    Q_OBJECT
public:
    static ZtAppSettings *getInstance(); ///< made at the first call

    static void beginGroup(const QString &group);         ///< relative to what is open
    static void beginGroupAbsolute(const QString &group); ///< at the root of the file
    static void endGroup(); ///< closes the innermost group; warns when none is open

    /** The value in the open group, or \a defaultValue. Numbers and flags may come back as their texts. */
    static QVariant value(const QString &key, const QVariant &defaultValue = QVariant());
    /** Stores a value; a real change is announced by signalValuesModified() once no group is open. */
    static void setValue(const QString &key, const QVariant &value);
    static bool contains(const QString &key); ///< whether the open group has a value
    /** Keys of the values that lie directly in the open group, sorted. */
    static QStringList childKeys();
    /** Removes a value and the group of the same name; an empty \a key empties the open group. */
    static void remove(const QString &key);

    /** English name of the system's language as the translation files use it: "German", "ChineseSimple". */
    static QString getSystemLanguageName();
    /** The same for any locale; "English" for a language without a translation. */
    static QString getLanguageName(const QLocale &locale);

    static QString getProgramName();    ///< for reports and windows
    static QString getProgramVersion(); ///< as text, e.g. "1.2.0"
    static QString getVendor();         ///< who makes the program
    /** What the three getters above answer; empty texts fall back to QCoreApplication's. */
    static void setProgramInfo(const QString &name, const QString &version, const QString &vendor);

    /**
     * Writes pending changes, forgets all values and uses another INI file; an empty path keeps everything in
     * memory only. Emits signalProfileChanged(), as all values may differ. Not inside an open group.
     *
     * At first it is the environment variable STATREPORT_SETTINGS if set, else "StatReport/settings.ini" in
     * the user's configuration folder.
     */
    void setStoragePath(const QString &path);
    QString storagePath() const { return m_path; } ///< empty while in memory only
    /** Writes pending changes to the file; false when it cannot be written (the changes stay pending). */
    bool sync();

    /** Profile names, sorted; the default profile has an empty name and is always there. */
    QStringList profiles() const;
    QString currentProfile() const; ///< empty for the default profile
    /**
     * Switches to a profile, which need not have values yet; emits signalProfileChanged() on a change. Groups
     * that are open stay in the profile they were opened in.
     */
    void setCurrentProfile(const QString &profile);

signals:
    /** Keys without their groups, each once per group, and their new values (invalid for a removed one). */
    void signalValuesModified(QStringList aKeys, QList<QVariant> aVals);
    void signalProfileChanged(); ///< any value may be another one now

private slots:
    void slotAboutToQuit();
    void slotSyncSoon();

private:
    struct Change
    {
        QString fullKey;
        QString key;
        QVariant before;
    };

    ZtAppSettings();
    ~ZtAppSettings() override;

    void ensureLoaded() const;
    void load();
    void setAside(const QString &path);
    void selectProfile(const QString &profile);
    const QString &prefix() const;
    QString fullKey(const QString &key) const;
    void store(const QString &fullKey, const QString &key, const QVariant &value);
    void noteUnsaved(const QString &fullKey);
    void announceModified();

    QString m_path;
    QString m_profile;
    QString m_profilePrefix;
    QStringList m_groups; ///< full prefixes of the open groups with a slash at the end, innermost last
    QHash<QString, QVariant> m_values;
    QVector<Change> m_changes; ///< not announced yet, each full key once
    QSet<QString> m_unsaved;   ///< full keys that the file does not have yet, or still has
    bool m_loaded = false;
    bool m_writable = true;
    bool m_syncIsDue = false;     ///< slotSyncSoon() will come
    bool m_hasSyncFailed = false; ///< the last sync(); said once, not after every change
    QString m_programName;
    QString m_programVersion;
    QString m_vendor;
};
