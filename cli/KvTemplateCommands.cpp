// SPDX-License-Identifier: MIT
#include "KvTemplateCommands.h"

#include "KvCliArguments.h"
#include "KvCliOutput.h"
#include "KvCliSource.h"
#include "KvTemplateCheck.h"

#include "blocks/KvReportBlocks.h"
#include "templates/KvBaseEditorNodeCfg.h"
#include "templates/KvBaseEditorNodeFactory.h"
#include "templates/KvBlockRegistry.h"

#include <QCoreApplication>
#include <QJsonArray>
#include <QJsonDocument>
#include <QJsonObject>

#include <memory>

namespace {

QJsonObject defaultsOf(KvBaseEditorNodeFactory &factory)
{
    const std::unique_ptr<KvBaseEditorNodeCfg> cfg(factory.createConfig(nullptr));
    QJsonObject object;
    cfg->toJson(object);
    return object;
}

QString valueText(const QJsonValue &value)
{
    const QByteArray wrapped = QJsonDocument(QJsonArray{value}).toJson(QJsonDocument::Compact);
    return QString::fromUtf8(wrapped.mid(1, wrapped.size() - 2));
}

QString blocksText(const KvBlockRegistry &registry)
{
    QString text;
    for (const KvBlockType &type : registry.blockTypes()) {
        text += type.factory->name() + QLatin1Char('\n');
        const QJsonObject defaults = defaultsOf(*type.factory);
        for (auto it = defaults.constBegin(); it != defaults.constEnd(); ++it)
            text += QStringLiteral("    %1 = %2\n").arg(it.key(), valueText(it.value()));
    }
    return text;
}

QByteArray blocksJson(const KvBlockRegistry &registry)
{
    QJsonArray blocks;
    for (const KvBlockType &type : registry.blockTypes()) {
        blocks.append(QJsonObject{{QStringLiteral("name"), type.factory->name()},
                                  {QStringLiteral("title"), type.factory->title()},
                                  {QStringLiteral("config"), defaultsOf(*type.factory)}});
    }
    return QJsonDocument(QJsonObject{{QStringLiteral("blocks"), blocks}}).toJson();
}

} // namespace

namespace KvTemplateCommands {

int check(const KvCliArguments &arguments, const KvCliOutput &output)
{
    KvBlockTypeList registry;
    registerReportBlocks(registry);
    ZtFault fault;
    KvCliSource source;
    if (!source.open(arguments.templatePath, &fault)) {
        output.error(fault);
        return 1;
    }
    KvTemplateCheck check(registry);
    const bool isUsable = check.run(source.path(), source.displayName());
    QString text;
    for (const QString &line : check.contents())
        text += line + QLatin1Char('\n');
    for (const QString &warning : check.warnings())
        text +=
            QCoreApplication::translate("KvTemplateCommands", "warning: %1").arg(warning) + QLatin1Char('\n');
    const bool isWritten = output.result(text);
    if (!isUsable)
        output.error(check.fault());
    return isUsable && isWritten ? 0 : 1;
}

int blocks(const KvCliArguments &arguments, const KvCliOutput &output)
{
    KvBlockTypeList registry;
    registerReportBlocks(registry);
    const bool isWritten = arguments.format == KvCliArguments::Json ? output.result(blocksJson(registry))
                                                                    : output.result(blocksText(registry));
    return isWritten ? 0 : 1;
}

} // namespace KvTemplateCommands
