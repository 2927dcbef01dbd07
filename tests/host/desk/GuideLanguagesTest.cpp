// SPDX-License-Identifier: MIT
#include "GuideFile.h"
#include "KvDeskGuideText.h"
#include "KvDeskLanguages.h"

#include <QRegularExpression>

/** The user guides of all languages: alike in everything but their words. */
class GuideLanguagesTest : public StatReportTest
{
    Q_OBJECT

private slots:
    void seesDifferences_data();
    void seesDifferences();
    void seesDeadLinks();
    void everyLanguageHasAGuide();
    void everyGuideIsAsTheEnglishOne_data();
    void everyGuideIsAsTheEnglishOne();
    void everyLinkHasItsPlace_data();
    void everyLinkHasItsPlace();
};

namespace {

QString read(const QString &path)
{
    QFile file(path);
    return file.open(QIODevice::ReadOnly) ? QString::fromUtf8(file.readAll()) : QString();
}

QString guideIn(const QString &language)
{
    const QString part = language == QLatin1String("English") ? QString() : QLatin1Char('.') + language;
    return StatReportTest::sourcePath(QStringLiteral("docs/user-guide%1.md").arg(part));
}

QStringList captures(const QString &text, const char *pattern)
{
    const QRegularExpression expression(QLatin1String(pattern), QRegularExpression::MultilineOption);
    QStringList found;
    QRegularExpressionMatchIterator it = expression.globalMatch(text);
    while (it.hasNext())
        found.append(it.next().captured(1));
    return found;
}

/// What is no code: "#" begins a comment in that, and "|" is a pipe.
QString prose(const QString &markdown)
{
    static const QRegularExpression block(QStringLiteral("^```.*?^```$"),
                                          QRegularExpression::MultilineOption |
                                              QRegularExpression::DotMatchesEverythingOption);
    return QString(markdown).remove(block);
}

/// Cells of every row of the tables.
QStringList rows(const QString &text)
{
    QStringList counts;
    for (const QString &row : captures(text, "^(\\|.*\\|) *$"))
        counts.append(QString::number(row.count(QLatin1Char('|')) - row.count(QLatin1String("\\|"))));
    return counts;
}

/// Links to headings have other words in each language.
QStringList links(const QString &text)
{
    QStringList targets = captures(text, "(?<!!)\\[[^]]*\\]\\(([^)#]*)(?:#[^)]*)?\\)");
    targets.sort();
    return targets;
}

/// What a guide is made of, by name.
QMap<QString, QStringList> partsOf(const QString &markdown)
{
    const QString text = prose(markdown);
    return {{QStringLiteral("headings"), captures(text, "^(#+) ")},
            {QStringLiteral("pictures"), captures(text, "^!\\[[^]]+\\]\\(([^)]+)\\)$")},
            {QStringLiteral("code blocks"), captures(markdown, "^(```)")},
            {QStringLiteral("rows"), rows(text)},
            {QStringLiteral("links"), links(text)}};
}

/// The parts that two guides do not have alike.
QStringList differences(const QString &original, const QString &translation)
{
    const QMap<QString, QStringList> first = partsOf(original);
    const QMap<QString, QStringList> second = partsOf(translation);
    QStringList names;
    for (auto it = first.cbegin(); it != first.cend(); ++it) {
        if (second.value(it.key()) != it.value())
            names.append(it.key());
    }
    return names;
}

/// Links into a guide that lead to none of its headings.
QStringList deadLinks(const QString &path)
{
    QStringList anchors;
    const KvDeskGuideText guide(path);
    for (const KvDeskGuideText::Heading &heading : guide.headings())
        anchors.append(heading.anchor);
    QStringList dead;
    for (const QString &anchor : captures(prose(read(path)), "\\]\\(#([^)]*)\\)")) {
        if (!anchors.contains(anchor))
            dead.append(anchor);
    }
    return dead;
}

void addLanguages(bool isWithEnglish)
{
    QTest::addColumn<QString>("path");
    for (const KvDeskLanguage &language : KvDeskLanguages::all()) {
        const bool isEnglish = language.name == QLatin1String("English");
        if (QFileInfo::exists(guideIn(language.name)) && (isWithEnglish || !isEnglish))
            QTest::newRow(qPrintable(language.name)) << guideIn(language.name);
    }
}

} // namespace

