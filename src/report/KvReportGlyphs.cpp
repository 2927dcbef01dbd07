// SPDX-License-Identifier: MIT
#include "report/KvReportGlyphs.h"

#include "common/ZtAppStatus.h"
#include "data/KvReportKernelData.h"
#include "gui/ZtFontCoverage.h"
#include "report/KvReportNode.h"
#include "templates/KvBaseEditorNodeCfg.h"
#include "templates/KvPageSectionsCfg.h"
#include "templates/KvTemplateModel.h"

#include <QFont>
#include <QJsonObject>
#include <QStringList>
#include <QTextDocument>
#include <QTextDocumentFragment>

namespace {

constexpr int kMostNamed = 40;

// What is read of a text: of HTML neither the tags, nor characters by their names instead of themselves.
QString readable(const QString &text)
{
    if (!Qt::mightBeRichText(text))
        return text;
    // Pictures stand in it as this character.
    return QTextDocumentFragment::fromHtml(text).toPlainText().remove(QChar::ObjectReplacementCharacter);
}

// Blocks without a text of their own have nothing under its key.
void addTexts(ZtFontCoverage &coverage, const KvBaseEditorNodeCfg &cfg)
{
    QJsonObject object;
    cfg.toJson(object);
    coverage.addText(readable(object.value(QStringLiteral("text")).toString()));
}

void addTexts(ZtFontCoverage &coverage, const KvReportKernelData &data)
{
    for (const KvMeasuredValue &record : data.measuredValues()) {
        for (const QString &text :
             {record.objectName, record.objectTypeName, record.valueName, record.valueText})
            coverage.addText(text);
    }
}

} // namespace

void KvReportGlyphs::logMissing(const KvTemplateModel &model)
{
    const QString characters = missingCharacters(model);
    if (!characters.isEmpty())
        ZtAppStatus().setAndLogStatus(ZtAppStatus::Warning, 0, warning(characters),
                                      QStringLiteral("KvReportGlyphs::logMissing"));
}

QString KvReportGlyphs::missingCharacters(const KvTemplateModel &model)
{
    ZtFontCoverage coverage(QFont(QStringLiteral("Segoe UI")));
    if (const KvReportKernelData *data = model.context()->kernelData())
        addTexts(coverage, *data);
    for (const KvReportNode *node : model.nodes())
        addTexts(coverage, *node->config());
    coverage.addText(readable(model.header()->text()));
    coverage.addText(readable(model.footer()->text()));
    return coverage.missingCharacters();
}

QString KvReportGlyphs::warning(const QString &characters)
{
    const QVector<uint> codePoints = characters.toUcs4().mid(0, kMostNamed);
    const QString named = QString::fromUcs4(codePoints.constData(), codePoints.size());
    const QStringList packages = ZtFontCoverage::packagesWith(characters);
    if (packages.isEmpty())
        return tr("No installed font has these characters, the report leaves them out: %1").arg(named);
    return tr("No installed font has these characters, the report leaves them out: %1 (fonts to install: %2)")
        .arg(named, packages.join(QLatin1String(", ")));
}
