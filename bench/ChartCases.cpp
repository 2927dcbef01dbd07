// SPDX-License-Identifier: MIT
#include "ChartCases.h"

#include "charts/KvBaseAxis.h"
#include "charts/KvLineSerie.h"
#include "charts/KvSeriesPalette.h"
#include "data/KvStatisticsEngine.h"

#include <QBuffer>
#include <QPainter>
#include <QPdfWriter>

#include <cmath>

namespace {

constexpr int kSeries = 3;
constexpr int kPictureSize = 900;
const QRectF kScene(-150, -100, 1250, 1250);

QString seriesName(int index)
{
    return QStringLiteral("Series %1").arg(index);
}

QPen cosmeticPen(const QColor &color)
{
    QPen pen(color, 1.0);
    pen.setCosmetic(true);
    return pen;
}

QFont labelFont(const QPaintDevice *device, qreal pointSize)
{
    QFont font(QStringLiteral("Segoe UI"));
    font.setPointSizeF(pointSize * 96.0 / device->logicalDpiY());
    return font;
}

} // namespace

TrendChartCase::TrendChartCase(int pointCount, int categoryCount)
    : m_chart(&m_themes)
    , m_values(kSeries)
{
    for (int i = 0; i < categoryCount; ++i)
        m_categories.append(QString::number(i));
    for (int s = 0; s < kSeries; ++s) {
        for (int i = 0; i < pointCount / kSeries; ++i)
            m_values[s].append(50 + 15 * s + 20 * std::sin(i * 12.9898 + s) * std::cos(i * 0.37));
    }
    fill();
}

void TrendChartCase::fill()
{
    m_chart.beginUpdate();
    m_chart.clearSeries();
    for (int s = 0; s < kSeries; ++s) {
        kvCharts::KvLineSerie *serie = m_chart.addSerie(seriesName(s));
        serie->setShowTrend(true);
        for (int i = 0; i < m_values.at(s).size(); ++i) {
            const QString &category = m_categories.at(i % m_categories.size());
            m_chart.addCategory(category);
            serie->addPoint(category, m_values.at(s).at(i));
        }
    }
    m_chart.endUpdate();
}

void TrendChartCase::rebuild()
{
    m_chart.refresh();
}

QImage TrendChartCase::paintChart()
{
    QImage image(kPictureSize, kPictureSize, QImage::Format_ARGB32_Premultiplied);
    QPainter painter(&image);
    painter.setRenderHint(QPainter::Antialiasing);
    m_chart.render(&painter, QRectF(image.rect()), kScene);
    return image;
}

QImage TrendChartCase::paintFloor()
{
    QImage image(kPictureSize, kPictureSize, QImage::Format_ARGB32_Premultiplied);
    QPainter painter(&image);
    painter.setRenderHint(QPainter::Antialiasing);
    painter.setClipRect(image.rect());
    painter.setTransform(viewTransform(QRectF(image.rect())));
    drawFloor(&painter, false);
    return image;
}

QByteArray TrendChartCase::printChart()
{
    QBuffer buffer;
    buffer.open(QIODevice::WriteOnly);
    {
        QPdfWriter writer(&buffer);
        QPainter painter(&writer);
        m_chart.render(&painter, QRectF(0, 0, 8000, 8000), kScene);
    }
    return buffer.data();
}

QByteArray TrendChartCase::printFloor()
{
    QBuffer buffer;
    buffer.open(QIODevice::WriteOnly);
    {
        QPdfWriter writer(&buffer);
        QPainter painter(&writer);
        painter.setClipRect(QRectF(0, 0, 8000, 8000));
        painter.setTransform(viewTransform(QRectF(0, 0, 8000, 8000)));
        drawFloor(&painter, true);
    }
    return buffer.data();
}

kvCharts::KvAxisRange TrendChartCase::floorRange() const
{
    double least = m_values.first().first();
    double greatest = least;
    for (const QVector<double> &values : m_values) {
        for (const double value : values) {
            least = std::min(least, value);
            greatest = std::max(greatest, value);
        }
    }
    return kvCharts::KvAxisRange::around(least, greatest);
}

