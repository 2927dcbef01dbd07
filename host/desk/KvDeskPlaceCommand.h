// SPDX-License-Identifier: MIT
#pragma once

#include "KvDeskObjectId.h"

#include <QPointF>
#include <QUndoCommand>

/**
 * A place of a counter that came or went. It keeps that place alone: thousands of clicks would else keep
 * thousands of copies of all places.
 */
class KvDeskPlaceCommand : public QUndoCommand
{
public:
    enum Kind { Add, Remove };

    /** \a index is that of the place among the counter's points, once it is there. */
    KvDeskPlaceCommand(const QString &text, Kind kind, KvDeskObjectId counter, int index,
                       const QPointF &place);

    void undo() override;
    void redo() override;

private:
    void insert();
    void take();

    Kind m_kind;
    KvDeskObjectId m_counter;
    int m_index;
    QPointF m_place;
};
