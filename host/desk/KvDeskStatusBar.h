// SPDX-License-Identifier: MIT
#pragma once

#include "common/ZtAppStatus.h"

#include <QPointF>
#include <QStatusBar>

class KvDeskElidedLabel;
class QLabel;
class ZtCalibration;

/** Status bar: the newest message of the status log with its category, and what is known about the image. */
class KvDeskStatusBar : public QStatusBar
{
    Q_OBJECT
public:
    explicit KvDeskStatusBar(QWidget *parent = nullptr);

    /** Size of the image in pixels (empty: there is none) and what it is measured with. */
    void setImage(const QSize &size, const ZtCalibration &calibration);
    QString message() const;
    QString imageText() const;
    QString zoomText() const;
    QString positionText() const;
    QString statisticsText() const;

public slots:
    /** What the selected values come to, in one line and as a tool tip; empty for none. */
    void slotSetStatistics(const QString &aText, const QString &aDetails);
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
    KvDeskElidedLabel *m_statistics;
    QLabel *m_position;
    QLabel *m_image;
    QLabel *m_zoom;
};
