// SPDX-License-Identifier: MIT
#pragma once

#include "KvDeskObjectLayer.h"
#include "KvDeskObjectPlaces.h"

#include <QObject>
#include <QPointer>
#include <QTimer>

class KvDeskSelection;
class ZtObjectsPainter;

/**
 * The objects as they are seen in the view: all of them below, the selected ones and the labels above. Both
 * are kept as pictures, so that a new frame of a camera costs the same with or without objects.
 */
class KvDeskOverlay : public QObject
{
    Q_OBJECT
public:
    explicit KvDeskOverlay(QObject *parent = nullptr);

    /** Null draws no labels. */
    void setPainter(const ZtObjectsPainter *painter);
    void setSelection(KvDeskSelection *selection);

    const KvDeskObjectPlaces &places() const { return m_places; }

    /** \a painter may carry any transform. */
    void draw(QPainter *painter, const QTransform &toView, const QSize &size, double pixelRatio);
    qint64 drawnObjects() const { return m_objects.drawnObjects(); }

public slots:
    void slotLabelsChanged(); ///< labels read differently, come or go

signals:
    void signalUpdated(); ///< the objects look differently now

private slots:
    void slotPlaceChanged(int aType, int aId, QRectF aBefore, QRectF aAfter);
    void slotReset();
    void slotSelectionChanged();
    void slotSharpen();

private:
    bool isLiftable(const KvDeskObjectId &object) const;
    void settle();
    void drawTop(const QTransform &toView, const QSize &size);
    void drawSelected(QPainter *painter, const QVector<KvDeskObjectId> &selected) const;
    void drawSelectedRoughly(QPainter *painter, const QVector<KvDeskObjectId> &selected) const;
    QVector<KvDeskObjectId> selectedIn(const QRectF &area) const;
    QVector<KvDeskObjectId> labelledIn(const QRectF &area, const QVector<KvDeskObjectId> &selected) const;
    QVector<KvDeskObjectId> textsIn(const QRectF &area) const;

    KvDeskObjectPlaces m_places;
    KvDeskObjectLayer m_objects;
    const ZtObjectsPainter *m_painter = nullptr;
    QPointer<KvDeskSelection> m_selection;
    QImage m_top; ///< selected objects and labels
    QTransform m_topTransform;
    bool m_isTopStale = true;
    QTimer m_sharpenTimer;
};
