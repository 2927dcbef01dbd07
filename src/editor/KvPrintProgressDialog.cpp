// SPDX-License-Identifier: MIT
#include "editor/KvPrintProgressDialog.h"

#include <QApplication>
#include <QHBoxLayout>
#include <QLabel>
#include <QProgressBar>
#include <QPushButton>
#include <QVBoxLayout>

namespace {
constexpr int kMargin = 24;
constexpr int kSpacing = 8;
constexpr int kBarWidth = 320;
} // namespace

KvPrintProgressDialog::KvPrintProgressDialog(QWidget *parent, int showDelay)
    : QDialog(parent)
    , m_pageLabel(new QLabel(this))
    , m_bar(new QProgressBar(this))
    , m_cancelButton(new QPushButton(tr("Cancel"), this))
    , m_showDelay(showDelay)
{
    setWindowTitle(tr("Printing the report"));
    setWindowModality(Qt::ApplicationModal);
    m_bar->setMinimumWidth(kBarWidth);
    m_bar->setAccessibleName(tr("Progress"));
    m_cancelButton->setToolTip(tr("Cancel (Esc)"));
    auto *buttons = new QHBoxLayout;
    buttons->addStretch(1);
    buttons->addWidget(m_cancelButton);
    auto *column = new QVBoxLayout(this);
    column->setContentsMargins(kMargin, kMargin, kMargin, kMargin);
    column->setSpacing(kSpacing);
    column->addWidget(m_pageLabel);
    column->addWidget(m_bar);
    column->addLayout(buttons);
    connect(m_cancelButton, SIGNAL(clicked(bool)), this, SLOT(reject()));
    QApplication::setOverrideCursor(Qt::WaitCursor);
    m_elapsed.start();
}

KvPrintProgressDialog::~KvPrintProgressDialog()
{
    endBusyCursor();
}

void KvPrintProgressDialog::endBusyCursor()
{
    if (!m_isBusyCursor)
        return;
    m_isBusyCursor = false;
    QApplication::restoreOverrideCursor();
}

void KvPrintProgressDialog::pageWritten(int done, int total)
{
    if (!isVisible()) {
        if (done >= total || m_elapsed.elapsed() < m_showDelay)
            return;
        endBusyCursor();
        show();
    }
    m_pageLabel->setText(tr("Page %1 of %2").arg(done).arg(total));
    m_bar->setMaximum(total);
    m_bar->setValue(done);
    // No timers: those of the measurements would change blocks between two pages.
    QCoreApplication::processEvents(QEventLoop::X11ExcludeTimers);
}

void KvPrintProgressDialog::reject()
{
    m_isCancelled = true;
    m_cancelButton->setEnabled(false);
}
