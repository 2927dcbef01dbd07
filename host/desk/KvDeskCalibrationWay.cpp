// SPDX-License-Identifier: MIT
#include "KvDeskCalibrationWay.h"

#include "KvDeskNumberBox.h"
#include "kernel/ZtLeftToRight.h"

#include <QLabel>
#include <QVBoxLayout>

namespace {

constexpr int hintLines = 2;
constexpr int spacing = 8;
// Micrometres; from below the size of atoms to a metre, so that slips of the keyboard are found.
constexpr double smallestPixel = 1e-6;
constexpr double largestPixel = 1e6;

} // namespace

void KvDeskCalibrationWay::setContent(const QString &hint, QLayout *row)
{
    auto *const label = new QLabel(hint, this);
    label->setProperty("caption", true);
    label->setWordWrap(true);
    // A window does not grow for a text that takes another line.
    label->setMinimumHeight(hintLines * label->fontMetrics().lineSpacing());
    label->setAlignment(Qt::AlignLeft | Qt::AlignTop);
    row->setSpacing(spacing);
    auto *const layout = new QVBoxLayout(this);
    layout->setContentsMargins(0, 0, 0, 0);
    layout->setSpacing(spacing);
    layout->addWidget(label);
    layout->addLayout(row);
    layout->addStretch();
}

QString KvDeskCalibrationWay::faultOf(const KvDeskNumberBox &box, double pixelSize)
{
    if (box.isEmpty())
        return QString();
    if (!box.isNumber())
        return tr("Type a number such as 5.3 or 5,3");
    if (pixelSize >= smallestPixel && pixelSize <= largestPixel)
        return QString();
    return tr("A pixel measures between %1 and %2")
        .arg(ZtLeftToRight::isolated(QStringLiteral("0.000001 μm")),
             ZtLeftToRight::isolated(QStringLiteral("1000000 μm")));
}
