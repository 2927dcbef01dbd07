// SPDX-License-Identifier: MIT
#include "templates/KvReportKeywords.h"

#include "kernel/ZtAppSettings.h"

#include <QDate>
#include <QTime>

KvReportKeywords::KvReportKeywords(QObject *parent)
    : QObject(parent)
    , m_settings(ZtAppSettings::getInstance())
{
    addDateKeywords();
    addProgramKeywords();
}

void KvReportKeywords::addDateKeywords()
{
    m_keywords.append({tr("Creation date (ISO)"), QStringLiteral("${CREATION_DATE_ISO}"),
                       []() { return QDate::currentDate().toString(Qt::ISODate); }});
    m_keywords.append({tr("Creation date (Text)"), QStringLiteral("${CREATION_DATE_TEXT}"),
                       []() { return QDate::currentDate().toString(QStringLiteral("dd MMM yyyy")); }});
    m_keywords.append({tr("Creation time"), QStringLiteral("${CREATION_TIME}"),
                       []() { return QTime::currentTime().toString(QStringLiteral("h:mm:ss")); }});
}

void KvReportKeywords::addProgramKeywords()
{
    const ZtAppSettings *settings = m_settings;
    m_keywords.append({tr("Program name"), QStringLiteral("${PROGRAM_NAME}"),
                       [settings]() { return settings->getProgramName(); }});
    m_keywords.append({tr("Program version"), QStringLiteral("${PROGRAM_VERSION}"),
                       [settings]() { return settings->getProgramVersion(); }});
    m_keywords.append({tr("Program vendor"), QStringLiteral("${PROGRAM_VENDOR}"),
                       [settings]() { return settings->getVendor(); }});
}

void KvReportKeywords::expand(QString &text) const
{
    for (const KvReportKeyword &entry : m_keywords)
        text.replace(entry.keyword, entry.value());
}
