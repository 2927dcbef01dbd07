// SPDX-License-Identifier: MIT
#pragma once

#include <QGraphicsView>
#include <QPointer>

namespace kvCharts {

class KvChart;
class KvChartThemes;

/** Shows a whole chart, scaled to its size. */
class KvChartView : public QGraphicsView
{
    Q_OBJECT
public:
    /** Starts with an empty chart of these themes, which outlive the view. */
    explicit KvChartView(const KvChartThemes *themes, QWidget *parent = nullptr);
    ~KvChartView() override;

    /** Shows another chart, which the view takes over, and deletes the one before. */
    void setChart(kvCharts::KvChart *chart);
    KvChart *chart() const;

    /** Scene rectangle of the chart. */
    QRectF chartRect() const;
    /** Fixes the width, in pixels, and the height that the chart then needs. */
    void setFixedWidthKeepRatio(int width);

public slots:
    void slotSceneRectChanged(const QRectF &aRect);

protected:
    void resizeEvent(QResizeEvent *event) override;

private:
    void showChart(KvChart *chart);
    void fitChart();

    QPointer<KvChart> m_chart;
    Qt::AspectRatioMode m_aspectRatioMode = Qt::KeepAspectRatio;
};

} // namespace kvCharts
