// SPDX-License-Identifier: MIT
#include "ItemByItem.h"

#include "SceneItems.h"
#include "charts/KvLineRunItem.h"
#include "charts/KvTextRunItem.h"

#include <QGraphicsItemGroup>
#include <QGraphicsTextItem>
#include <QPainter>

#include <algorithm>
#include <cmath>

namespace ItemByItem {

namespace {

QString number(double value)
{
    return QString::number(value, 'g', 6);
}

QSizeF textSize(const QString &text)
{
    QGraphicsTextItem item(text);
    item.setFont(font(11.0));
    return item.boundingRect().size();
}

// Returns the height of the rows.
double addLegendEntries(QGraphicsScene *scene, const QVector<LegendEntry> &entries, const QColor &textColor)
{
    QGraphicsItemGroup *group = scene->createItemGroup({});
    double x = 0;
    double y = 0;
    for (const LegendEntry &entry : entries) {
        group->addToGroup(scene->addRect(x, y, 7, 7, cosmeticPen(entry.color), QBrush(entry.color)));
        QGraphicsTextItem *text = scene->addText(entry.text, font(12.0));
        const QSizeF size = text->boundingRect().size();
        text->setDefaultTextColor(textColor);
        text->setPos(x + 16, y + 4 - size.height() / 2);
        group->addToGroup(text);
        x += size.width() + 16 + 32;
        if (x > 800) {
            x = 0;
            y += size.height() + 10;
        }
    }
    const QSizeF size = group->boundingRect().size();
    group->setPos(500 - size.width() / 2, -size.height());
    return size.height();
}

using Component = int (*)(QRgb);

// The least and the greatest value of a colour component around a pixel.
std::pair<int, int> rangeAround(const QImage &image, int x, int y, Component component)
{
    int least = 255;
    int greatest = 0;
    for (int row = std::max(y - 1, 0); row <= std::min(y + 1, image.height() - 1); ++row) {
        const auto *line = reinterpret_cast<const QRgb *>(image.constScanLine(row));
        for (int column = std::max(x - 1, 0); column <= std::min(x + 1, image.width() - 1); ++column) {
            least = std::min(least, component(line[column]));
            greatest = std::max(greatest, component(line[column]));
        }
    }
    return {least, greatest};
}

// Whether a pixel's colour occurs around the same place of the other picture. A thin stroke that stands half
// beside its pixel loses less than half of its contrast.
bool occurs(const QImage &picture, const QImage &other, int x, int y)
{
    const QRgb color = picture.pixel(x, y);
    if (color == other.pixel(x, y))
        return true;
    const QRgb ground = picture.pixel(0, 0);
    for (const Component component : {Component(qRed), Component(qGreen), Component(qBlue)}) {
        const int value = component(color);
        const int tolerance = std::abs(value - component(ground)) * 45 / 100 + 2;
        const auto range = rangeAround(other, x, y, component);
        if (value < range.first - tolerance || value > range.second + tolerance)
            return false;
    }
    return true;
}

bool allOccur(const QImage &picture, const QImage &other)
{
    for (int y = 0; y < picture.height(); ++y) {
        for (int x = 0; x < picture.width(); ++x) {
            if (!occurs(picture, other, x, y))
                return false;
        }
    }
    return true;
}

QString placedLine(const QLineF &line, const QPen &pen)
{
    QString text;
    for (const qreal coordinate : {line.x1(), line.y1(), line.x2(), line.y2()})
        text += QStringLiteral("%1 ").arg(coordinate, 0, 'f', 6);
    return text + QStringLiteral("in %1 %2 %3 %4")
                      .arg(pen.color().name())
                      .arg(pen.widthF())
                      .arg(pen.style())
                      .arg(pen.isCosmetic());
}

} // namespace

QFont font(qreal pointSize)
{
    QFont result(QStringLiteral("Segoe UI"));
    result.setPointSizeF(pointSize);
    result.setLetterSpacing(QFont::AbsoluteSpacing, 1.0 / 64);
    return result;
}

QPen cosmeticPen(const QColor &color, qreal width)
{
    QPen pen(color, width);
    pen.setCosmetic(true);
    return pen;
}

void addText(QGraphicsScene *scene, const QString &text, const QPointF &topLeft, const QColor &color,
             qreal pointSize)
{
    QGraphicsTextItem *item = scene->addText(text, font(pointSize));
    item->setDefaultTextColor(color);
    item->setPos(topLeft);
}

void addValueAxisX(QGraphicsScene *scene, const AxisLook &look, double min, double max, int tickCount)
{
    scene->addLine(0, 1000, 1000, 1000, look.axisPen);
    double x = 0;
    double value = min;
    for (int i = 0; i < tickCount; ++i) {
        scene->addLine(x, 1000, x, 1005, look.axisPen);
        if (look.grid && i >= 1)
            scene->addLine(x, 0, x, 999, look.gridPen);
        const QString text = number(value);
        addText(scene, text, QPointF(x - textSize(text).width() / 2, 1005), look.textColor);
        if (tickCount > 1) {
            x += 1000.0 / (tickCount - 1);
            value += (max - min) / (tickCount - 1);
        }
    }
}

void addValueAxisY(QGraphicsScene *scene, const AxisLook &look, double min, double max, int tickCount)
{
    scene->addLine(0, 1000, 0, 0, look.axisPen);
    double offset = 0;
    double value = min;
    for (int i = 0; i < tickCount; ++i) {
        const double y = 1000 - offset;
        scene->addLine(-5, y, 0, y, look.axisPen);
        if (look.grid)
            scene->addLine(1, y, 1000, y, look.gridPen);
        const QString text = number(value);
        const QSizeF size = textSize(text);
        addText(scene, text, QPointF(-5 - size.width() - 2, y - size.height() / 2), look.textColor);
        if (tickCount > 1) {
            offset += 1000.0 / (tickCount - 1);
            value += (max - min) / (tickCount - 1);
        }
    }
}

void addCategoryAxisX(QGraphicsScene *scene, const AxisLook &look, const QStringList &categories)
{
    scene->addLine(0, 1000, 1000, 1000, look.axisPen);
    scene->addLine(0, 1000, 0, 1005, look.axisPen);
    double left = 0;
    for (const QString &text : categories) {
        const double right = left + 1000.0 / categories.size();
        scene->addLine(right, 1000, right, 1005, look.axisPen);
        if (look.grid)
            scene->addLine(right, 0, right, 999, look.gridPen);
        addText(scene, text, QPointF((left + right) / 2 - textSize(text).width() / 2, 1005), look.textColor);
        left = right;
    }
}

void addCategoryAxisY(QGraphicsScene *scene, const AxisLook &look, const QStringList &categories)
{
    scene->addLine(0, 1000, 0, 0, look.axisPen);
    scene->addLine(-5, 1000, 0, 1000, look.axisPen);
    const double band = 1000.0 / categories.size();
    for (int i = 0; i < categories.size(); ++i) {
        const double top = i * band;
        const double bottom = (i + 1) * band;
        const double y = 1000 - bottom;
        scene->addLine(-5, y, 0, y, look.axisPen);
        if (look.grid)
            scene->addLine(1, y, 1000, y, look.gridPen);
        const QSizeF size = textSize(categories.at(i));
        addText(scene, categories.at(i), QPointF(-5 - size.width(), (top + bottom - size.height()) / 2),
                look.textColor);
    }
}

void addSeries(QGraphicsScene *scene, const QVector<QPointF> &points, const QColor &color)
{
    const QPen pen = cosmeticPen(color);
    QPointF previous;
    for (const QPointF &point : points) {
        scene->addEllipse(point.x() - 2, point.y() - 2, 5, 5, pen, QBrush(color));
        if (!previous.isNull())
            scene->addLine(QLineF(previous, point), pen);
        previous = point;
    }
}

void addLegend(QGraphicsScene *scene, const QVector<LegendEntry> &entries, const QString &title,
               const QColor &textColor)
{
    const double top = entries.isEmpty() ? 0 : -6 - addLegendEntries(scene, entries, textColor);
    if (title.isEmpty())
        return;
    QFont titleFont = font(14.0);
    titleFont.setBold(true);
    QGraphicsTextItem *text = scene->addText(title, titleFont);
    text->setDefaultTextColor(textColor);
    text->setPos(500 - text->boundingRect().width() / 2, top - text->boundingRect().height());
}

QImage picture(QGraphicsScene *scene, const QRectF &source)
{
    QImage image(900, 900, QImage::Format_ARGB32_Premultiplied);
    image.fill(scene->backgroundBrush().color());
    QPainter painter(&image);
    painter.setRenderHint(QPainter::Antialiasing);
    scene->render(&painter, QRectF(image.rect()), source);
    return image;
}

bool alike(const QImage &first, const QImage &second)
{
    return first.size() == second.size() && inkedPixels(second) > 500 && allOccur(first, second) &&
           allOccur(second, first);
}

QStringList placedTexts(const QGraphicsScene *scene)
{
    QStringList result;
    const auto append = [&result](const QString &text, const QPointF &topLeft, const QSizeF &size) {
        result.append(QStringLiteral("%1 at %2 %3, %4 x %5")
                          .arg(text)
                          .arg(topLeft.x(), 0, 'f', 6)
                          .arg(topLeft.y(), 0, 'f', 6)
                          .arg(size.width())
                          .arg(size.height()));
    };
    for (const QGraphicsTextItem *item : itemsOf<QGraphicsTextItem>(scene))
        append(item->toPlainText(), item->scenePos(), item->boundingRect().size());
    for (const kvCharts::KvTextRunItem *run : itemsOf<kvCharts::KvTextRunItem>(scene)) {
        for (const kvCharts::KvPlacedText &text : run->texts())
            append(text.text, run->mapToScene(text.topLeft), text.extent.size);
    }
    result.sort();
    return result;
}

QStringList placedLines(const QGraphicsScene *scene)
{
    QStringList result;
    for (const QGraphicsLineItem *item : itemsOf<QGraphicsLineItem>(scene))
        result.append(placedLine(item->line(), item->pen()));
    for (const kvCharts::KvLineRunItem *run : itemsOf<kvCharts::KvLineRunItem>(scene)) {
        for (const QLineF &line : run->lines())
            result.append(placedLine(line, run->pen()));
    }
    result.sort();
    return result;
}

int difference(const QImage &first, const QImage &second)
{
    if (first.size() != second.size())
        return 255;
    int largest = 0;
    for (int y = 0; y < first.height(); ++y) {
        for (int x = 0; x < first.width(); ++x) {
            const QRgb a = first.pixel(x, y);
            const QRgb b = second.pixel(x, y);
            largest = std::max({largest, std::abs(qRed(a) - qRed(b)), std::abs(qGreen(a) - qGreen(b)),
                                std::abs(qBlue(a) - qBlue(b))});
        }
    }
    return largest;
}

int inkedPixels(const QImage &image)
{
    int count = 0;
    for (int y = 0; y < image.height(); ++y) {
        for (int x = 0; x < image.width(); ++x)
            count += image.pixel(x, y) != image.pixel(0, 0) ? 1 : 0;
    }
    return count;
}

bool sameRect(const QRectF &first, const QRectF &second)
{
    const auto same = [](qreal a, qreal b) { return std::abs(a - b) < 1e-6; };
    return same(first.left(), second.left()) && same(first.top(), second.top()) &&
           same(first.right(), second.right()) && same(first.bottom(), second.bottom());
}

} // namespace ItemByItem
