// SPDX-License-Identifier: MIT
#include "KvDeskTranslation.h"

#include "KvDeskLanguages.h"
#include "gui/QtAdvancedStylesheet.h"

#include <QGuiApplication>
#include <QLibraryInfo>

namespace {

/// Qt's own texts on buttons of dialogs, which are English where Qt's translations are not installed.
[[maybe_unused]] constexpr const char *buttonTexts[] = {
    QT_TRANSLATE_NOOP("QPlatformTheme", "OK"),      QT_TRANSLATE_NOOP("QPlatformTheme", "Cancel"),
    QT_TRANSLATE_NOOP("QPlatformTheme", "Apply"),   QT_TRANSLATE_NOOP("QPlatformTheme", "Save"),
    QT_TRANSLATE_NOOP("QPlatformTheme", "Open"),    QT_TRANSLATE_NOOP("QPlatformTheme", "Close"),
    QT_TRANSLATE_NOOP("QPlatformTheme", "Discard"), QT_TRANSLATE_NOOP("QPlatformTheme", "&Yes"),
    QT_TRANSLATE_NOOP("QPlatformTheme", "&No")};

/// Qt takes the direction of the layout from a translated text, anew whenever a translator is installed, be
/// it one of a plug-in. Its own translations, which hold that text, need not be there.
class DirectionTranslator : public QTranslator
{
public:
    explicit DirectionTranslator(Qt::LayoutDirection direction)
        : m_direction(direction == Qt::RightToLeft ? QStringLiteral("RTL") : QStringLiteral("LTR"))
    {}

    bool isEmpty() const override { return false; }
    QString translate(const char *context, const char *sourceText, const char *disambiguation,
                      int n) const override
    {
        Q_UNUSED(context)
        Q_UNUSED(disambiguation)
        Q_UNUSED(n)
        return QLatin1String(sourceText) == QLatin1String("QT_LAYOUT_DIRECTION") ? m_direction : QString();
    }

private:
    QString m_direction;
};

} // namespace

KvDeskTranslation::KvDeskTranslation(const QString &language)
    : m_isLoaded(m_program.load(QStringLiteral(":/measuringdesk/%1.qm").arg(language)))
{
    const QLocale locale = KvDeskLanguages::localeOf(language);
    const QString folder = QLibraryInfo::location(QLibraryInfo::TranslationsPath);
    if (m_qt.load(locale, QStringLiteral("qtbase"), QStringLiteral("_"), folder))
        QCoreApplication::installTranslator(&m_qt);
    if (m_isLoaded)
        QCoreApplication::installTranslator(&m_program);
    m_direction = std::make_unique<DirectionTranslator>(locale.textDirection());
    QCoreApplication::installTranslator(m_direction.get());
    QGuiApplication::setLayoutDirection(locale.textDirection());
    acss::QtAdvancedStylesheet::getInstance()->setLanguage(locale);
}

KvDeskTranslation::~KvDeskTranslation()
{
    // Not installed, they are none of the application's translators: removing those does nothing.
    QCoreApplication::removeTranslator(m_direction.get());
    QCoreApplication::removeTranslator(&m_program);
    QCoreApplication::removeTranslator(&m_qt);
}
