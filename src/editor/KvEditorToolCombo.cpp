// SPDX-License-Identifier: MIT
#include "editor/KvEditorToolCombo.h"

#include "editor/KvEditorPaletteRow.h"
#include "gui/acss.h"
#include "resources/KvReportResources.h"

#include <QEvent>
#include <QVBoxLayout>

namespace {
constexpr int kIconMode = 6;
constexpr QSize kIconSize(24, 24);
constexpr QSize kArrowSize(11, 7);
constexpr int kIndent = 16;
constexpr int kSpacing = 4;
} // namespace

KvEditorToolCombo::KvEditorToolCombo(const QString &title, const QString &iconPath, QWidget *parent)
    : QFrame(parent)
    , m_header(new KvEditorPaletteRow(this))
    , m_contentsFrame(new QFrame(this))
    , m_contents(new QVBoxLayout(m_contentsFrame))
{
    KvReportResources::ensure();
    m_header->setObjectName(QStringLiteral("header"));
    m_header->setText(title);
    m_header->setIcon(acss::createIcon(kIconMode, iconPath, kIconSize));
    m_header->setCursor(Qt::PointingHandCursor);
    m_contentsFrame->setObjectName(QStringLiteral("contentsFrame"));
    m_contentsFrame->hide();
    m_contents->setContentsMargins(kIndent, kSpacing, 0, 0);
    m_contents->setSpacing(kSpacing);
    auto *column = new QVBoxLayout(this);
    column->setContentsMargins(0, 0, 0, 0);
    column->setSpacing(0);
    column->addWidget(m_header);
    column->addWidget(m_contentsFrame);
    updateHeader();
    connect(m_header, SIGNAL(signalActivated()), this, SLOT(slotHeaderActivated()));
}

QString KvEditorToolCombo::title() const
{
    return m_header->text();
}

void KvEditorToolCombo::addTool(QWidget *tool)
{
    m_contents->addWidget(tool);
}

void KvEditorToolCombo::setOpen(bool open)
{
    if (open == m_isOpen)
        return;
    m_isOpen = open;
    m_contentsFrame->setVisible(open);
    updateHeader();
}

void KvEditorToolCombo::slotHeaderActivated()
{
    setOpen(!m_isOpen);
}

void KvEditorToolCombo::updateHeader()
{
    m_header->setMark(m_isOpen ? QStringLiteral("Icons/arrow-up") : QStringLiteral("Icons/arrow-down"),
                      kArrowSize);
    m_header->setAccessibleDescription(m_isOpen ? tr("Group of blocks, open")
                                                : tr("Group of blocks, closed"));
    m_header->setToolTip(m_isOpen ? tr("Close the group (Enter)") : tr("Open the group (Enter)"));
}

void KvEditorToolCombo::changeEvent(QEvent *event)
{
    QFrame::changeEvent(event);
    if (event->type() == QEvent::LanguageChange)
        updateHeader();
}
