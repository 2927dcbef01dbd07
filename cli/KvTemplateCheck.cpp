// SPDX-License-Identifier: MIT
#include "KvTemplateCheck.h"

#include "measuring/ZtFileFault.h"
#include "templates/KvBaseEditorNodeCfg.h"
#include "templates/KvBaseEditorNodeFactory.h"
#include "templates/KvBlockRegistry.h"
#include "templates/KvReportKeywords.h"

#include <QFile>
#include <QJsonArray>
#include <QJsonDocument>
#include <QJsonObject>
#include <QRegularExpression>

#include <memory>

namespace {

constexpr qint64 kLargestFile = 256LL * 1024 * 1024;

QString typeText(const QJsonValue &value)
{
    switch (value.type()) {
    case QJsonValue::Null:
        return QStringLiteral("null");
    case QJsonValue::Bool:
        return KvTemplateCheck::tr("a boolean");
    case QJsonValue::Double:
        return KvTemplateCheck::tr("a number");
    case QJsonValue::String:
        return KvTemplateCheck::tr("a string");
    case QJsonValue::Array:
        return KvTemplateCheck::tr("an array");
    case QJsonValue::Object:
        return KvTemplateCheck::tr("an object");
    default:
        return KvTemplateCheck::tr("missing");
    }
}

QJsonObject defaultConfig(KvBaseEditorNodeFactory &factory)
{
    const std::unique_ptr<KvBaseEditorNodeCfg> cfg(factory.createConfig(nullptr));
    QJsonObject object;
    cfg->toJson(object);
    return object;
}

bool accepts(KvBaseEditorNodeFactory &factory, const QJsonObject &config)
{
    const std::unique_ptr<KvBaseEditorNodeCfg> cfg(factory.createConfig(nullptr));
    return cfg->fromJson(config);
}

// Why a configuration was refused: the first key that the block would refuse even among its own defaults.
QString refusalOf(const QJsonObject &config, KvBaseEditorNodeFactory &factory)
{
    const QJsonObject defaults = defaultConfig(factory);
    for (auto it = defaults.constBegin(); it != defaults.constEnd(); ++it) {
        const QJsonValue value = config.value(it.key());
        QJsonObject probe = defaults;
        probe[it.key()] = value; // takes the key away where the value is undefined
        if (accepts(factory, probe))
            continue;
        if (value.isUndefined())
            return KvTemplateCheck::tr("\"%1\" is missing").arg(it.key());
        if (value.type() != it.value().type())
            return KvTemplateCheck::tr("\"%1\" is %2, not %3")
                .arg(it.key(), typeText(value), typeText(it.value()));
        return KvTemplateCheck::tr("\"%1\" has a value that the block refuses").arg(it.key());
    }
    return KvTemplateCheck::tr("the block refuses its settings");
}

} // namespace

KvTemplateCheck::KvTemplateCheck(const KvBlockRegistry &blocks)
    : m_blocks(blocks)
{}

bool KvTemplateCheck::run(const QString &path, const QString &displayName)
{
    m_fault = ZtFault();
    m_fault.file = displayName;
    m_contents.clear();
    m_warnings.clear();
    QJsonObject root;
    if (!readRoot(path, root))
        return false;
    checkPage(root.value(QStringLiteral("config")));
    for (const char *key : {"header", "footer", "pageNumbering"})
        checkSection(QLatin1String(key), root.value(QLatin1String(key)));
    return checkNodes(root.value(QStringLiteral("nodes")));
}

bool KvTemplateCheck::fail(const QString &place, const QString &message)
{
    m_fault.place = place;
    m_fault.message = message;
    return false;
}

void KvTemplateCheck::warn(const QString &place, const QString &message)
{
    m_warnings.append(place + QStringLiteral(": ") + message);
}

bool KvTemplateCheck::readRoot(const QString &path, QJsonObject &root)
{
    QFile file(path);
    if (!file.open(QIODevice::ReadOnly))
        return fail(QString(), tr("cannot be opened: %1").arg(ZtFileFault::text(file)));
    const QByteArray bytes = file.read(kLargestFile + 1);
    if (file.error() != QFileDevice::NoError)
        return fail(QString(), tr("cannot be read: %1").arg(ZtFileFault::text(file)));
    if (bytes.size() > kLargestFile)
        return fail(QString(), tr("is larger than 256 MB"));
    QJsonParseError error;
    const QJsonDocument document = QJsonDocument::fromJson(bytes, &error);
    if (error.error != QJsonParseError::NoError) {
        m_fault.line = bytes.left(error.offset).count('\n') + 1;
        m_fault.column = error.offset - bytes.lastIndexOf('\n', error.offset > 0 ? error.offset - 1 : 0);
        return fail(QString(), tr("is no JSON: %1").arg(error.errorString()));
    }
    if (!document.isObject())
        return fail(QString(), tr("is no template: the JSON document is no object"));
    root = document.object();
    return true;
}

