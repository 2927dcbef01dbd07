// SPDX-License-Identifier: MIT
#include "kernel/ZtImageTools.h"

#include "image/ZtImage.h"
#include "kernel/ZtGsManipulator.h"
#include "kernel/ZtKernelData.h"
#include "kernel/iZTObjectPainter.h"

#include <QPainter>

namespace {

// Painting colours into indexed, grey or mono images fails or loses the colours.
QImage toPaintable(const QImage &image)
{
    return image.convertToFormat(image.hasAlphaChannel() ? QImage::Format_ARGB32_Premultiplied
                                                         : QImage::Format_RGB32);
}

// Lines and texts are as wide on a picture of this size as on a screen; beyond it they grow with the picture.
constexpr double screenSize = 1280.0;

double pixelRatio(const QImage &image)
{
    return qMax(1.0, qMax(image.width(), image.height()) / screenSize);
}

void drawObjects(QPainter *painter, const ZtGsManipulator &manipulator, const ZtObjectMap &objects)
{
    for (auto it = objects.constBegin(); it != objects.constEnd(); ++it) {
        painter->save();
        manipulator.draw(painter, it.key(), it.value());
        painter->restore();
    }
}

void drawTypes(QPainter *painter, const QList<int> &types)
{
    const ZtKernelData *const kernel = ZtKernelData::getInstance();
    const QMap<int, ZtObjectMap> &all = kernel->objects();
    for (auto type = all.constBegin(); type != all.constEnd(); ++type) {
        const ZtGsManipulator *const manipulator = kernel->getGsManipulator(type.key());
        if (manipulator != nullptr && (types.isEmpty() || types.contains(type.key())))
            drawObjects(painter, *manipulator, *type);
    }
}

} // namespace

ZtImageTools *ZtImageTools::getInstance()
{
    static ZtImageTools instance;
    return &instance;
}

void ZtImageTools::drawEditorObjectsOnImage(ZtImage *image, const QTransform &transform,
                                            const QList<int> &types) const
{
    if (image == nullptr || image->isNull())
        return;

    QImage canvas = toPaintable(image->getQImage());
    const double ratio = pixelRatio(canvas);
    canvas.setDevicePixelRatio(ratio);
    QPainter painter(&canvas);
    painter.setRenderHints(QPainter::Antialiasing | QPainter::TextAntialiasing);
    painter.setTransform(transform * QTransform::fromScale(1.0 / ratio, 1.0 / ratio));
    if (const iZTObjectPainter *const objectPainter = ZtKernelData::getInstance()->objectPainter())
        objectPainter->drawObjects(&painter, types);
    else
        drawTypes(&painter, types);
    painter.end();
    canvas.setDevicePixelRatio(1.0);
    image->setQImage(canvas);
}
