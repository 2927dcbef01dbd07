// SPDX-License-Identifier: MIT
#include "KvDeskToolBox.h"

#include "KvDeskActions.h"
#include "KvDeskCounterTool.h"
#include "KvDeskDrawTool.h"
#include "KvDeskImageView.h"
#include "measuring/ZtDrawnType.h"

#include <QAction>
#include <QActionGroup>

namespace {

using A = KvDeskActions;

struct DrawnTool
{
    A::Id id;
    int typeId; ///< 0 for the tool that selects
    int group;
};

constexpr DrawnTool drawnTools[] = {
    {A::SelectTool, 0, 0},
    {A::LineTool, ZtDrawnType::Line, 1},
    {A::PolylineTool, ZtDrawnType::Polyline, 1},
    {A::ParallelTool, ZtDrawnType::ParallelDistance, 1},
    {A::ArcTool, ZtDrawnType::Arc, 1},
    {A::CircleTool, ZtDrawnType::Circle, 2},
    {A::RectangleTool, ZtDrawnType::Rectangle, 2},
    {A::PolygonTool, ZtDrawnType::Polygon, 2},
    {A::CounterTool, ZtDrawnType::Counter, 3},
    {A::NoteTool, ZtDrawnType::TextNote, 4},
    {A::ScaleBarTool, ZtDrawnType::ScaleBar, 4},
};

} // namespace

KvDeskToolBox::KvDeskToolBox(KvDeskActions *actions, KvDeskImageView *view, QObject *parent)
    : QObject(parent)
    , m_actions(actions)
    , m_view(view)
{
    createTools();
    addKeysTo(view);
    connect(view, SIGNAL(signalToolLeft()), this, SLOT(slotToolLeft()));
}

KvDeskToolBox::~KvDeskToolBox() = default;

void KvDeskToolBox::createTools()
{
    auto *const group = new QActionGroup(this);
    for (const DrawnTool &definition : drawnTools) {
        std::unique_ptr<KvDeskTool> tool;
        if (definition.typeId == ZtDrawnType::Counter) {
            auto counterTool = std::make_unique<KvDeskCounterTool>(m_view);
            m_counterTool = counterTool.get();
            tool = std::move(counterTool);
        } else if (definition.typeId != 0) {
            tool = std::make_unique<KvDeskDrawTool>(m_view, definition.typeId);
        }
        QAction *const action = m_actions->action(definition.id);
        // The place in m_tools; the tool that selects is the view's own.
        action->setData(static_cast<int>(m_tools.size()));
        action->setShortcutContext(Qt::WidgetWithChildrenShortcut);
        group->addAction(action);
        m_tools.push_back(std::move(tool));
        if (definition.group >= m_groups.size())
            m_groups.append(QVector<QAction *>());
        m_groups.last().append(action);
    }
    m_actions->action(A::SelectTool)->setChecked(true);
    connect(group, SIGNAL(triggered(QAction*)), this, SLOT(slotTriggered(QAction*)));
}

KvDeskTool *KvDeskToolBox::tool(const QAction *action) const
{
    return m_tools.at(static_cast<std::size_t>(action->data().toInt())).get();
}

void KvDeskToolBox::addKeysTo(QWidget *widget) const
{
    for (const QVector<QAction *> &group : m_groups)
        widget->addActions(group.toList());
}

void KvDeskToolBox::slotTriggered(QAction *aAction)
{
    m_view->setTool(tool(aAction));
    m_view->setFocus();
    emit signalToolChanged();
}

void KvDeskToolBox::slotToolLeft()
{
    m_actions->action(A::SelectTool)->trigger();
}
