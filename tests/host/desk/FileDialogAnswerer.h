// SPDX-License-Identifier: MIT
#pragma once

#include <QAbstractItemView>
#include <QApplication>
#include <QFileDialog>
#include <QLineEdit>
#include <QTimer>
#include <QVector>

/** While it lives, answers every modal file dialog with one path; an empty path cancels. */
class FileDialogAnswerer
{
public:
    struct Seen
    {
        QString title;
        QStringList filters;
        QString folder;
        bool isForSaving = false;
    };

    explicit FileDialogAnswerer(const QString &path)
        : m_path(path)
    {
        QObject::connect(&m_timer, &QTimer::timeout, &m_timer, [this]() { answer(); });
        m_timer.start(5);
    }

    const QVector<Seen> &dialogs() const { return m_dialogs; }

private:
    void answer()
    {
        auto *dialog = qobject_cast<QFileDialog *>(QApplication::activeModalWidget());
        if (!dialog || !dialog->isVisible())
            return;
        m_dialogs.append({dialog->windowTitle(), dialog->nameFilters(), dialog->directory().absolutePath(),
                          dialog->acceptMode() == QFileDialog::AcceptSave});
        if (m_path.isEmpty()) {
            dialog->reject();
            return;
        }
        // As typed: what is selected in the list depends on how far the list has been read.
        for (QAbstractItemView *list : dialog->findChildren<QAbstractItemView *>()) {
            if (list->selectionModel())
                list->selectionModel()->clearSelection();
        }
        dialog->findChild<QLineEdit *>(QStringLiteral("fileNameEdit"))->setText(m_path);
        // Not from here: it may ask something, and a timer does not fire again within itself.
        QMetaObject::invokeMethod(dialog, "accept", Qt::QueuedConnection);
    }

    QString m_path;
    QTimer m_timer;
    QVector<Seen> m_dialogs;
};
