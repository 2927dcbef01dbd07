// SPDX-License-Identifier: MIT
#include "charts/KvSeriesPalette.h"

#include <QRandomGenerator64>
#include <QVector>

namespace kvCharts {

namespace {

// The last entry lacks its '#': the colour parser refuses it, so that it is an invalid colour, which paints
// black. Shipped that way and kept; made directly, as parsing it would print a warning.
QVector<QColor> fixedColors()
{
    static const char *const names[] = {"#ff5722", "#4caf50", "#ffc107", "#2196f3", "#da90e6",
                                        "#009688", "#ff9800", "#673ab7", "#8de429", "#b2a429",
                                        "#8e98cf", "#cf8e8e", "#cfc38e", "#a3cf8e", "#8ebecf"};
    QVector<QColor> colors;
    for (const char *name : names)
        colors.append(QColor(QLatin1String(name)));
    colors.append(QColor()); // "9f8ecf"
    return colors;
}

int randomComponent()
{
    const quint32 number = static_cast<quint32>(QRandomGenerator64::global()->generate());
    return static_cast<int>(number >> 24);
}

QColor randomColor()
{
    const int red = randomComponent();
    const int green = randomComponent();
    const int blue = randomComponent();
    return QColor(red, green, blue, 255);
}

} // namespace

QColor seriesColor(int index)
{
    static QVector<QColor> palette = fixedColors();
    if (index < 0)
        return QColor();
    while (palette.size() <= index)
        palette.append(randomColor());
    return palette.at(index);
}

} // namespace kvCharts
