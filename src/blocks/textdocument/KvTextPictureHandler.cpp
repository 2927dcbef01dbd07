// SPDX-License-Identifier: MIT
#include "blocks/textdocument/KvTextPictureHandler.h"

#include <QPainter>
#include <QTextDocument>
#include <QTextImageFormat>
#include <QUrl>

namespace {

// Pictures that were deleted from the text stay known until then, as undo brings them back.
constexpr int kMostPictures = 64;

QPixmap fromDataUrl(const QString &name)
{
    const QString start = QStringLiteral(";base64,");
    const int payload = name.indexOf(start) + start.size();
    QByteArray bytes = name.mid(payload).toLatin1();
    if (bytes.contains('%'))
        bytes = QByteArray::fromPercentEncoding(bytes);
    QPixmap pixmap;
    pixmap.loadFromData(QByteArray::fromBase64(bytes));
    return pixmap;
}

bool isDataUrl(const QString &name)
{
    return name.startsWith(QLatin1String("data:image/"), Qt::CaseInsensitive) &&
           name.left(64).contains(QLatin1String(";base64,"));
}

QPixmap fromResource(QTextDocument *document, const QString &name)
{
    const QVariant data = document->resource(QTextDocument::ImageResource, QUrl::fromEncoded(name.toUtf8()));
    if (data.type() == QVariant::ByteArray) {
        QPixmap pixmap;
        pixmap.loadFromData(data.toByteArray());
        return pixmap;
    }
    return data.value<QPixmap>();
}

/** What Qt shows for a picture that cannot be had. */
QPixmap missingPicture()
{
    return QPixmap(QStringLiteral(":/qt-project.org/styles/commonstyle/images/file-16.png"));
}

} // namespace

KvTextPictureHandler::KvTextPictureHandler(QObject *parent)
    : QObject(parent)
{}

QPixmap KvTextPictureHandler::picture(QTextDocument *document, const QString &name)
{
    const auto known = m_pictures.constFind(name);
    if (known != m_pictures.constEnd())
        return *known;
    QPixmap pixmap = isDataUrl(name) ? fromDataUrl(name) : fromResource(document, name);
    if (pixmap.isNull())
        pixmap = missingPicture();
    if (m_pictures.size() >= kMostPictures)
        m_pictures.clear();
    m_pictures.insert(name, pixmap);
    return pixmap;
}

QSizeF KvTextPictureHandler::intrinsicSize(QTextDocument *document, int position, const QTextFormat &format)
{
    Q_UNUSED(position)
    const QTextImageFormat image = format.toImageFormat();
    const QSizeF natural = picture(document, image.name()).size();
    const bool hasWidth = image.hasProperty(QTextFormat::ImageWidth);
    const bool hasHeight = image.hasProperty(QTextFormat::ImageHeight);
    QSizeF size(hasWidth ? qRound(image.width()) : natural.width(),
                hasHeight ? qRound(image.height()) : natural.height());
    if (hasWidth && !hasHeight && natural.width() > 0)
        size.setHeight(qRound(size.width() * natural.height() / natural.width()));
    else if (hasHeight && !hasWidth && natural.height() > 0)
        size.setWidth(qRound(size.height() * natural.width() / natural.height()));
    return size;
}

void KvTextPictureHandler::drawObject(QPainter *painter, const QRectF &rect, QTextDocument *document,
                                      int position, const QTextFormat &format)
{
    Q_UNUSED(position)
    const QPixmap pixmap = picture(document, format.toImageFormat().name());
    painter->save();
    // Pictures are kept at more than the screen's resolution, for paper.
    painter->setRenderHint(QPainter::SmoothPixmapTransform);
    painter->drawPixmap(rect, pixmap, QRectF(pixmap.rect()));
    painter->restore();
}
