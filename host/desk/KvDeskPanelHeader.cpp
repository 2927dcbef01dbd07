// SPDX-License-Identifier: MIT
#include "KvDeskPanelHeader.h"

#include "gui/acss.h"

#include <QHBoxLayout>
#include <QLabel>
#include <QToolButton>
#include <QVariant>

namespace {

constexpr int toolIconStyle = 6;
constexpr QSize iconSize(16, 16);
constexpr QSize buttonSize(28, 28);

} // namespace

KvDeskPanelHeader::KvDeskPanelHeader(const QString &title, const QString &closeTip, QWidget *parent)
    : QFrame(parent)
{
    setProperty("panel", true);
    auto *const titleLabel = new QLabel(title, this);
    titleLabel->setProperty("groupTitle", true);
    m_note = new QLabel(this);
    m_note->setProperty("caption", true);

    m_layout = new QHBoxLayout(this);
    m_layout->setContentsMargins(8, 4, 8, 4);
    m_layout->setSpacing(4);
    m_layout->addWidget(titleLabel);
    m_layout->addSpacing(4);
    m_layout->addWidget(m_note);
    m_layout->addStretch();
    m_closeButton = addButton(QStringLiteral("Icons/close-panel"), closeTip);
    connect(m_closeButton, SIGNAL(clicked()), this, SIGNAL(signalCloseClicked()));
}

void KvDeskPanelHeader::setNote(const QString &note)
{
    m_note->setText(note);
}

QString KvDeskPanelHeader::note() const
{
    return m_note->text();
}

QToolButton *KvDeskPanelHeader::addButton(const QString &iconPath, const QString &toolTip)
{
    auto *const button = new QToolButton(this);
    button->setAutoRaise(true);
    button->setIcon(acss::createIcon(toolIconStyle, iconPath, iconSize));
    button->setIconSize(iconSize);
    button->setFixedSize(buttonSize);
    button->setToolTip(toolTip);
    button->setAccessibleName(toolTip);
    addWidget(button);
    return button;
}

void KvDeskPanelHeader::addWidget(QWidget *widget)
{
    m_layout->insertWidget(m_layout->count() - (m_closeButton ? 1 : 0), widget);
}
