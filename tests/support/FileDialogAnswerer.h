// SPDX-License-Identifier: MIT
#pragma once

#include <QAbstractItemView>
#include <QApplication>
#include <QFileDialog>
#include <QLineEdit>
#include <QStringList>
#include <QTimer>
#include <QVector>

/** What a modal file dialog looked like when it came up. */
struct SeenFileDialog
{
    QString caption;
    QString directory;
    QStringList filters;
    QString defaultSuffix;
    QString acceptLabel;
    QString suggestedName;
    QFileDialog::AcceptMode acceptMode = QFileDialog::AcceptOpen;
    QFileDialog::FileMode fileMode = QFileDialog::AnyFile;
    QFileDialog::ViewMode viewMode = QFileDialog::List;
    bool isNative = true;
    bool isModal = false;
    bool hasParent = false;
};

/**
 * While it lives, notes every modal file dialog, types a file name into it and accepts it. When the names are
 * used up, dialogs are cancelled.
 */
class FileDialogAnswerer
{
public:
    explicit FileDialogAnswerer(const QStringList &names = QStringList())
        : m_names(names)
    {
        QObject::connect(&m_timer, &QTimer::timeout, &m_timer, [this]() { answerDialog(); });
        m_timer.start(5);
    }
    explicit FileDialogAnswerer(const QString &name)
        : FileDialogAnswerer(QStringList(name))
    {}

    const QVector<SeenFileDialog> &dialogs() const { return m_dialogs; }

private:
    void answerDialog()
    {
        auto *dialog = qobject_cast<QFileDialog *>(QApplication::activeModalWidget());
        if (!dialog || !dialog->isVisible())
            return;
        note(*dialog);
        if (m_names.isEmpty()) {
            dialog->reject();
            return;
        }
        // A suggested file is selected in the list, too, and stays so while the text lacks the keyboard.
        for (QAbstractItemView *list : dialog->findChildren<QAbstractItemView *>()) {
            if (list->selectionModel())
                list->selectionModel()->clearSelection();
        }
        dialog->findChild<QLineEdit *>(QStringLiteral("fileNameEdit"))->setText(m_names.takeFirst());
        // At once: the dialog's list of files, when it is read, puts a suggested name back.
        QMetaObject::invokeMethod(dialog, "accept", Qt::DirectConnection);
    }

    void note(const QFileDialog &dialog)
    {
        SeenFileDialog seen;
        seen.caption = dialog.windowTitle();
        seen.directory = dialog.directory().absolutePath();
        seen.filters = dialog.nameFilters();
        seen.defaultSuffix = dialog.defaultSuffix();
        seen.acceptLabel = dialog.labelText(QFileDialog::Accept);
        seen.suggestedName = dialog.findChild<QLineEdit *>(QStringLiteral("fileNameEdit"))->text();
        seen.acceptMode = dialog.acceptMode();
        seen.fileMode = dialog.fileMode();
        seen.viewMode = dialog.viewMode();
        seen.isNative = !dialog.testOption(QFileDialog::DontUseNativeDialog);
        seen.isModal = dialog.isModal();
        seen.hasParent = dialog.parentWidget() != nullptr;
        m_dialogs.append(seen);
    }

    QStringList m_names;
    QTimer m_timer;
    QVector<SeenFileDialog> m_dialogs;
};
