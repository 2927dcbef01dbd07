// SPDX-License-Identifier: MIT
#include "KvDeskImageFrame.h"

#include <QPainter>

#include <cmath>

namespace {

constexpr double plainPixelScale = 2.0; ///< device pixels per image pixel from which single pixels are shown

// How often a picture is halved beforehand: smooth drawing looks at four pixels only, so a picture reduced to
// less than its half would miss some.
int reductionFor(double pixelScale)
{
    return pixelScale < 1.0 ? static_cast<int>(std::floor(std::log2(1.0 / pixelScale))) : 0;
}

} // namespace

void KvDeskImageFrame::set(const QImage &image, const QRectF &sceneRect)
{
    m_image = image;
    m_sceneRect = sceneRect;
    m_reduced = QImage();
    m_reduction = 0;
    if (image.isNull())
        m_halved.clear();
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
    const int reduction = reductionFor(pixelScale);
    const QImage &image = imageFor(reduction);
    // Of the picture drawn per scene unit; the last pixels of a reduced picture may reach beyond the scene's.
    const double x = std::ldexp(m_image.width() / m_sceneRect.width(), -reduction);
    const double y = std::ldexp(m_image.height() / m_sceneRect.height(), -reduction);
    const QRectF whole(0.0, 0.0, m_sceneRect.width() * x, m_sceneRect.height() * y);
    // Only whole pixels of the visible part: huge coordinates would lose precision.
    const QRectF inImage((visible.left() - m_sceneRect.left()) * x, (visible.top() - m_sceneRect.top()) * y,
                         visible.width() * x, visible.height() * y);
    const QRectF source = QRectF(inImage.toAlignedRect().adjusted(-1, -1, 1, 1)) & whole;
    const QRectF target(m_sceneRect.left() + source.left() / x, m_sceneRect.top() + source.top() / y,
                        source.width() / x, source.height() / y);
    painter->save();
    painter->setRenderHint(QPainter::SmoothPixmapTransform, pixelScale < plainPixelScale);
    painter->drawImage(target, image, source);
    painter->restore();
}

const QImage &KvDeskImageFrame::imageFor(int reduction) const
{
    if (reduction == 0)
        return m_image;
    if (reduction != m_reduction) {
        m_reduced = QImage();
        m_reduced = m_halved.of(m_image, reduction);
        m_reduction = reduction;
    }
    return m_reduced;
}
