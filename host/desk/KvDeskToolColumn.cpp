// SPDX-License-Identifier: MIT
#include "KvDeskToolColumn.h"

#include "gui/KvToolBase.h"

#include <QEvent>
#include <QGridLayout>
#include <QScrollArea>
#include <QScrollBar>
#include <QToolButton>
#include <QVariant>

namespace {

constexpr int margin = 8;
constexpr int groupSpacing = 16;
constexpr int buttonsPerRow = 4;
constexpr QSize toolButtonSize(40, 32);
constexpr QSize toolIconSize(32, 24);
constexpr int smallestPanelWidth = 158;

QFrame *separator(QWidget *parent)
{
    auto *const line = new QFrame(parent);
    line->setProperty("separator", true);
    return line;
}

} // namespace

KvDeskToolColumn::KvDeskToolColumn(QWidget *parent)
    : QFrame(parent)
{
    setProperty("panel", true);
    setSizePolicy(QSizePolicy::Fixed, QSizePolicy::Preferred);

    m_buttons = new QGridLayout;
    m_buttons->setContentsMargins(margin, margin, margin, margin);
    m_buttons->setSpacing(4);
    m_buttons->setColumnStretch(buttonsPerRow, 1);
    QFrame *const line = separator(this);
    line->setFixedHeight(1);
    QFrame *const border = separator(this);
    border->setFixedWidth(1);

    auto *const content = new QFrame;
    content->setProperty("panel", true);
    m_panels = new QVBoxLayout(content);
    m_panels->setContentsMargins(margin, margin, margin, margin);
    m_panels->setSpacing(groupSpacing);
    m_panels->addStretch();
    m_scrollArea = new QScrollArea(this);
    m_scrollArea->setFrameShape(QFrame::NoFrame);
    m_scrollArea->setHorizontalScrollBarPolicy(Qt::ScrollBarAlwaysOff);
    m_scrollArea->setWidgetResizable(true);
    m_scrollArea->setWidget(content);
    m_scrollArea->setFocusPolicy(Qt::NoFocus);

    auto *const layout = new QGridLayout(this);
    layout->setContentsMargins(0, 0, 0, 0);
    layout->setSpacing(0);
    layout->addLayout(m_buttons, 0, 0);
    layout->addWidget(line, 1, 0);
    layout->addWidget(m_scrollArea, 2, 0);
    layout->addWidget(border, 0, 1, 3, 1);
    m_scrollArea->verticalScrollBar()->installEventFilter(this);
}

void KvDeskToolColumn::addTool(KvToolBase *tool)
{
    QToolButton *const button = tool->getToolButton();
    button->setIconSize(toolIconSize);
    button->setFixedSize(toolButtonSize);
    m_buttons->addWidget(button, m_toolCount / buttonsPerRow, m_toolCount % buttonsPerRow);
    ++m_toolCount;

    QWidget *const panel = tool->panel();
    m_panels->insertWidget(m_panels->count() - 1, panel);
    panel->setVisible(tool->isActivated());
    panel->installEventFilter(this);
    connect(tool, SIGNAL(toolActivated(bool)), panel, SLOT(setVisible(bool)));
    updateGeometry();
}

QSize KvDeskToolColumn::sizeHint() const
{
    int width = smallestPanelWidth;
    for (int i = 0; i < m_panels->count(); ++i) {
        if (const QWidget *const panel = m_panels->itemAt(i)->widget())
            width = qMax(width, panel->sizeHint().width());
    }
    const QScrollBar *const bar = m_scrollArea->verticalScrollBar();
    return QSize(width + 2 * margin + 1 + (bar->isVisible() ? bar->sizeHint().width() : 0),
                 QFrame::sizeHint().height());
}

QSize KvDeskToolColumn::minimumSizeHint() const
{
    return QSize(sizeHint().width(), QFrame::minimumSizeHint().height());
}

bool KvDeskToolColumn::eventFilter(QObject *watched, QEvent *event)
{
    const bool isOfWidth = event->type() == QEvent::LayoutRequest || event->type() == QEvent::Show ||
                           event->type() == QEvent::Hide;
    if (isOfWidth)
        updateGeometry();
    return QFrame::eventFilter(watched, event);
}
