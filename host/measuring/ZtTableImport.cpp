// SPDX-License-Identifier: MIT
#include "measuring/ZtTableImport.h"

#include "kernel/ZtKernelData.h"
#include "kernel/ZtKernelObjectDataDescr.h"
#include "kernel/ZtSignalCenter.h"
#include "measuring/ZtBoundedRead.h"
#include "measuring/ZtClassIndexTableReader.h"
#include "measuring/ZtCsvReader.h"
#include "measuring/ZtFileFault.h"
#include "measuring/ZtImportedManipulator.h"
#include "measuring/ZtImportedTable.h"
#include "measuring/ZtJsonRows.h"
#include "measuring/ZtProgress.h"
#include "measuring/ZtReadyObjects.h"
#include "measuring/ZtTableDialect.h"
#include "measuring/ZtTableNumber.h"
#include "measuring/ZtTextDecoder.h"
#include "measuring/ZtTidyTableReader.h"
#include "measuring/ZtWideTableReader.h"

#include <QCoreApplication>
#include <QFile>
#include <QFileInfo>

namespace {

/// Gives the functions of this file a tr() whose context can be seen by the tool that collects the texts.
class Text
{
    Q_DECLARE_TR_FUNCTIONS(ZtTableImport)
};

bool fail(const QString &message, ZtFault *fault)
{
    fault->message = message;
    return false;
}

bool failTooLarge(qint64 maximumBytes, ZtFault *fault)
{
    const double megabytes = static_cast<double>(maximumBytes) / (1024.0 * 1024.0);
    return fail(Text::tr("The file is larger than %1 MB").arg(megabytes), fault);
}

// What one QByteArray can hold, with room for its text in another encoding.
constexpr qint64 largestFile = 1024LL * 1024 * 1024;

bool isColumnHeader(const ZtCsvRow &row)
{
    for (const std::string_view field : row.fields) {
        if (ZtTableNumber::read(field, false).kind == ZtTableNumber::Text &&
            ZtTableNumber::read(field, true).kind == ZtTableNumber::Text)
            return true;
    }
    return false;
}

std::unique_ptr<ZtTableReader> makeReader(const ZtCsvRow &firstRow, ZtTableRows *rows,
                                          const ZtTableImportOptions &options, bool decimalComma)
{
    QVector<ZtTableHeader> headers;
    for (const std::string_view field : firstRow.fields)
        headers.append(ZtTableHeader::parse(QString::fromUtf8(field.data(), static_cast<int>(field.size()))));
    if (ZtTidyTableReader::recognizes(headers))
        return std::make_unique<ZtTidyTableReader>(rows, options, decimalComma);
    return std::make_unique<ZtWideTableReader>(rows, options, decimalComma);
}

// Numbers of JSON have a decimal point.
bool readJson(std::string_view text, const ZtTableImportOptions &options, ZtImportedTable *table,
              ZtFault *fault, ZtProgress *progress)
{
    const std::unique_ptr<ZtJsonRows> rows = ZtJsonRows::open(text, progress, fault);
    if (!rows)
        return false;
    rows->beginPass(0.1, 0.9);
    ZtCsvRow columns;
    rows->next(&columns);
    const std::unique_ptr<ZtTableReader> reader = makeReader(columns, rows.get(), options, false);
    if (reader->read(table))
        return true;
    *fault = rows->fault().isNull() ? rows->located(reader->fault()) : rows->fault();
    return false;
}

bool readSeparated(std::string_view text, const ZtTableImportOptions &options, ZtImportedTable *table,
                   ZtFault *fault, ZtProgress *progress)
{
    const bool knownComma = options.decimalMark == ZtTableImportOptions::Comma;
    ZtCsvReader rows(text, ZtTableDialect::findSeparator(text, knownComma));
    rows.setProgress(progress);
    ZtProgress::setPart(progress, 0.1, 0.9);
    ZtCsvRow firstRow;
    if (!rows.next(&firstRow)) {
        *fault = rows.fault();
        return !fault->isNull() ? false : fail(Text::tr("The file is empty"), fault);
    }
    if (!isColumnHeader(firstRow)) {
        fault->line = firstRow.line;
        return fail(Text::tr("The first line does not name the columns"), fault);
    }
    const bool detected =
        options.decimalMark == ZtTableImportOptions::DetectMark && ZtTableDialect::hasDecimalComma(&rows);
    const bool isClassIndex = ZtClassIndexTableReader::recognizes(firstRow);
    const std::unique_ptr<ZtTableReader> reader =
        isClassIndex ? std::make_unique<ZtClassIndexTableReader>(&rows, options, knownComma || detected)
                     : makeReader(firstRow, &rows, options, knownComma || detected);
    if (reader->read(table))
        return true;
    *fault = reader->fault();
    return false;
}

} // namespace

