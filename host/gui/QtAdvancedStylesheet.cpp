// SPDX-License-Identifier: MIT
#include "gui/QtAdvancedStylesheet.h"

#include "gui/ApplicationStyle.h"

#include <QApplication>
#include <QFile>
#include <QFont>
#include <QLocale>
#include <QRegularExpression>

namespace acss {

namespace {

const QLatin1String darkTheme("Dark");
const QLatin1String lightTheme("Light");
const QLatin1String bodyFont("Segoe UI");
constexpr int bodyPixelSize = 13;

struct Token
{
    const char *name;
    QRgb dark;
    QRgb light;
};

constexpr QRgb opaque(QRgb rgb)
{
    return 0xff000000U | rgb;
}

/// The opacity of what is disabled: 40 %.
constexpr QRgb disabled(QRgb rgb)
{
    return 0x66000000U | rgb;
}

constexpr Token tokens[] = {
    {"window", opaque(0x1f2123), opaque(0xf3f4f5)},
    {"panel", opaque(0x262626), opaque(0xffffff)},
    {"raised", opaque(0x313131), opaque(0xffffff)},
    {"raised-hover", opaque(0x3d3d3d), opaque(0xf0f6fa)},
    {"raised-pressed", opaque(0x262626), opaque(0xdde8ef)},
    {"line", opaque(0x4d4d4d), opaque(0xdcdcdc)},
    {"text", opaque(0xf0f0f1), opaque(0x141414)},
    {"text-disabled", disabled(0xf0f0f1), disabled(0x141414)},
    {"muted", opaque(0xb4b7ba), opaque(0x5b5f63)},
    {"accent", opaque(0x00659d), opaque(0x00659d)},
    {"accent-hover", opaque(0x0a7cbb), opaque(0x0a7cbb)},
    {"accent-pressed", opaque(0x004f7c), opaque(0x004f7c)},
    {"accent-disabled", disabled(0x00659d), disabled(0x00659d)},
    {"on-accent", opaque(0xffffff), opaque(0xffffff)},
    {"on-accent-disabled", disabled(0xffffff), disabled(0xffffff)},
    {"danger", opaque(0xf0b1b5), opaque(0xf0b1b5)},
    {"danger-hover", opaque(0xa61d24), opaque(0xa61d24)},
    {"danger-pressed", opaque(0xe84749), opaque(0xe84749)},
    {"on-danger-pressed", opaque(0x141414), opaque(0x141414)},
    {"error", opaque(0xf0b1b5), opaque(0xa61d24)},
    {"ok", opaque(0x60bd65), opaque(0x226a25)},
    {"warning", opaque(0xffc107), opaque(0x936600)},
};

QString cssColor(const QColor &color)
{
    if (color.alpha() == 255)
        return color.name();
    return QStringLiteral("rgba(%1, %2, %3, %4)")
        .arg(QString::number(color.red()), QString::number(color.green()), QString::number(color.blue()),
             QString::number(color.alpha()));
}

QStringList freeFonts()
{
    return {QStringLiteral("Open Sans"), QStringLiteral("Noto Sans"), QStringLiteral("DejaVu Sans")};
}

/// One character of Chinese origin has several forms; a font of its own has those of each language.
QString hanFont(const QLocale &language)
{
    switch (language.language()) {
    case QLocale::Japanese:
        return QStringLiteral("Noto Sans CJK JP");
    case QLocale::Korean:
        return QStringLiteral("Noto Sans CJK KR");
    case QLocale::Chinese:
        return language.script() == QLocale::TraditionalHanScript ? QStringLiteral("Noto Sans CJK TC")
                                                                  : QStringLiteral("Noto Sans CJK SC");
    default:
        return QString();
    }
}

QString templateText()
{
    QFile file(QStringLiteral(":/acss/application.qss"));
    return file.open(QIODevice::ReadOnly) ? QString::fromUtf8(file.readAll()) : QString();
}

} // namespace

QtAdvancedStylesheet::QtAdvancedStylesheet()
    : m_theme(darkTheme)
    , m_bodyFamilies({bodyFont})
{}

QtAdvancedStylesheet *QtAdvancedStylesheet::getInstance()
{
    static QtAdvancedStylesheet instance;
    return &instance;
}

QStringList QtAdvancedStylesheet::themes() const
{
    return {darkTheme, lightTheme};
}

bool QtAdvancedStylesheet::setCurrentTheme(const QString &theme)
{
    if (!themes().contains(theme))
        return false;
    if (theme == m_theme)
        return true;

    m_theme = theme;
    emit currentThemeChanged(m_theme);
    return true;
}

void QtAdvancedStylesheet::setLanguage(const QLocale &language)
{
    const QString han = hanFont(language);
    m_bodyFamilies = QStringList(bodyFont);
    // Behind all that Latin letters may come from.
    if (!han.isEmpty())
        m_bodyFamilies << freeFonts() << han;
}

QColor QtAdvancedStylesheet::color(const QString &token) const
{
    for (const Token &known : tokens) {
        if (token == QLatin1String(known.name))
            return QColor::fromRgba(m_theme == darkTheme ? known.dark : known.light);
    }
    return QColor();
}

QString QtAdvancedStylesheet::styleSheet() const
{
    static const QRegularExpression placeholder(QStringLiteral("\\{\\{([A-Za-z-]+)\\}\\}"));
    const QString text = templateText();
    QString result;
    result.reserve(text.size());
    int copied = 0;
    QRegularExpressionMatchIterator matches = placeholder.globalMatch(text);
    while (matches.hasNext()) {
        const QRegularExpressionMatch match = matches.next();
        result += text.midRef(copied, match.capturedStart() - copied);
        result += placeholderText(match.captured(1));
        copied = match.capturedEnd();
    }
    result += text.midRef(copied);
    return result;
}

QPalette QtAdvancedStylesheet::palette() const
{
    const auto named = [this](const char *token) { return color(QLatin1String(token)); };
    QPalette palette(named("text"), named("raised"), named("raised-hover"), named("line"), named("line"),
                     named("text"), named("on-accent"), named("raised"), named("window"));
    palette.setColor(QPalette::AlternateBase, named("panel"));
    palette.setColor(QPalette::ToolTipBase, named("raised"));
    palette.setColor(QPalette::ToolTipText, named("text"));
    palette.setColor(QPalette::PlaceholderText, named("muted"));
    palette.setColor(QPalette::Highlight, named("accent"));
    palette.setColor(QPalette::HighlightedText, named("on-accent"));
    palette.setColor(QPalette::Link, named("accent-hover"));
    palette.setColor(QPalette::LinkVisited, named("accent-hover"));
    for (const QPalette::ColorRole role :
         {QPalette::WindowText, QPalette::Text, QPalette::ButtonText, QPalette::PlaceholderText})
        palette.setColor(QPalette::Disabled, role, named("text-disabled"));
    palette.setColor(QPalette::Disabled, QPalette::Highlight, named("accent-disabled"));
    palette.setColor(QPalette::Disabled, QPalette::HighlightedText, named("on-accent-disabled"));
    return palette;
}

namespace {

/// Setting a style polishes and lays out every widget anew, which a change of the theme does not need.
void setStyleOnce(QApplication *application)
{
    const char property[] = "acssStyle";
    if (application->property(property).toBool())
        return;
    // A style sheet wraps the style, so the style comes first.
    application->setStyleSheet(QString());
    QApplication::setStyle(new ApplicationStyle);
    application->setProperty(property, true);
}

} // namespace

void QtAdvancedStylesheet::applyTo(QApplication *application) const
{
    if (application == nullptr)
        return;

    substituteFonts();
    QFont font(bodyFont);
    if (m_bodyFamilies.size() > 1) {
        font.setFamilies(m_bodyFamilies);
        // Fonts that differ only in what comes behind the first family share one in memory, and fonts of
        // report pages must not share these.
        font.setStyleStrategy(QFont::PreferQuality);
    }
    font.setPixelSize(bodyPixelSize);
    setStyleOnce(application);
    QApplication::setPalette(palette());
    QApplication::setFont(font);
    application->setStyleSheet(styleSheet());
}

void QtAdvancedStylesheet::substituteFonts()
{
    QFont::insertSubstitutions(bodyFont, freeFonts());
}

QString QtAdvancedStylesheet::placeholderText(const QString &name) const
{
    if (name == QLatin1String("Font"))
        return QLatin1Char('"') + m_bodyFamilies.join(QLatin1String("\", \"")) + QLatin1Char('"');
    if (name == QLatin1String("Theme"))
        return m_theme.toLower();
    return cssColor(color(name));
}

} // namespace acss
