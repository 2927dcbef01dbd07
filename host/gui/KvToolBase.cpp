// SPDX-License-Identifier: MIT
#include "gui/KvToolBase.h"

#include "gui/KvGuiMainWindowBase.h"

#include <QFileInfo>
#include <QHBoxLayout>
#include <QLabel>
#include <QToolButton>
#include <QVBoxLayout>
#include <QVariant>

namespace {

constexpr int spacing = 4; ///< pixels: the grid inside a control

} // namespace

KvToolBase::KvToolBase(KvGuiMainWindowBase *mainWindow, const QIcon &icon, const QString &title,
                       const QString &name, bool activated)
    : QObject(mainWindow)
    , m_title(title)
{
    setObjectName(name);
    createButton(icon, activated);
    createPanel();
    if (mainWindow != nullptr)
        mainWindow->addTool(this);
}

KvToolBase::~KvToolBase()
{
    // Placed or not, they mean nothing without the tool. A dying main window may have deleted them already.
    delete m_button;
    delete m_panel;
}

QToolButton *KvToolBase::getToolButton() const
{
    return m_button;
}

void KvToolBase::setToolIcon(const QIcon &icon)
{
    if (m_button)
        m_button->setIcon(icon);
}

QWidget *KvToolBase::panel() const
{
    return m_panel;
}

void KvToolBase::setGuiWidget(QWidget *widget)
{
    if (widget == m_guiWidget || !m_panel)
        return;

    delete m_guiWidget;
    m_guiWidget = widget;
    if (widget != nullptr)
        m_panelLayout->addWidget(widget);
}

QWidget *KvToolBase::guiWidget() const
{
    return m_guiWidget;
}

void KvToolBase::setResetVisible(bool visible)
{
    if (m_resetButton)
        m_resetButton->setVisible(visible);
}

bool KvToolBase::isResetVisible() const
{
    return m_resetButton && !m_resetButton->isHidden();
}

QToolButton *KvToolBase::getResetButton() const
{
    return m_resetButton;
}

void KvToolBase::setEnabled(bool enabled, bool activate)
{
    if (!m_button)
        return;

    m_button->setEnabled(enabled);
    if (m_panel)
        m_panel->setEnabled(enabled);
    if (!enabled)
        m_button->setChecked(false);
    else if (activate)
        m_button->setChecked(true);
}

bool KvToolBase::isEnabled() const
{
    return m_button && m_button->isEnabled();
}

bool KvToolBase::isActivated() const
{
    return m_button && m_button->isChecked();
}

bool KvToolBase::opensFile(const QString &path) const
{
    return m_fileSuffixes.contains(QFileInfo(path).suffix(), Qt::CaseInsensitive);
}

void KvToolBase::openFile(const QString &path)
{
    if (!isEnabled())
        return;
    m_button->setChecked(true);
    emit fileGiven(path);
}

void KvToolBase::createButton(const QIcon &icon, bool activated)
{
    m_button = new QToolButton;
    m_button->setObjectName(name());
    m_button->setIcon(icon);
    m_button->setToolTip(m_title);
    m_button->setAccessibleName(m_title);
    m_button->setCheckable(true);
    m_button->setAutoRaise(true);
    m_button->setChecked(activated);
    connect(m_button, SIGNAL(toggled(bool)), this, SIGNAL(toolActivated(bool)));
}

void KvToolBase::createPanel()
{
    m_panel = new QWidget;
    m_panel->setObjectName(name() + QStringLiteral("Panel"));
    m_panelLayout = new QVBoxLayout(m_panel);
    m_panelLayout->setContentsMargins(0, 0, 0, 0);
    m_panelLayout->setSpacing(spacing);

    auto *const titleLabel = new QLabel(m_title, m_panel);
    titleLabel->setProperty("groupTitle", true);
    m_resetButton = new QToolButton(m_panel);
    m_resetButton->setText(tr("Reset"));
    m_resetButton->setToolTip(tr("Reset to the default values"));
    m_resetButton->setAutoRaise(true);
    connect(m_resetButton, SIGNAL(clicked()), this, SIGNAL(resetClicked()));

    auto *const titleRow = new QHBoxLayout;
    titleRow->setContentsMargins(2 * spacing, 0, 0, 0);
    titleRow->setSpacing(spacing);
    titleRow->addWidget(titleLabel, 1);
    titleRow->addWidget(m_resetButton);
    m_panelLayout->addLayout(titleRow);
}
