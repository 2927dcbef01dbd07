// SPDX-License-Identifier: MIT
#include "KvStatsReport.h"

#include "data/KvStatisticsEngine.h"
#include "data/KvStatisticsUnitConverter.h"
#include "measuring/ZtMeasuringDocument.h"
#include "measuring/ZtUnit.h"

#include <QJsonArray>
#include <QJsonDocument>
#include <QJsonObject>
#include <QStringList>

#include <algorithm>
#include <cmath>
#include <functional>
#include <optional>

namespace {

constexpr int kTextDigits = 6;
constexpr int kCsvDigits = 12;

/** How base values become the numbers of a group. */
struct Scale
{
    QString unit;
    std::function<double(double)> convert;
};

/** The unit in which tables gave all values of a group; none when they were drawn or given in several units.
 */
std::optional<ZtUnit> givenUnit(const ZtMeasuringDocument &document, const KvValueGroup &group)
{
    std::optional<ZtUnit> common;
    QString typeName;
    for (const KvMeasuredValue &record : group) {
        if (!common || record.objectTypeName != typeName) {
            typeName = record.objectTypeName;
            const std::optional<ZtUnit> unit = document.importedUnit(typeName, record.valueName);
            if (!unit || (common && *unit != *common))
                return std::nullopt;
            common = unit;
        }
        // A value may have another unit than its column; its text tells.
        if (!common->isEmpty() && !record.valueText.endsWith(QLatin1Char(' ') + common->text()))
            return std::nullopt;
    }
    return common;
}

Scale scaleOf(const ZtMeasuringDocument &document, const KvValueGroup &group)
{
    const int kind = group.first().measureKind;
    if (const std::optional<ZtUnit> unit = givenUnit(document, group)) {
        const double factor = unit->factor();
        return {unit->text(), [factor](double value) { return value / factor; }};
    }
    const QPair<QVariant, QVariant> range = KvStatisticsEngine::range(group);
    const int unit = KvStatisticsUnitConverter::commonUnit(
        KvStatisticsEngine::numericValue(range.first), KvStatisticsEngine::numericValue(range.second), kind);
    return {KvStatisticsUnitConverter::unitText(unit),
            [kind, unit](double value) { return KvStatisticsUnitConverter::convert(value, kind, unit); }};
}

QString number(double value, int digits)
{
    return QString::number(value, 'g', digits);
}

// Fixed notation with as many decimals as the digits need: a column of "1e+06" is hard to read.
QString readableNumber(double value)
{
    if (!std::isfinite(value) || value == 0.0)
        return QString::number(value);
    const int before = static_cast<int>(std::floor(std::log10(std::abs(value)))) + 1;
    if (before > 15 || before < -9)
        return number(value, kTextDigits);
    QString text = QString::number(value, 'f', std::max(kTextDigits - before, 0));
    while (text.contains(QLatin1Char('.')) &&
           (text.endsWith(QLatin1Char('0')) || text.endsWith(QLatin1Char('.')))) {
        const bool isPoint = text.endsWith(QLatin1Char('.'));
        text.chop(1);
        if (isPoint)
            break;
    }
    return text;
}

bool isWide(QChar character)
{
    switch (character.script()) {
    case QChar::Script_Han:
    case QChar::Script_Hiragana:
    case QChar::Script_Katakana:
    case QChar::Script_Hangul:
    case QChar::Script_Bopomofo:
        return true;
    default:
        return false;
    }
}

// How many columns of a terminal a text takes: characters of East Asian scripts take two.
int columnsOf(const QString &text)
{
    return text.size() + static_cast<int>(std::count_if(text.begin(), text.end(), isWide));
}

QString csvField(const QString &text)
{
    const bool needsQuotes = text.contains(QLatin1Char(',')) || text.contains(QLatin1Char('"')) ||
                             text.contains(QLatin1Char('\n')) || text.contains(QLatin1Char('\r'));
    if (!needsQuotes)
        return text;
    QString quoted = text;
    quoted.replace(QLatin1Char('"'), QLatin1String("\"\""));
    return QLatin1Char('"') + quoted + QLatin1Char('"');
}

// Translated for people only: programs know the columns of CSV by these names.
constexpr const char *kHeadings[] = {
    QT_TRANSLATE_NOOP("KvStatsReport", "Object Type"), QT_TRANSLATE_NOOP("KvStatsReport", "Measurement Type"),
    QT_TRANSLATE_NOOP("KvStatsReport", "Unit"),        QT_TRANSLATE_NOOP("KvStatsReport", "Count"),
    QT_TRANSLATE_NOOP("KvStatsReport", "Min"),         QT_TRANSLATE_NOOP("KvStatsReport", "Max"),
    QT_TRANSLATE_NOOP("KvStatsReport", "Average"),     QT_TRANSLATE_NOOP("KvStatsReport", "Sigma"),
    QT_TRANSLATE_NOOP("KvStatsReport", "3 Sigma"),     QT_TRANSLATE_NOOP("KvStatsReport", "6 Sigma")};

enum class Reader { Person, Program };

QStringList headings(bool groupByObject, Reader reader)
{
    QStringList names;
    for (const char *heading : kHeadings)
        names.append(reader == Reader::Person ? KvStatsReport::tr(heading) : QString::fromLatin1(heading));
    if (!groupByObject)
        names.removeFirst();
    return names;
}

QStringList fields(const KvGroupStatistics &group, bool groupByObject,
                   const std::function<QString(double)> &format)
{
    QStringList texts;
    if (groupByObject)
        texts.append(group.objectType);
    texts << group.valueName << group.unit << QString::number(group.count);
    for (const double value :
         {group.min, group.max, group.average, group.sigma, 3 * group.sigma, 6 * group.sigma})
        texts.append(format(value));
    return texts;
}

} // namespace