QVector<TrendChartCase::FloorSeries> TrendChartCase::mapPoints(const kvCharts::KvAxisRange &range) const
{
    const double step = 1000.0 / m_categories.size();
    const double scale = 1000.0 / (range.maximum - range.minimum);
    QVector<FloorSeries> result;
    for (int s = 0; s < m_values.size(); ++s) {
        FloorSeries series{kvCharts::seriesColor(s), {}, {}};
        series.points.reserve(m_values.at(s).size());
        for (int i = 0; i < m_values.at(s).size(); ++i) {
            const double x = (i % m_categories.size() + 0.5) * step;
            series.points.append(QPointF(x, 1000 - (m_values.at(s).at(i) - range.minimum) * scale));
        }
        const QPair<double, double> line = KvStatisticsEngine::regression(series.points);
        series.trend = QLineF(-50, line.second - 50 * line.first, 1050, line.second + 1050 * line.first);
        result.append(series);
    }
    return result;
}

void TrendChartCase::drawFloor(QPainter *painter, bool roundPoints) const
{
    painter->fillRect(kScene, m_themes.colors().at(0));
    const kvCharts::KvAxisRange range = floorRange();
    drawFloorAxes(painter, range);
    drawFloorLegend(painter);
    for (const FloorSeries &series : mapPoints(range)) {
        painter->setPen(cosmeticPen(series.color));
        painter->setBrush(series.color);
        painter->drawPolyline(series.points.constData(), series.points.size());
        if (roundPoints) {
            painter->setPen(QPen(series.color, 5.0, Qt::SolidLine, Qt::RoundCap));
            painter->drawPoints(series.points.constData(), series.points.size());
        } else {
            for (const QPointF &point : series.points)
                painter->drawEllipse(QRectF(point.x() - 2, point.y() - 2, 5, 5));
        }
        QPen trendPen = cosmeticPen(series.color);
        trendPen.setDashPattern({6, 8});
        painter->setPen(trendPen);
        painter->drawLine(series.trend);
    }
}

void TrendChartCase::drawFloorAxes(QPainter *painter, const kvCharts::KvAxisRange &range) const
{
    const double band = 1000.0 / m_categories.size();
    QVector<QLineF> lines{QLineF(0, 1000, 1000, 1000), QLineF(0, 1000, 0, 0)};
    for (int i = 0; i <= m_categories.size(); ++i)
        lines.append(QLineF(i * band, 1000, i * band, 1005));
    for (int i = 0; i < range.tickCount; ++i)
        lines.append(QLineF(-5, i * 1000.0 / (range.tickCount - 1), 0, i * 1000.0 / (range.tickCount - 1)));
    painter->setPen(cosmeticPen(m_themes.colors().at(6)));
    painter->drawLines(lines);

    const QFont font = labelFont(painter->device(), 11.0);
    const QFontMetricsF metrics(font, painter->device());
    painter->setFont(font);
    painter->setPen(m_themes.colors().at(3));
    for (int i = 0; i < m_categories.size(); ++i) {
        const QString &text = m_categories.at(i);
        painter->drawText(QPointF((i + 0.5) * band - metrics.horizontalAdvance(text) / 2, 1026), text);
    }
    for (int i = 0; i < range.tickCount; ++i) {
        const QString text =
            QString::number(range.minimum + i * (range.maximum - range.minimum) / (range.tickCount - 1));
        painter->drawText(
            QPointF(-11 - metrics.horizontalAdvance(text), 1006 - i * 1000.0 / (range.tickCount - 1)), text);
    }
}

void TrendChartCase::drawFloorLegend(QPainter *painter) const
{
    const QFont font = labelFont(painter->device(), 12.0);
    const QFontMetricsF metrics(font, painter->device());
    painter->setFont(font);
    double x = 300;
    for (int s = 0; s < m_values.size(); ++s) {
        painter->setPen(cosmeticPen(kvCharts::seriesColor(s)));
        painter->setBrush(kvCharts::seriesColor(s));
        painter->drawRect(QRectF(x, -20, 7, 7));
        painter->setPen(m_themes.colors().at(2));
        painter->drawText(QPointF(x + 20, -10), seriesName(s));
        x += metrics.horizontalAdvance(seriesName(s)) + 56;
    }
}

QTransform TrendChartCase::viewTransform(const QRectF &target) const
{
    const double scale = target.width() / kScene.width();
    return QTransform::fromTranslate(-kScene.left(), -kScene.top()) * QTransform::fromScale(scale, scale);
}
