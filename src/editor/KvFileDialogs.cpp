// SPDX-License-Identifier: MIT
#include "editor/KvFileDialogs.h"

#include "kernel/ZtLeftToRight.h"

#include <QCoreApplication>
#include <QDir>
#include <QFileDialog>
#include <QFileInfo>
#include <QHeaderView>
#include <QMessageBox>
#include <QTreeView>

#include <iterator>

namespace KvFileDialogs {

namespace {

constexpr QSize kDialogSize(800, 520);
constexpr int kColumnWidths[] = {300, 90, 90, 170}; // name, size, type, date

/// The columns of the detail view are as wide as their titles at first, which cuts sizes and dates.
void widenColumns(const QFileDialog &dialog)
{
    const auto *files = dialog.findChild<QTreeView *>(QStringLiteral("treeView"));
    if (!files || files->header()->count() < int(std::size(kColumnWidths)))
        return;
    for (int i = 0; i < int(std::size(kColumnWidths)); ++i)
        files->header()->resizeSection(i, kColumnWidths[i]);
}

/// Of a folder that is not there, a dialog would take the last part for the name of a file.
QString existingFolder(const QString &directory)
{
    QFileInfo folder(directory);
    while (!directory.isEmpty() && !folder.isDir() && !folder.isRoot())
        folder.setFile(folder.absolutePath());
    return folder.filePath();
}

void setUp(QFileDialog &dialog, const KvFileQuestion &question)
{
    dialog.setOption(QFileDialog::DontUseNativeDialog);
    dialog.setViewMode(QFileDialog::Detail);
    dialog.setFileMode(QFileDialog::AnyFile);
    dialog.setNameFilter(question.filter);
    dialog.resize(kDialogSize);
    widenColumns(dialog);
}

QString chosenFile(QFileDialog &dialog)
{
    return dialog.exec() == QDialog::Accepted ? dialog.selectedFiles().value(0) : QString();
}

bool mayOverwrite(QFileDialog &dialog, const QString &path)
{
    QMessageBox box(
        QMessageBox::Warning, dialog.windowTitle(),
        QCoreApplication::translate("KvFileDialogs", "%1 already exists.\nDo you want to replace it?")
            .arg(ZtLeftToRight::isolated(QDir::toNativeSeparators(path))),
        QMessageBox::Yes | QMessageBox::No, &dialog);
    // File names may look like markup.
    box.setTextFormat(Qt::PlainText);
    box.setDefaultButton(QMessageBox::No);
    return box.exec() == QMessageBox::Yes;
}

} // namespace

QString openFileName(QWidget *parent, const KvFileQuestion &question)
{
    QFileDialog dialog(parent, question.caption, existingFolder(question.directory));
    setUp(dialog, question);
    return chosenFile(dialog);
}

QString saveFileName(QWidget *parent, const KvFileQuestion &question)
{
    QFileDialog dialog(parent, question.caption, existingFolder(question.directory));
    setUp(dialog, question);
    dialog.setAcceptMode(QFileDialog::AcceptSave);
    dialog.setLabelText(QFileDialog::Accept, QCoreApplication::translate("KvFileDialogs", "Save"));
    dialog.setDefaultSuffix(question.suffix);
    if (!question.fileName.isEmpty())
        dialog.selectFile(question.fileName);
    while (true) {
        const QString chosen = chosenFile(dialog);
        if (chosen.isEmpty())
            return QString();
        const QString path = withSuffix(chosen, question.suffix);
        if (path == chosen || !QFileInfo::exists(path) || mayOverwrite(dialog, path))
            return path;
    }
}

QString withSuffix(const QString &path, const QString &suffix)
{
    return QFileInfo(path).completeSuffix() == suffix ? path : path + QLatin1Char('.') + suffix;
}

} // namespace KvFileDialogs
