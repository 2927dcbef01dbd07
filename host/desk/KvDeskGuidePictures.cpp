// SPDX-License-Identifier: MIT
#include "KvDeskGuidePictures.h"

#include <QImageReader>
#include <QPainter>
#include <QPixmap>
#include <QPixmapCache>
#include <QTextDocument>
#include <QTextImageFormat>

namespace {

constexpr int rounding = 4; ///< pixels by which Qt lays out a line wider than what is in it

QPixmap read(const QString &path)
{
    QPixmap pixmap;
    if (!QPixmapCache::find(path, &pixmap) && pixmap.load(path))
        QPixmapCache::insert(path, pixmap);
    return pixmap;
}

} // namespace

KvDeskGuidePictures::KvDeskGuidePictures(const QString &folder, QObject *parent)
    : QObject(parent)
    , m_folder(folder)
{}

QString KvDeskGuidePictures::pathOf(const QTextFormat &format) const
{
    return m_folder + QLatin1Char('/') + format.toImageFormat().name();
}

// From the head of the file: the pictures themselves are read when they are seen.
QSizeF KvDeskGuidePictures::naturalSize(const QString &path)
{
    const auto known = m_sizes.constFind(path);
    if (known != m_sizes.constEnd())
        return *known;
    const QSize size = QImageReader(path).size();
    return *m_sizes.insert(path, size.isValid() ? QSizeF(size) : QSizeF(0, 0));
}

QSizeF KvDeskGuidePictures::intrinsicSize(QTextDocument *document, int position, const QTextFormat &format)
{
    Q_UNUSED(position)
    const QSizeF size = naturalSize(pathOf(format));
    const qreal room = document->pageSize().width() - 2 * document->documentMargin() - rounding;
    return room <= 0 || size.width() <= room ? size : QSizeF(room, size.height() * room / size.width());
}

void KvDeskGuidePictures::drawObject(QPainter *painter, const QRectF &rect, QTextDocument *document,
                                     int position, const QTextFormat &format)
{
    Q_UNUSED(document)
    Q_UNUSED(position)
    const QPixmap pixmap = read(pathOf(format));
    painter->save();
    painter->setRenderHint(QPainter::SmoothPixmapTransform);
    painter->drawPixmap(rect, pixmap, QRectF(pixmap.rect()));
    painter->restore();
}
