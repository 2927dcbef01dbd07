// SPDX-License-Identifier: MIT
#include "KvCliTranslation.h"

#include <QCoreApplication>
#include <QLibraryInfo>
#include <QLocale>
#include <QTranslator>

KvCliTranslation::KvCliTranslation(const QString &language)
{
    for (const char *product : {"measuringdesk", "statreportingplugin", "statreport"}) {
        auto translator = std::make_unique<QTranslator>();
        if (translator->load(QStringLiteral(":/%1/%2.qm").arg(QLatin1String(product), language)))
            add(std::move(translator));
    }
    // The program's file says which locale it is for.
    if (m_translators.empty())
        return;
    auto qt = std::make_unique<QTranslator>();
    const QString folder = QLibraryInfo::location(QLibraryInfo::TranslationsPath);
    if (qt->load(QLocale(m_translators.back()->language()), QStringLiteral("qtbase"), QStringLiteral("_"),
                 folder))
        add(std::move(qt));
}

KvCliTranslation::~KvCliTranslation()
{
    for (const std::unique_ptr<QTranslator> &translator : m_translators)
        QCoreApplication::removeTranslator(translator.get());
}

void KvCliTranslation::add(std::unique_ptr<QTranslator> translator)
{
    QCoreApplication::installTranslator(translator.get());
    m_translators.push_back(std::move(translator));
}
