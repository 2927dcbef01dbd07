// SPDX-License-Identifier: MIT
#include "KvDeskPanel.h"

#include "KvDeskPanelHeader.h"

#include <QVBoxLayout>

KvDeskPanel::KvDeskPanel(const QString &title, const QString &closeTip, QWidget *parent)
    : QWidget(parent)
    , m_header(new KvDeskPanelHeader(title, closeTip, this))
{
    auto *const layout = new QVBoxLayout(this);
    layout->setContentsMargins(0, 0, 0, 0);
    layout->setSpacing(0);
    layout->addWidget(m_header);
    connect(m_header, SIGNAL(signalCloseClicked()), this, SIGNAL(signalCloseClicked()));
}

void KvDeskPanel::setContent(QWidget *content)
{
    layout()->addWidget(content);
}
