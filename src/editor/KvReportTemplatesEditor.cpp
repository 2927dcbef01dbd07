// SPDX-License-Identifier: MIT
#include "editor/KvReportTemplatesEditor.h"

#include "blocks/KvReportBlocks.h"
#include "editor/KvEditorToolsList.h"
#include "kernel/ZtAppSettings.h"

#include <QCoreApplication>
#include <QDir>
#include <QEvent>
#include <QStandardPaths>

namespace {
constexpr QLatin1String kTemplatesPathKey("ReportTemplatesPath");
constexpr QLatin1String kPdfPathKey("ReportPdfPath");
} // namespace

KvReportTemplatesEditor::KvReportTemplatesEditor(KvReportKernelData *kernelData, QWidget *parent)
    : KvTemplatesEditorWindow(tr("Report template editor"), kernelData, parent)
{
    registerReportBlocks(*toolsList());
}

QString KvReportTemplatesEditor::templatesDirectory() const
{
    const QString beside = QCoreApplication::applicationDirPath() + QStringLiteral("/Templates");
    return ZtAppSettings::value(kTemplatesPathKey, QDir::toNativeSeparators(beside)).toString();
}

void KvReportTemplatesEditor::setTemplatesDirectory(const QString &directory)
{
    ZtAppSettings::setValue(kTemplatesPathKey, directory);
}

QString KvReportTemplatesEditor::printDirectory() const
{
    const QString documents = QStandardPaths::writableLocation(QStandardPaths::DocumentsLocation);
    return ZtAppSettings::value(kPdfPathKey, documents).toString();
}

void KvReportTemplatesEditor::setPrintDirectory(const QString &directory)
{
    ZtAppSettings::setValue(kPdfPathKey, directory);
}

QString KvReportTemplatesEditor::templateFileSuffix() const
{
    return QStringLiteral("rtp");
}

QString KvReportTemplatesEditor::templateFileFilter() const
{
    return tr("Report template file (*.rtp)");
}

void KvReportTemplatesEditor::changeEvent(QEvent *event)
{
    KvTemplatesEditorWindow::changeEvent(event);
    if (event->type() == QEvent::LanguageChange)
        setBaseTitle(tr("Report template editor"));
}