KvStatsReport::KvStatsReport(const KvStatisticsEngine &engine, const ZtMeasuringDocument &document,
                             bool groupByObject)
    : m_groupByObject(groupByObject)
{
    if (!groupByObject) {
        for (const QString &valueName : engine.valueNames())
            addGroup(engine, document, QString(), valueName);
        return;
    }
    for (const QString &objectType : engine.objectTypeNames()) {
        for (const QString &valueName : engine.valueNames(objectType))
            addGroup(engine, document, objectType, valueName);
    }
}

void KvStatsReport::addGroup(const KvStatisticsEngine &engine, const ZtMeasuringDocument &document,
                             const QString &objectType, const QString &valueName)
{
    const KvValueGroup &values =
        m_groupByObject ? engine.values(objectType, valueName) : engine.values(valueName);
    KvGroupStatistics group;
    if (!KvStatisticsEngine::fiveNumbers(values, group.min, group.q1, group.median, group.q3, group.max))
        return;
    group.objectType = objectType;
    group.valueName = valueName;
    group.count = values.size();
    group.average = KvStatisticsEngine::average(values);
    group.sigma = KvStatisticsEngine::sigma(group.average, values);

    const int kind = values.first().measureKind;
    const QPair<QVariant, QVariant> range = KvStatisticsEngine::range(values);
    const int automatic = KvStatisticsUnitConverter::AutomaticUnit;
    group.minText = KvStatisticsUnitConverter::formatValue(range.first, kind, automatic);
    group.maxText = KvStatisticsUnitConverter::formatValue(range.second, kind, automatic);
    group.averageText = KvStatisticsUnitConverter::formatValue(group.average, kind, automatic);
    group.sigmaText = KvStatisticsUnitConverter::formatValue(group.sigma, kind, automatic);

    const Scale scale = scaleOf(document, values);
    group.unit = scale.unit;
    for (double *value :
         {&group.min, &group.q1, &group.median, &group.q3, &group.max, &group.average, &group.sigma})
        *value = scale.convert(*value);
    m_groups.append(group);
}

QString KvStatsReport::toText() const
{
    QVector<QStringList> rows{headings(m_groupByObject, Reader::Person)};
    for (const KvGroupStatistics &group : m_groups)
        rows.append(fields(group, m_groupByObject, readableNumber));
    const int textColumns = m_groupByObject ? 3 : 2;
    QVector<int> widths(rows.first().size(), 0);
    for (const QStringList &row : qAsConst(rows)) {
        for (int i = 0; i < row.size(); ++i)
            widths[i] = std::max(widths.at(i), columnsOf(row.at(i)));
    }
    QString text;
    for (const QStringList &row : qAsConst(rows)) {
        QString line;
        for (int i = 0; i < row.size(); ++i) {
            const QString blanks(widths.at(i) - columnsOf(row.at(i)), QLatin1Char(' '));
            line += i < textColumns ? row.at(i) + blanks : blanks + row.at(i);
            line += QLatin1String("  ");
        }
        text += line.trimmed() + QLatin1Char('\n');
    }
    return text;
}

QString KvStatsReport::toCsv() const
{
    const auto format = [](double value) { return number(value, kCsvDigits); };
    QString text = headings(m_groupByObject, Reader::Program).join(QLatin1Char(',')) + QLatin1Char('\n');
    for (const KvGroupStatistics &group : m_groups) {
        QStringList texts = fields(group, m_groupByObject, format);
        for (QString &field : texts)
            field = csvField(field);
        text += texts.join(QLatin1Char(',')) + QLatin1Char('\n');
    }
    return text;
}

QByteArray KvStatsReport::toJson() const
{
    QJsonArray groups;
    for (const KvGroupStatistics &group : m_groups) {
        QJsonObject object{
            {QStringLiteral("measurementType"), group.valueName},
            {QStringLiteral("unit"), group.unit},
            {QStringLiteral("count"), group.count},
            {QStringLiteral("min"), group.min},
            {QStringLiteral("lowerQuartile"), group.q1},
            {QStringLiteral("median"), group.median},
            {QStringLiteral("upperQuartile"), group.q3},
            {QStringLiteral("max"), group.max},
            {QStringLiteral("average"), group.average},
            {QStringLiteral("sigma"), group.sigma},
            {QStringLiteral("sigma3"), 3 * group.sigma},
            {QStringLiteral("sigma6"), 6 * group.sigma},
            {QStringLiteral("texts"), QJsonObject{{QStringLiteral("Min"), group.minText},
                                                  {QStringLiteral("Max"), group.maxText},
                                                  {QStringLiteral("Average"), group.averageText},
                                                  {QStringLiteral("Sigma"), group.sigmaText}}}};
        if (m_groupByObject)
            object.insert(QStringLiteral("objectType"), group.objectType);
        groups.append(object);
    }
    const QJsonObject root{{QStringLiteral("groupBy"),
                            m_groupByObject ? QStringLiteral("object") : QStringLiteral("measurement")},
                           {QStringLiteral("groups"), groups}};
    return QJsonDocument(root).toJson();
}
