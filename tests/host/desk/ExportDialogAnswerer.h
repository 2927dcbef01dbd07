// SPDX-License-Identifier: MIT
#pragma once

#include "KvDeskExportDialog.h"

#include <QApplication>
#include <QComboBox>
#include <QTimer>

/** While it lives, answers the dialog of the export: takes it with a layout, or cancels it. */
class ExportDialogAnswerer
{
public:
    /** \a layout is an index of the dialog's list; less than 0 cancels. */
    explicit ExportDialogAnswerer(int layout)
        : m_layout(layout)
    {
        QObject::connect(&m_timer, &QTimer::timeout, &m_timer, [this]() { answer(); });
        m_timer.start(5);
    }

private:
    void answer()
    {
        auto *const dialog = qobject_cast<KvDeskExportDialog *>(QApplication::activeModalWidget());
        if (!dialog || !dialog->isVisible())
            return;
        if (m_layout < 0) {
            dialog->reject();
            return;
        }
        dialog->layoutBox()->setCurrentIndex(m_layout);
        dialog->accept();
    }

    int m_layout;
    QTimer m_timer;
};
