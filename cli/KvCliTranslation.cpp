// SPDX-License-Identifier: MIT
#include "KvCliTranslation.h"

#include <QCoreApplication>
#include <QLibraryInfo>
#include <QLocale>
#include <QTranslator>

namespace {

std::unique_ptr<QTranslator> loaded(const char *product, const QString &language)
{
    auto translator = std::make_unique<QTranslator>();
    const bool isThere = translator->load(QStringLiteral(":/%1/%2.qm").arg(QLatin1String(product), language));
    return isThere ? std::move(translator) : nullptr;
}

std::unique_ptr<QTranslator> loadedForQt(const QLocale &locale)
{
    auto translator = std::make_unique<QTranslator>();
    const bool isThere = translator->load(locale, QStringLiteral("qtbase"), QStringLiteral("_"),
                                          QLibraryInfo::location(QLibraryInfo::TranslationsPath));
    return isThere ? std::move(translator) : nullptr;
}

} // namespace

KvCliTranslation::KvCliTranslation(const QString &language)
{
    std::unique_ptr<QTranslator> own = loaded("statreport", language);
    if (!own)
        return;
    // The one that is added last is asked first.
    add(loadedForQt(QLocale(own->language())));
    add(loaded("measuringdesk", language));
    add(loaded("statreportingplugin", language));
    add(std::move(own));
}

KvCliTranslation::~KvCliTranslation()
{
    for (const std::unique_ptr<QTranslator> &translator : m_translators)
        QCoreApplication::removeTranslator(translator.get());
}

void KvCliTranslation::add(std::unique_ptr<QTranslator> translator)
{
    if (!translator)
        return;
    QCoreApplication::installTranslator(translator.get());
    m_translators.push_back(std::move(translator));
}