void GuideLanguagesTest::seesDifferences_data()
{
    QTest::addColumn<QString>("translation");
    QTest::addColumn<QStringList>("names");
    const QString good =
        QStringLiteral("# Anleitung\n\n## Kapitel\n\n![Bild](a.png)\n\n[hier](#kapitel) [dort](b.md#x)\n\n"
                       "| a | b |\n|---|---|\n| `\\|` | d |\n\n```\n# program | more\n```\n");
    const auto row = [&good](const char *name, const char *before, const char *after,
                             const QStringList &names) {
        QString text = good;
        QVERIFY(*before == '\0' || text.contains(QLatin1String(before)));
        QTest::newRow(name) << text.replace(QLatin1String(before), QLatin1String(after)) << names;
    };
    row("alike", "Kapitel", "Abschnitt", {});
    row("another level", "## Kapitel", "### Kapitel", {QStringLiteral("headings")});
    row("a heading more", "## Kapitel", "## Kapitel\n\n## Noch eins", {QStringLiteral("headings")});
    row("another picture", "a.png", "b.png", {QStringLiteral("pictures")});
    row("no code block", "```\n# program | more\n```\n", "", {QStringLiteral("code blocks")});
    row("a row less", "| `\\|` | d |\n", "", {QStringLiteral("rows")});
    row("a cell less", "| a | b |", "| a |", {QStringLiteral("rows")});
    row("a link less", "[hier](#kapitel)", "hier", {QStringLiteral("links")});
    row("another file", "b.md", "c.md", {QStringLiteral("links")});
}

void GuideLanguagesTest::seesDifferences()
{
    QFETCH(QString, translation);
    const QString original =
        QStringLiteral("# Guide\n\n## Chapter\n\n![Picture](a.png)\n\n[here](#chapter) [there](b.md#y)\n\n"
                       "| k | l |\n|---|---|\n| `\\|` | n |\n\n```\n# program | more\n```\n");
    QTEST(differences(original, translation), "names");
}

void GuideLanguagesTest::seesDeadLinks()
{
    const QString path = temporaryPath(QStringLiteral("user-guide.Russian.md"));
    QFile file(path);
    QVERIFY(file.open(QIODevice::WriteOnly));
    file.write(QStringLiteral("# Первая глава\n\n[есть](#первая-глава) [нет](#вторая-глава)\n").toUtf8());
    file.close();
    QCOMPARE(deadLinks(path), QStringList(QStringLiteral("вторая-глава")));
}

void GuideLanguagesTest::everyLanguageHasAGuide()
{
    for (const KvDeskLanguage &language : KvDeskLanguages::all())
        QVERIFY2(QFileInfo(guideIn(language.name)).size() > 0, qPrintable(language.name));
}

void GuideLanguagesTest::everyGuideIsAsTheEnglishOne_data()
{
    addLanguages(false);
}

void GuideLanguagesTest::everyGuideIsAsTheEnglishOne()
{
    QFETCH(QString, path);
    const QStringList names = differences(read(guideIn(QStringLiteral("English"))), read(path));
    QVERIFY2(names.isEmpty(), qPrintable(names.join(QLatin1Char(' '))));
}

void GuideLanguagesTest::everyLinkHasItsPlace_data()
{
    addLanguages(true);
}

void GuideLanguagesTest::everyLinkHasItsPlace()
{
    QFETCH(QString, path);
    const QStringList dead = deadLinks(path);
    QVERIFY2(dead.isEmpty(), qPrintable(dead.join(QLatin1Char(' '))));
}

STATREPORT_TEST_MAIN(GuideLanguagesTest)
#include "GuideLanguagesTest.moc"
