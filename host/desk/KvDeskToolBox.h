// SPDX-License-Identifier: MIT
#pragma once

#include <QObject>
#include <QVector>

#include <memory>
#include <vector>

class KvDeskActions;
class KvDeskCounterTool;
class KvDeskImageView;
class KvDeskTool;
class QAction;
class QWidget;

/** The measuring tools, of which one at a time gets mouse and keys of the image. Escape ends a tool. */
class KvDeskToolBox : public QObject
{
    Q_OBJECT
public:
    /** Both have to outlive this. */
    KvDeskToolBox(KvDeskActions *actions, KvDeskImageView *view, QObject *parent = nullptr);
    ~KvDeskToolBox() override;

    /** Actions of the tools in groups, in the order in which they are shown. */
    const QVector<QVector<QAction *>> &groups() const { return m_groups; }
    KvDeskCounterTool *counterTool() const { return m_counterTool; }
    KvDeskTool *tool(const QAction *action) const;

    /** The keys of the tools work in this widget, too: not everywhere, as they are letters. */
    void addKeysTo(QWidget *widget) const;

signals:
    void signalToolChanged();

private slots:
    void slotTriggered(QAction *aAction);
    void slotToolLeft();

private:
    void createTools();

    KvDeskActions *m_actions;
    KvDeskImageView *m_view;
    std::vector<std::unique_ptr<KvDeskTool>> m_tools;
    KvDeskCounterTool *m_counterTool = nullptr;
    QVector<QVector<QAction *>> m_groups;
};
