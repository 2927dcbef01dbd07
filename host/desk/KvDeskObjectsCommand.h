// SPDX-License-Identifier: MIT
#pragma once

#include "KvDeskObjectState.h"

#include <QUndoCommand>

/** A step of the history that changed objects from one state to another; it came in one piece or grew in the
 * course of one gesture. */
class KvDeskObjectsCommand : public QUndoCommand
{
public:
    /**
     * \param before,after states of the same objects in the same order
     * \param gesture      steps on the same objects with the same number become one; 0 for a step of its own
     */
    KvDeskObjectsCommand(const QString &text, const QVector<KvDeskObjectState> &before,
                         const QVector<KvDeskObjectState> &after, int gesture = 0);

    void undo() override;
    void redo() override;
    int id() const override;
    bool mergeWith(const QUndoCommand *other) override;

private:
    bool isOfSameObjects(const KvDeskObjectsCommand &other) const;

    QVector<KvDeskObjectState> m_before;
    QVector<KvDeskObjectState> m_after;
    int m_gesture;
};
