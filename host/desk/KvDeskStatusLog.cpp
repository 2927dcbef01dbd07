// SPDX-License-Identifier: MIT
#include "KvDeskStatusLog.h"

#include "KvDeskEmptyState.h"
#include "KvDeskPanelHeader.h"
#include "KvDeskReason.h"
#include "KvDeskStatus.h"
#include "KvDeskStatusLogModel.h"
#include "KvDeskTableView.h"
#include "common/ZtAppStatus.h"
#include "gui/QtAdvancedStylesheet.h"

#include <QHeaderView>
#include <QScrollBar>
#include <QToolButton>

#include <algorithm>

namespace {

constexpr int smallestCategoryWidth = 112;
constexpr int categoryMargins = 44; ///< with the icon

/// Enough for the longest name, whatever is in the log.
int categoryWidth(const QFontMetrics &metrics)
{
    int width = 0;
    for (const int category : {ZtAppStatus::Information, ZtAppStatus::Warning, ZtAppStatus::Error})
        width = std::max(width, metrics.horizontalAdvance(KvDeskStatus::categoryName(category)));
    return std::max(smallestCategoryWidth, width + categoryMargins);
}

} // namespace

KvDeskStatusLog::KvDeskStatusLog(QWidget *parent)
    : KvDeskPanel(tr("Status log"), tr("Hide the status log"), parent)
    , m_model(new KvDeskStatusLogModel(this))
    , m_clearButton(header()->addButton(QStringLiteral("Icons/status-clear"), tr("Clear the status log")))
{
    createView();
    setContent(m_view);
    connectSignals();
    slotRowsChanged();
}

void KvDeskStatusLog::createView()
{
    m_view = new KvDeskTableView(this);
    m_view->setAccessibleName(tr("Status log"));
    m_view->setModel(m_model);
    m_view->setIconSize(QSize(16, 16));
    m_view->horizontalHeader()->hide();
    m_view->horizontalHeader()->setStretchLastSection(true);
    m_view->setColumnWidth(KvDeskStatusLogModel::CategoryColumn, categoryWidth(m_view->fontMetrics()));
    m_view->setColumnWidth(KvDeskStatusLogModel::TimeColumn, 72);
    m_emptyState =
        new KvDeskEmptyState(tr("Messages of the program and its plug-ins appear here"), m_view->viewport());
}

void KvDeskStatusLog::connectSignals()
{
    connect(m_clearButton, SIGNAL(clicked()), this, SLOT(slotClear()));
    connect(m_model, SIGNAL(rowsAboutToBeInserted(QModelIndex,int,int)), this, SLOT(slotBeforeInsert()));
    connect(m_model, SIGNAL(rowsInserted(QModelIndex,int,int)), this, SLOT(slotRowsChanged()));
    connect(m_model, SIGNAL(modelReset()), this, SLOT(slotRowsChanged()));
    connect(acss::QtAdvancedStylesheet::getInstance(), SIGNAL(currentThemeChanged(QString)), this,
                                                              SLOT(slotThemeChanged()));
}

void KvDeskStatusLog::slotBeforeInsert()
{
    const QScrollBar *const bar = m_view->verticalScrollBar();
    m_isAtEnd = bar->value() == bar->maximum();
}

void KvDeskStatusLog::slotRowsChanged()
{
    const bool isEmpty = m_model->rowCount() == 0;
    m_emptyState->setVisible(isEmpty);
    KvDeskReason::setPossible(m_clearButton, !isEmpty, tr("There are no messages"));
    if (m_isAtEnd)
        m_view->scrollToBottom();
}

void KvDeskStatusLog::slotClear()
{
    m_isAtEnd = true;
    ZtStatusLog::getInstance()->clear();
}

void KvDeskStatusLog::slotThemeChanged()
{
    m_view->viewport()->update();
}
