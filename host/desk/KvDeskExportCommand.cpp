// SPDX-License-Identifier: MIT
#include "KvDeskExportCommand.h"

#include "KvDeskExportDialog.h"
#include "KvDeskFileCommands.h"
#include "KvDeskSelection.h"
#include "KvDeskSession.h"
#include "KvDeskStatus.h"
#include "common/ZtAppStatus.h"
#include "kernel/ZtAppSettings.h"
#include "kernel/ZtGsManipulator.h"
#include "kernel/ZtKernelData.h"
#include "kernel/ZtLeftToRight.h"
#include "measuring/ZtFault.h"
#include "measuring/ZtSafeFile.h"

#include <QAction>
#include <QDir>
#include <QFileDialog>
#include <QFileInfo>
#include <QProgressDialog>

namespace {

constexpr int portion = 2000; ///< objects between two looks at what the user does

const char groupName[] = "DeskExport";
const char folderKey[] = "Folder";

bool isMeasured(int type)
{
    const ZtGsManipulator *const manipulator = ZtKernelData::getInstance()->getGsManipulator(type);
    return manipulator && (manipulator->typeFlags(0) & ZtGsManipulator::MeasurementFlag);
}

bool hasMeasuredObjects()
{
    const QList<int> types = ZtKernelData::getInstance()->objects().keys();
    return std::any_of(types.begin(), types.end(), isMeasured);
}

QVector<ZtTableExport::ObjectId> measured(const QSet<KvDeskObjectId> &objects)
{
    QVector<ZtTableExport::ObjectId> result;
    for (const KvDeskObjectId &object : objects) {
        if (isMeasured(object.type))
            result.append({object.type, object.id});
    }
    return result;
}

QString lastFolder()
{
    ZtAppSettings::beginGroupAbsolute(QLatin1String(groupName));
    const QString folder = ZtAppSettings::value(QLatin1String(folderKey)).toString();
    ZtAppSettings::endGroup();
    return QFileInfo(folder).isDir() ? folder : QString();
}

void rememberFolder(const QString &path)
{
    ZtAppSettings::beginGroupAbsolute(QLatin1String(groupName));
    ZtAppSettings::setValue(QLatin1String(folderKey), QFileInfo(path).absolutePath());
    ZtAppSettings::endGroup();
}

QString suffix(ZtTableExport::Layout layout)
{
    return layout == ZtTableExport::Json ? QStringLiteral("json") : QStringLiteral("csv");
}

} // namespace

KvDeskExportCommand::KvDeskExportCommand(QAction *action, KvDeskFileCommands *files, KvDeskSession *session,
                                         KvDeskSelection *selection, QWidget *window)
    : QObject(window)
    , m_action(action)
    , m_toolTip(action->toolTip())
    , m_files(files)
    , m_session(session)
    , m_selection(selection)
    , m_window(window)
{
    connect(m_action, SIGNAL(triggered()), this, SLOT(slotExport()));
    connect(&m_changes, SIGNAL(signalChanged()), this, SLOT(slotUpdate()));
    slotUpdate();
}

void KvDeskExportCommand::slotUpdate()
{
    const bool isPossible = hasMeasuredObjects();
    m_action->setEnabled(isPossible);
    m_action->setToolTip(isPossible ? m_toolTip
                                    : m_toolTip + QLatin1Char('\n') + tr("Nothing was measured yet"));
}

void KvDeskExportCommand::slotExport()
{
    KvDeskExportDialog dialog(measured(m_selection->objects()), m_window);
    if (dialog.exec() != QDialog::Accepted)
        return;
    const ZtTableExport::Options options = dialog.options();
    const QString path = choosePath(options.layout);
    if (!path.isEmpty())
        exportTo(path, options);
}

QString KvDeskExportCommand::suggestedName(ZtTableExport::Layout layout) const
{
    const QString base = m_session->path().isEmpty() ? tr("Measured values", "file name")
                                                     : QFileInfo(m_session->path()).completeBaseName();
    // Beside a session of that name it must not take its place.
    return layout == ZtTableExport::Json ? base + QStringLiteral(" values.json")
                                         : base + QStringLiteral(".csv");
}

QString KvDeskExportCommand::choosePath(ZtTableExport::Layout layout)
{
    const QString filter = layout == ZtTableExport::Json ? tr("JSON files") : tr("CSV tables");
    QFileDialog dialog(m_window, tr("Export measured values"), lastFolder(),
                       QStringLiteral("%1 (*.%2)").arg(filter, suffix(layout)));
    dialog.setAcceptMode(QFileDialog::AcceptSave);
    dialog.setFileMode(QFileDialog::AnyFile);
    dialog.setDefaultSuffix(suffix(layout));
    dialog.selectFile(suggestedName(layout));
    if (dialog.exec() != QDialog::Accepted || dialog.selectedFiles().isEmpty())
        return QString();
    rememberFolder(dialog.selectedFiles().first());
    return dialog.selectedFiles().first();
}

bool KvDeskExportCommand::exportTo(const QString &path, const ZtTableExport::Options &options)
{
    const QString source = QStringLiteral("KvDeskExportCommand::exportTo");
    const QString name = ZtLeftToRight::isolated(QFileInfo(path).fileName());
    QByteArray bytes;
    if (!collect(options, &bytes)) {
        KvDeskStatus::log(ZtAppStatus::Information, tr("Export cancelled: %1").arg(name), source);
        return false;
    }
    ZtFault fault;
    if (!ZtSafeFile::write(path, bytes, &fault))
        return m_files->tellFault(tr("The table \"%1\" was not written.").arg(name), fault, source);
    KvDeskStatus::log(ZtAppStatus::Information, tr("Measured values exported: %1").arg(name), source);
    return true;
}

// False when the user cancels.
bool KvDeskExportCommand::collect(const ZtTableExport::Options &options, QByteArray *bytes)
{
    ZtTableExport table(options);
    QProgressDialog progress(tr("Exporting measured values"), tr("Cancel"), 0, table.objectCount(), m_window);
    progress.setWindowModality(Qt::WindowModal);
    progress.setMinimumDuration(m_progressDelayMs);
    while (!table.isFinished()) {
        table.advance(portion);
        // Lets the user cancel once the dialog is there.
        progress.setValue(table.doneCount());
        if (progress.wasCanceled())
            return false;
    }
    *bytes = table.bytes();
    return true;
}
