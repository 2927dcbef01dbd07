// SPDX-License-Identifier: MIT
#include "common/ZtAppStatus.h"

#include <QtGlobal>

ZtStatusLog::ZtStatusLog()
{
    qRegisterMetaType<ZtStatusEntry>("ZtStatusEntry");
}

ZtStatusLog *ZtStatusLog::getInstance()
{
    static ZtStatusLog instance;
    return &instance;
}

void ZtStatusLog::clear()
{
    if (m_entries.isEmpty())
        return;

    m_entries.clear();
    emit signalCleared();
}

void ZtStatusLog::setCapacity(int count)
{
    m_capacity = qMax(1, count);
    trim();
}

void ZtStatusLog::append(const ZtStatusEntry &entry)
{
    m_entries.append(entry);
    trim();
    emit signalEntryLogged(entry);
}

void ZtStatusLog::trim()
{
    const int surplus = m_entries.size() - m_capacity;
    if (surplus > 0)
        m_entries.remove(0, surplus);
}

ZtAppStatus::ZtAppStatus(int category, int code)
    : m_category(category)
    , m_code(code)
{}

void ZtAppStatus::setAndLogStatus(int category, int code, const QString &message, const QString &source)
{
    m_category = category;
    m_code = code;
    m_message = message;

    ZtStatusEntry entry;
    entry.time = QDateTime::currentDateTime();
    entry.category = category;
    entry.code = code;
    entry.destination = m_destination;
    entry.message = message;
    entry.source = source;
    ZtStatusLog::getInstance()->append(entry);
}
