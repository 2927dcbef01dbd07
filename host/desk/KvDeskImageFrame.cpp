// SPDX-License-Identifier: MIT
#include "KvDeskImageFrame.h"

#include <QPainter>

#include <cmath>

namespace {

constexpr double plainPixelScale = 2.0; ///< device pixels per image pixel from which single pixels are shown

} // namespace

void KvDeskImageFrame::set(const QImage &image, const QRectF &sceneRect)
{
    m_image = image;
    m_sceneRect = sceneRect;
    m_reduced = QImage();
    m_reduction = 0;
}

bool KvDeskImageFrame::isSame(const QImage &image, const QRectF &sceneRect) const
{
    return image.cacheKey() == m_image.cacheKey() && sceneRect == m_sceneRect;
}

void KvDeskImageFrame::draw(QPainter *painter, const QRectF &exposed, double scale) const
{
    const QRectF visible = exposed & m_sceneRect;
    if (isNull() || visible.isEmpty() || scale <= 0.0)
        return;
    const double pixelScale = scale * m_sceneRect.width() / m_image.width();
    const QImage &image = imageFor(pixelScale);
    const double x = image.width() / m_sceneRect.width();
    const double y = image.height() / m_sceneRect.height();
    // Only whole pixels of the visible part: huge coordinates would lose precision.
    const QRectF inImage((visible.left() - m_sceneRect.left()) * x, (visible.top() - m_sceneRect.top()) * y,
                         visible.width() * x, visible.height() * y);
    const QRect source = inImage.toAlignedRect().adjusted(-1, -1, 1, 1) & image.rect();
    const QRectF target(m_sceneRect.left() + source.left() / x, m_sceneRect.top() + source.top() / y,
                        source.width() / x, source.height() / y);
    painter->save();
    painter->setRenderHint(QPainter::SmoothPixmapTransform, pixelScale < plainPixelScale);
    painter->drawImage(target, image, source);
    painter->restore();
}

// Smooth drawing looks at four pixels only: a picture reduced to less than its half is averaged beforehand.
const QImage &KvDeskImageFrame::imageFor(double pixelScale) const
{
    const int reduction = pixelScale < 1.0 ? static_cast<int>(std::floor(std::log2(1.0 / pixelScale))) : 0;
    if (reduction == 0)
        return m_image;
    if (reduction != m_reduction) {
        const QSize size(qMax(1, m_image.width() >> reduction), qMax(1, m_image.height() >> reduction));
        m_reduced = m_image.scaled(size, Qt::IgnoreAspectRatio, Qt::SmoothTransformation);
        m_reduction = reduction;
    }
    return m_reduced;
}
