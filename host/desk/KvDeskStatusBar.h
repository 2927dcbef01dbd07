// SPDX-License-Identifier: MIT
#pragma once

#include "common/ZtAppStatus.h"

#include <QPointF>
#include <QStatusBar>

class KvDeskElidedLabel;
class QLabel;

/** Status bar: the newest message of the status log with its category, and what is known about the image. */
class KvDeskStatusBar : public QStatusBar
{
    Q_OBJECT
public:
    explicit KvDeskStatusBar(QWidget *parent = nullptr);

    /** Size of the image in pixels (empty: there is none) and micrometres per pixel (0: uncalibrated). */
    void setImage(const QSize &size, double pixelSize);
    QString message() const;
    QString imageText() const;
    QString zoomText() const;
    QString positionText() const;

public slots:
    /** \a aZoom is 1 for 100 %. */
    void slotZoomChanged(double aZoom);
    void slotPointerMoved(QPointF aPosition);
    void slotPointerLeft();

private slots:
    void slotEntryLogged(const ZtStatusEntry &aEntry);
    void slotCleared();
    void slotThemeChanged();

private:
    void showLastEntry();
    void showEntry(const ZtStatusEntry &entry);

    QLabel *m_icon;
    QLabel *m_category;
    KvDeskElidedLabel *m_message;
    QLabel *m_position;
    QLabel *m_image;
    QLabel *m_zoom;
};
