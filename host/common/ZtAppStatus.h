// SPDX-License-Identifier: MIT
#pragma once

#include "common/ZtCommonGlobal.h"

#include <QDateTime>
#include <QObject>
#include <QString>
#include <QVector>

/** One line of the status log. */
struct ZtStatusEntry
{
    QDateTime time;      ///< when it was logged, local time
    int category = 0;    ///< ZtAppStatus::Category, or a number of the caller's own
    int code = 0;        ///< caller's code inside the category, 0 when it has none
    int destination = 0; ///< ZtAppStatus::Destination preferred by the caller
    QString message;     ///< translated text for the user
    QString source;      ///< "Class::method" that reported it
};

Q_DECLARE_TYPEINFO(ZtStatusEntry, Q_MOVABLE_TYPE);

/** The process-wide status log: every status set through ZtAppStatus, oldest first. GUI thread only. */
class ZT_COMMON_EXPORT ZtStatusLog : public QObject
{
    Q_OBJECT
public:
    static ZtStatusLog *getInstance(); ///< made at the first call

    const QVector<ZtStatusEntry> &entries() const { return m_entries; } ///< oldest first
    void clear();                                                       ///< emits signalCleared()

    /** The log keeps the newest \a count entries (1 at least; 10000 at first). */
    void setCapacity(int count);

signals:
    void signalEntryLogged(const ZtStatusEntry &aEntry); ///< an entry was appended
    void signalCleared();                                ///< the log was emptied

private:
    friend class ZtAppStatus;
    ZtStatusLog();
    void append(const ZtStatusEntry &entry);
    void trim();

    QVector<ZtStatusEntry> m_entries;
    int m_capacity = 10000;
};

/**
 * A status to report to the user through the host's status log.
 *
 * Created on the stack where something is to be said; setAndLogStatus() writes it to ZtStatusLog, which the
 * application shows. The numbers of Category and Destination are part of the binary contract with plug-ins.
 */
class ZT_COMMON_EXPORT ZtAppStatus
{
public:
    /** How grave a status is. */
    enum Category { NoCategory = 0, Information = 1, Warning = 2, Error = 3 };
    /** Where a status is best shown. */
    enum Destination { AnyDestination = 0, LogFile = 1, StatusBar = 2, MessageBox = 3, StatusPanel = 4 };

    explicit ZtAppStatus(int category = NoCategory, int code = 0); ///< logs nothing yet

    int category() const { return m_category; }                ///< Category, or the caller's own
    int code() const { return m_code; }                        ///< of the caller, 0 for none
    int preferredDestination() const { return m_destination; } ///< Destination
    QString message() const { return m_message; }              ///< translated, of the last status logged

    /** Where the caller would like the user to see the status; the host may show it elsewhere too. */
    void setPreferredDestination(int destination) { m_destination = destination; }

    /**
     * Replaces category, code and message and appends one entry to the status log. \a source is
     * "Class::method".
     */
    void setAndLogStatus(int category, int code, const QString &message, const QString &source);

private:
    int m_category;
    int m_code;
    int m_destination = AnyDestination;
    QString m_message;
};

Q_DECLARE_METATYPE(ZtStatusEntry)
