// SPDX-License-Identifier: MIT
#pragma once

#include "report/KvPrintProgress.h"

#include <QDialog>
#include <QElapsedTimer>

class QLabel;
class QProgressBar;
class QPushButton;

/**
 * Shows how far a print is, with a Cancel button, once it has taken half a second; until then the cursor says
 * that the program is busy.
 *
 * While it is shown no other window of the program takes input, and time stands still for everything else: a
 * template that is being printed must not change.
 */
class KvPrintProgressDialog
    : public QDialog
    , public KvPrintProgress
{
    Q_OBJECT
public:
    static constexpr int DefaultShowDelay = 500; ///< milliseconds

    /** Starts the time. \a showDelay in milliseconds. */
    explicit KvPrintProgressDialog(QWidget *parent = nullptr, int showDelay = DefaultShowDelay);
    ~KvPrintProgressDialog() override;

    void pageWritten(int done, int total) override;
    bool isCancelled() const override { return m_isCancelled; }

public slots:
    /** Cancels the print; the dialog stays until the printer has noticed. */
    void reject() override;

private:
    void endBusyCursor();

    QLabel *m_pageLabel;
    QProgressBar *m_bar;
    QPushButton *m_cancelButton;
    QElapsedTimer m_elapsed;
    int m_showDelay;
    bool m_isBusyCursor = true;
    bool m_isCancelled = false;
};
