// SPDX-License-Identifier: MIT
#pragma once

#include "KvDeskPanel.h"

class KvDeskEmptyState;
class KvDeskStatusLogModel;
class KvDeskTableView;
class QToolButton;

/** Panel with the status log. New entries are scrolled to unless the user looks at older ones. */
class KvDeskStatusLog : public KvDeskPanel
{
    Q_OBJECT
public:
    explicit KvDeskStatusLog(QWidget *parent = nullptr);

    KvDeskStatusLogModel *model() const { return m_model; }
    KvDeskTableView *view() const { return m_view; }
    QToolButton *clearButton() const { return m_clearButton; }

private slots:
    void slotBeforeInsert();
    void slotRowsChanged();
    void slotClear();
    void slotThemeChanged();

private:
    void createView();
    void connectSignals();

    KvDeskStatusLogModel *m_model;
    QToolButton *m_clearButton;
    KvDeskTableView *m_view = nullptr;
    KvDeskEmptyState *m_emptyState = nullptr;
    bool m_isAtEnd = true;
};
