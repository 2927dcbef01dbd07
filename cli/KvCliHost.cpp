// SPDX-License-Identifier: MIT
#include "KvCliHost.h"

#include "KvCliArguments.h"
#include "KvCliOutput.h"
#include "KvCliSource.h"

#include "blocks/KvReportBlocks.h"
#include "data/KvReportKernelData.h"
#include "data/KvStatisticsEngine.h"
#include "kernel/ZtAppSettings.h"
#include "measuring/ZtMeasuringDocument.h"
#include "templates/KvBaseEditorNodeFactory.h"
#include "templates/KvBlockRegistry.h"

KvCliHost::KvCliHost()
    : m_document(std::make_unique<ZtMeasuringDocument>())
    , m_kernelData(std::make_unique<KvReportKernelData>())
    , m_blocks(std::make_unique<KvBlockTypeList>())
{
    KvStatisticsEngine::instance().setKernelData(m_kernelData.get());
    registerReportBlocks(*m_blocks);
}

KvCliHost::~KvCliHost()
{
    KvStatisticsEngine::instance().setKernelData(nullptr);
}

bool KvCliHost::loadData(const KvCliArguments &arguments, const KvCliOutput &output)
{
    ZtAppSettings::beginGroup(QStringLiteral("Measurement"));
    ZtAppSettings::setValue(QStringLiteral("MeasurementLabelsSignDigits"), arguments.digits);
    ZtAppSettings::endGroup();
    const bool isLoaded =
        arguments.sessionPath.isEmpty() ? loadTable(arguments, output) : loadSession(arguments, output);
    if (!isLoaded)
        return false;
    ZtFault fault;
    if (!arguments.imagePath.isEmpty() && !m_document->loadImage(arguments.imagePath, &fault)) {
        output.error(fault);
        return false;
    }
    return true;
}

bool KvCliHost::loadSession(const KvCliArguments &arguments, const KvCliOutput &output)
{
    ZtFault fault;
    KvCliSource source;
    if (!source.open(arguments.sessionPath, &fault) ||
        !m_document->loadSession(source.path(), &fault, ZtMeasuringDocument::MissingImage::IsIgnored)) {
        fault.file = source.displayName();
        output.error(fault);
        return false;
    }
    if (!m_document->imagePath().isEmpty() && !m_document->frameSource() && arguments.imagePath.isEmpty())
        output.note(tr("%1: the image %2 is missing").arg(source.displayName(), m_document->imagePath()));
    return true;
}

bool KvCliHost::loadTable(const KvCliArguments &arguments, const KvCliOutput &output)
{
    ZtTableImportOptions options;
    options.units = arguments.units;
    options.typeColumn = arguments.typeColumn;
    options.nameColumn = arguments.nameColumn;
    if (!arguments.decimalMark.isEmpty())
        options.decimalMark = arguments.decimalMark == QLatin1String("comma") ? ZtTableImportOptions::Comma
                                                                              : ZtTableImportOptions::Point;
    ZtFault fault;
    QStringList notes;
    KvCliSource source;
    if (!source.open(arguments.tablePath, &fault) ||
        !m_document->importTable(source.path(), options, &fault, &notes)) {
        fault.file = source.displayName();
        output.error(fault);
        return false;
    }
    for (const QString &note : qAsConst(notes))
        output.note(source.displayName() + QStringLiteral(": ") + note);
    return true;
}
