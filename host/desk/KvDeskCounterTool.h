// SPDX-License-Identifier: MIT
#pragma once

#include "KvDeskObjectId.h"
#include "KvDeskTool.h"

#include <QVector>

/**
 * Counts by clicks: each adds a place to the chosen counter; a click with the right button or with Alt takes
 * the nearest place away again. Every counter is a class of its own; digits choose one, and the
 * digit after the last begins another. Nothing beside the image is counted.
 *
 * The chosen counter is the one that is selected, so that table, image and tool agree.
 */
class KvDeskCounterTool : public KvDeskTool
{
public:
    using KvDeskTool::KvDeskTool;

    /** The counter that gets the clicks; none where there is no counter yet. */
    KvDeskObjectId counter() const;
    static QVector<KvDeskObjectId> counters();
    void choose(const KvDeskObjectId &counter);
    void addClass();

    void press(const KvDeskPointer &pointer) override;
    void move(const KvDeskPointer &pointer) override;
    void release(const KvDeskPointer &pointer) override;
    void doubleClick(const KvDeskPointer &pointer) override;
    bool key(QKeyEvent *event) override;
    void cancel() override;
    bool isBusy() const override { return m_isByKeys; }
    void draw(QPainter *painter) const override;
    Qt::CursorShape cursor() const override { return Qt::CrossCursor; }

private:
    bool isCountable(const QPointF &place) const;
    void add(const QPointF &place);
    void removeNear(const QPointF &place);
    void chooseByDigit(int index);
    bool moveCrosshair(const QKeyEvent &event);

    QPointF m_target;
    bool m_hasTarget = false;
    bool m_isByKeys = false;
};
