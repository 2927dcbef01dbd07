// SPDX-License-Identifier: MIT
#include "kernel/ZtImageTools.h"

#include "image/ZtImage.h"
#include "kernel/ZtGsManipulator.h"
#include "kernel/ZtKernelData.h"

#include <QPainter>

namespace {

// Painting colours into indexed, grey or mono images fails or loses the colours.
QImage toPaintable(const QImage &image)
{
    return image.convertToFormat(image.hasAlphaChannel() ? QImage::Format_ARGB32_Premultiplied
                                                         : QImage::Format_RGB32);
}

void drawObjects(QPainter *painter, const ZtGsManipulator &manipulator, const ZtObjectMap &objects)
{
    for (auto it = objects.constBegin(); it != objects.constEnd(); ++it) {
        painter->save();
        manipulator.draw(painter, it.key(), it.value());
        painter->restore();
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

    const ZtKernelData *const kernel = ZtKernelData::getInstance();
    const QMap<int, ZtObjectMap> &all = kernel->objects();
    QImage canvas = toPaintable(image->getQImage());
    QPainter painter(&canvas);
    painter.setRenderHints(QPainter::Antialiasing | QPainter::TextAntialiasing);
    painter.setTransform(transform);
    for (auto type = all.constBegin(); type != all.constEnd(); ++type) {
        const ZtGsManipulator *const manipulator = kernel->getGsManipulator(type.key());
        if (manipulator != nullptr && (types.isEmpty() || types.contains(type.key())))
            drawObjects(&painter, *manipulator, *type);
    }
    painter.end();
    image->setQImage(canvas);
}
