// SPDX-License-Identifier: MIT
#include "KvDeskCalibrationCommands.h"

#include "KvDeskActions.h"
#include "KvDeskCalibrationDialog.h"
#include "KvDeskCalibrator.h"
#include "KvDeskImageView.h"
#include "KvDeskNotice.h"

#include <QAction>
#include <QScreen>

namespace {

constexpr int besideImage = 8; ///< pixels

} // namespace

KvDeskCalibrationCommands::KvDeskCalibrationCommands(KvDeskActions *actions, KvDeskImageView *view,
                                                     KvDeskSession *session, KvDeskObjectEditor *editor,
                                                     QObject *parent)
    : QObject(parent)
    , m_actions(actions)
    , m_view(view)
    , m_calibrator(new KvDeskCalibrator(session, editor, this))
    , m_notice(new KvDeskNotice(actions->action(KvDeskActions::UseFilePixelSize), view->viewport()))
{
    connectSignals();
    slotUpdate();
}

void KvDeskCalibrationCommands::connectSignals()
{
    using A = KvDeskActions;
    connect(m_actions->action(A::Calibrate), SIGNAL(triggered()), this, SLOT(slotShowDialog()));
    connect(m_actions->action(A::UseFilePixelSize), SIGNAL(triggered()), m_calibrator,
                                                           SLOT(slotUseOffered()));
    connect(m_actions->action(A::ShowScaleBar), SIGNAL(toggled(bool)), m_view,
                                                       SLOT(slotSetScaleBarVisible(bool)));
    connect(m_calibrator, SIGNAL(signalChanged()), this, SLOT(slotUpdate()));
    connect(m_calibrator, SIGNAL(signalOfferMade(QString)), m_notice, SLOT(slotShow(QString)));
    connect(m_calibrator, SIGNAL(signalOfferWithdrawn()), m_notice, SLOT(slotHide()));
}

// The user draws on the image while the dialog is open: it goes over the table of values.
void KvDeskCalibrationCommands::moveBesideImage(QWidget *dialog) const
{
    const QRect screen = m_view->screen()->availableGeometry();
    const QPoint corner = m_view->mapToGlobal(m_view->rect().topRight());
    const QSize size = dialog->frameGeometry().size();
    dialog->move(qBound(screen.left(), corner.x() + besideImage, screen.right() - size.width()),
                 qBound(screen.top(), corner.y() + besideImage, screen.bottom() - size.height()));
}

KvDeskCalibrationDialog *KvDeskCalibrationCommands::dialog() const
{
    return m_dialog;
}

void KvDeskCalibrationCommands::slotShowDialog()
{
    if (!m_dialog) {
        m_dialog = new KvDeskCalibrationDialog(m_calibrator, m_view->window());
        m_dialog->setAttribute(Qt::WA_DeleteOnClose);
    }
    const bool isNew = !m_dialog->isVisible();
    m_dialog->setWindowState(m_dialog->windowState() & ~Qt::WindowMinimized);
    m_dialog->show();
    if (isNew)
        moveBesideImage(m_dialog);
    m_dialog->activateWindow();
}

void KvDeskCalibrationCommands::slotUpdate()
{
    const ZtCalibration offered = m_calibrator->offered();
    const bool isOther = !offered.hasNearlySamePixelSize(m_calibrator->current());
    m_actions->setPossible(KvDeskActions::UseFilePixelSize, offered.isCalibrated() && isOther,
                           offered.isCalibrated() ? tr("The session measures with it already")
                                                  : tr("The image's file does not state one"));
}