bool ZtTableImport::readFile(const QString &path, const ZtTableImportOptions &options, ZtImportedTable *table,
                             ZtFault *fault, ZtProgress *progress)
{
    QFile file(path);
    *fault = ZtFault();
    fault->file = path;
    if (!QFileInfo::exists(path))
        return fail(Text::tr("The file does not exist"), fault);
    if (QFileInfo(path).isDir())
        return fail(Text::tr("This is a folder, not a file"), fault);
    if (!file.open(QIODevice::ReadOnly))
        return fail(Text::tr("The file cannot be read (%1)").arg(ZtFileFault::text(file)), fault);
    return readDevice(&file, path, options, table, fault, progress);
}

bool ZtTableImport::readDevice(QIODevice *device, const QString &fileName,
                               const ZtTableImportOptions &options, ZtImportedTable *table, ZtFault *fault,
                               ZtProgress *progress)
{
    *fault = ZtFault();
    fault->file = fileName;
    if (!device->isReadable())
        return fail(Text::tr("The table is not open for reading"), fault);
    const qint64 limit = qMin(options.maximumBytes, largestFile);
    // Known beforehand for files: what is too large need not be read.
    if (!device->isSequential() && device->size() - device->pos() > limit)
        return failTooLarge(limit, fault);
    ZtProgress::setPart(progress, 0.0, 0.1);
    const QByteArray bytes = ztReadAtMost(device, limit + 1, progress);
    if (ZtProgress::isCancelled(progress))
        return fail(Text::tr("Reading was cancelled"), fault);
    const auto *file = qobject_cast<QFileDevice *>(device);
    if (file && file->error() != QFileDevice::NoError)
        return fail(Text::tr("The file cannot be read (%1)").arg(ZtFileFault::text(*file)), fault);
    if (bytes.size() > limit)
        return failTooLarge(limit, fault);
    return parse(bytes, fileName, options, table, fault, progress);
}

bool ZtTableImport::parse(const QByteArray &bytes, const QString &fileName,
                          const ZtTableImportOptions &options, ZtImportedTable *table, ZtFault *fault,
                          ZtProgress *progress)
{
    *fault = ZtFault();
    QByteArray utf8;
    bool isRead = bytes.size() <= options.maximumBytes || failTooLarge(options.maximumBytes, fault);
    isRead = isRead && ZtTextDecoder::toUtf8(bytes, &utf8, fault);
    const std::string_view text(utf8.constData(), static_cast<std::size_t>(utf8.size()));
    const auto readText = ZtJsonRows::recognizes(text) ? readJson : readSeparated;
    isRead = isRead && readText(text, options, table, fault, progress);
    if (!isRead)
        fault->file = fileName;
    return isRead;
}

int ZtTableImport::registerType(std::unique_ptr<ZtImportedManipulator> manipulator, int afterId)
{
    ZtKernelData *kernel = ZtKernelData::getInstance();
    int id = qMax(firstTypeId, afterId + 1);
    while (kernel->getGsManipulator(id) || kernel->getDataDescriptor(id))
        ++id;
    manipulator->setObjectTypeId(id);
    auto descriptor = std::make_unique<ZtKernelObjectDataDescr>(id, manipulator->type().name());
    kernel->registerType(id, std::move(manipulator), std::move(descriptor));
    return id;
}

QVector<int> ZtTableImport::apply(const ZtImportedTable &table)
{
    std::vector<ZtReadyObjects> ready = ZtReadyObjects::ofTable(table);
    return apply(&ready);
}

QVector<int> ZtTableImport::apply(std::vector<ZtReadyObjects> *ready, int afterId)
{
    QVector<int> ids;
    for (ZtReadyObjects &objects : *ready) {
        ids.append(objects.handOver(afterId));
        afterId = ids.last();
    }
    for (const int id : qAsConst(ids)) {
        if (const ZtKernelObjectData *first = ZtKernelData::getInstance()->object(id, 1))
            emit ZtSignalCenter::getInstance()->signalObjectCreated(id, 1, first);
    }
    return ids;
}