void KvTemplateCheck::checkPage(const QJsonValue &config)
{
    if (!config.isObject()) {
        warn(QStringLiteral("config"), tr("is %1; the page keeps its defaults").arg(typeText(config)));
        return;
    }
    const QJsonValue width = config.toObject().value(QStringLiteral("pageWidth"));
    const int pixels = width.toInt();
    if (!width.isUndefined() && pixels <= 0)
        warn(QStringLiteral("config.pageWidth"), tr("is no whole number of pixels above 0"));
    else if (!width.isUndefined())
        m_contents.append(tr("page width %1 px").arg(pixels));
    const QJsonValue margin = config.toObject().value(QStringLiteral("marginWidth"));
    if (!margin.isUndefined() && (!margin.isDouble() || margin.toDouble() < 0.0 || margin.toDouble() >= 0.5))
        warn(QStringLiteral("config.marginWidth"), tr("is no fraction of the page width from 0 to 0.5"));
}

void KvTemplateCheck::checkSection(const QString &key, const QJsonValue &section)
{
    if (section.isUndefined())
        return;
    if (!section.isObject()) {
        warn(key, tr("is %1, not an object; it is off").arg(typeText(section)));
        return;
    }
    const QJsonValue enabled = section.toObject().value(QStringLiteral("enabled"));
    const QJsonValue text = section.toObject().value(QStringLiteral("text"));
    if (!enabled.isUndefined() && !enabled.isBool())
        warn(key + QStringLiteral(".enabled"), tr("is %1, not a boolean; it is off").arg(typeText(enabled)));
    else if (enabled.toBool() && !text.isString())
        warn(key + QStringLiteral(".text"),
             tr("is %1, not a string; the section is off").arg(typeText(text)));
    else if (enabled.toBool())
        m_contents.append(key);
    checkKeywords(key + QStringLiteral(".text"), text.toString());
}

bool KvTemplateCheck::checkNodes(const QJsonValue &nodes)
{
    if (!nodes.isArray()) {
        warn(QStringLiteral("nodes"), tr("is %1, not an array; there are no blocks").arg(typeText(nodes)));
        return true;
    }
    const QJsonArray array = nodes.toArray();
    for (int i = 0; i < array.size(); ++i) {
        if (!checkNode(QStringLiteral("nodes[%1]").arg(i), array.at(i)))
            return false;
    }
    return true;
}

bool KvTemplateCheck::checkNode(const QString &place, const QJsonValue &node)
{
    const QJsonValue name = node.toObject().value(QStringLiteral("name"));
    if (!name.isString()) {
        warn(place + QStringLiteral(".name"),
             tr("is %1, not a string; the block is skipped").arg(typeText(name)));
        return true;
    }
    if (!m_blocks.find(name.toString())) {
        warn(place, tr("there is no block type \"%1\"; the block is skipped").arg(name.toString()));
        return true;
    }
    return checkConfig(place + QStringLiteral(".config"), name.toString(),
                       node.toObject().value(QStringLiteral("config")));
}

bool KvTemplateCheck::checkConfig(const QString &place, const QString &typeName, const QJsonValue &config)
{
    if (!config.isObject())
        return fail(place, tr("is %1, not an object").arg(typeText(config)));
    KvBaseEditorNodeFactory &factory = *m_blocks.find(typeName);
    const QJsonObject object = config.toObject();
    const QJsonObject defaults = defaultConfig(factory);
    const std::unique_ptr<KvBaseEditorNodeCfg> cfg(factory.createConfig(nullptr));
    if (!cfg->fromJson(object))
        return fail(place, refusalOf(object, factory));
    m_contents.append(tr("block \"%1\"").arg(typeName));
    for (auto it = object.constBegin(); it != object.constEnd(); ++it) {
        const QJsonValue expected = defaults.value(it.key());
        const QString member = place + QLatin1Char('.') + it.key();
        if (!expected.isUndefined() && expected.type() != it.value().type())
            warn(member, tr("is %1, not %2; it is ignored").arg(typeText(it.value()), typeText(expected)));
        checkKeywords(member, it.value().toString());
    }
    return true;
}

void KvTemplateCheck::checkKeywords(const QString &place, const QString &text)
{
    static const QRegularExpression pattern(QStringLiteral("\\$\\{[^{}<>\\s]*\\}"));
    const KvReportKeywords keywords;
    QRegularExpressionMatchIterator matches = pattern.globalMatch(text);
    while (matches.hasNext()) {
        const QString found = matches.next().captured();
        bool isKnown = false;
        for (const KvReportKeyword &keyword : keywords.keywords())
            isKnown = isKnown || keyword.keyword == found;
        if (!isKnown)
            warn(place, tr("unknown keyword %1; it stays as it is").arg(found));
    }
}
