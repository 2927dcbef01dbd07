// SPDX-License-Identifier: MIT
#include "editor/KvEditorToolsList.h"

#include "editor/KvEditorToolCombo.h"
#include "editor/KvEditorToolWidget.h"
#include "templates/KvBaseEditorNodeFactory.h"

#include <QVBoxLayout>

namespace {
constexpr int kSpacing = 4;
}

KvEditorToolsList::KvEditorToolsList(QWidget *parent)
    : QFrame(parent)
    , m_column(new QVBoxLayout(this))
{
    m_column->setContentsMargins(0, 0, 0, 0);
    m_column->setSpacing(kSpacing);
}

KvEditorToolsList::~KvEditorToolsList() = default;

void KvEditorToolsList::registerFactory(std::unique_ptr<KvBaseEditorNodeFactory> factory,
                                        const KvBlockGroup &group)
{
    if (!factory)
        return;
    KvEditorToolWidget *tool = factory->toolWidget(this);
    m_types.registerFactory(std::move(factory), group);
    if (group.title.isEmpty())
        m_column->addWidget(tool);
    else
        groupOf(group)->addTool(tool);
    connect(tool, SIGNAL(signalToolActivated(QString)), this, SIGNAL(signalToolActivated(QString)));
}

KvEditorToolCombo *KvEditorToolsList::groupOf(const KvBlockGroup &group)
{
    for (KvEditorToolCombo *known : qAsConst(m_groups)) {
        if (known->title() == group.title)
            return known;
    }
    auto *combo = new KvEditorToolCombo(group.title, group.iconPath, this);
    m_groups.append(combo);
    m_column->addWidget(combo);
    return combo;
}

KvBaseEditorNodeFactory *KvEditorToolsList::find(const QString &name) const
{
    return m_types.find(name);
}

QVector<KvBlockType> KvEditorToolsList::blockTypes() const
{
    return m_types.blockTypes();
}
