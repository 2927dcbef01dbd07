// SPDX-License-Identifier: MIT
#include "blocks/common/KvPictureWidget.h"

#include "blocks/common/KvPictureGeometry.h"
#include "blocks/common/KvPicturePlacement.h"
#include "gui/acss.h"
#include "report/KvBaseDisplayWidgetSignals.h"
#include "resources/KvReportResources.h"
#include "templates/KvBaseEditorNodeCfg.h"
#include "templates/KvTemplateContext.h"

#include <QPainter>
#include <QPixmapCache>

namespace {

constexpr int kIconMode = 6;
constexpr int kPlaceholderExtent = 512; // enough for paper

// Paper is white in every theme, so the theme's colours are not for it.
const QRgb kPlaceholderColor = qRgb(0x8a, 0x8f, 0x94);

QPixmap makePlaceholder()
{
    KvReportResources::ensure();
    QPixmap pixmap = acss::createPixmap(kIconMode, QStringLiteral("Icons/EmptyImage.svg"),
                                        QSize(kPlaceholderExtent, kPlaceholderExtent));
    if (pixmap.isNull())
        return pixmap;
    pixmap.setDevicePixelRatio(1.0);
    QPainter painter(&pixmap);
    painter.setCompositionMode(QPainter::CompositionMode_SourceIn);
    painter.fillRect(pixmap.rect(), QColor(kPlaceholderColor));
    return pixmap;
}

// One for all blocks, which most of the time need none.
QPixmap placeholder()
{
    const QString key = QStringLiteral("KvPictureWidget|EmptyImage");
    QPixmap pixmap;
    if (!QPixmapCache::find(key, &pixmap)) {
        pixmap = makePlaceholder();
        QPixmapCache::insert(key, pixmap);
    }
    return pixmap;
}

} // namespace

KvPictureWidget::KvPictureWidget(QWidget *parent, KvBaseEditorNodeCfg *cfg)
    : QWidget(parent)
    , m_cfg(cfg)
{
    setSizePolicy(QSizePolicy::Expanding, QSizePolicy::Minimum);
}

QWidget *KvPictureWidget::subWidgetAt(int index)
{
    return index == 0 ? this : nullptr;
}

KvPictureWidget::Shown KvPictureWidget::shown() const
{
    const QPixmap pixmap = picture();
    if (pixmap.isNull())
        return {placeholder(), KvPictureGeometry::PlaceholderPercent};
    return {pixmap, placement().widthPercent};
}

QSize KvPictureWidget::room(int width) const
{
    const KvTemplateContext *context = m_cfg->context();
    return QSize(width, context ? context->contentHeight() : KvTemplateContext::DefaultContentHeight);
}

QSize KvPictureWidget::sizeHint() const
{
    const KvTemplateContext *context = m_cfg->context();
    const Shown current = shown();
    return KvPictureGeometry::blockSize(
        KvPictureGeometry::turned(current.pixmap.size(), placement().rotation),
        room(context ? context->usableWidth() : width()), current.widthPercent);
}

void KvPictureWidget::paintEvent(QPaintEvent *event)
{
    Q_UNUSED(event)
    const Shown current = shown();
    const int rotation = placement().rotation;
    const QRect target =
        KvPictureGeometry::placed(KvPictureGeometry::turned(current.pixmap.size(), rotation), room(width()),
                                  current.widthPercent, placement().alignment);
    if (target.isEmpty())
        return;
    QPainter painter(this);
    painter.setRenderHint(QPainter::SmoothPixmapTransform);
    painter.drawPixmap(target, m_rendition.make(current.pixmap, rotation, target.size(), painter));
}

void KvPictureWidget::announceConfigChanged()
{
    emit displaySignals()->signalWidgetConfigChanged(m_cfg);
    if (KvTemplateContext *context = m_cfg->context())
        emit context->signalTemplateModified();
}

void KvPictureWidget::announceChanged()
{
    updateGeometry();
    update();
    emit displaySignals()->signalWidgetChanged();
}
