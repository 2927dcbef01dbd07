// SPDX-License-Identifier: MIT
#include "blocks/textdocument/KvTextDocumentNodeFactory.h"

#include "blocks/textdocument/KvTextDocumentNodeCfg.h"
#include "blocks/textdocument/KvTextDocumentNodeWidget.h"
#include "templates/KvTemplateContext.h"

#include <QCoreApplication>
#include <QTextDocument>

KvTextDocumentNodeFactory::KvTextDocumentNodeFactory()
    : KvBaseEditorNodeFactory(QStringLiteral("Text Document"),
                              QCoreApplication::translate("KvBaseEditorNodeFactory", "Text Document"),
                              QStringLiteral("Icons/ToolIconText.svg"))
{}

KvBaseDisplayWidget *KvTextDocumentNodeFactory::createDisplayWidget(QWidget *parent, KvBaseEditorNodeCfg *cfg)
{
    auto *textCfg = qobject_cast<KvTextDocumentNodeCfg *>(cfg);
    if (!textCfg)
        return nullptr;
    auto *widget = new KvTextDocumentNodeWidget(parent, textCfg);
    if (const KvTemplateContext *context = textCfg->context())
        widget->document()->setTextWidth(context->usableWidth());
    return widget;
}

KvBaseEditorNodeCfg *KvTextDocumentNodeFactory::createConfig(KvTemplateContext *context)
{
    return new KvTextDocumentNodeCfg(context);
}
