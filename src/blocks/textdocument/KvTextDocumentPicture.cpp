// SPDX-License-Identifier: MIT
#include "blocks/textdocument/KvTextDocumentPicture.h"

#include <QBuffer>
#include <QPixmap>

namespace {

constexpr int kPrintFactor = 3;

QPixmap reduced(const QPixmap &picture, int width)
{
    const int widest = kPrintFactor * width;
    return picture.width() > widest ? picture.scaledToWidth(widest, Qt::SmoothTransformation) : picture;
}

} // namespace

namespace KvTextDocumentPicture {

QString html(const QPixmap &picture, int width, const QString &placement)
{
    QByteArray bytes;
    QBuffer buffer(&bytes);
    buffer.open(QIODevice::WriteOnly);
    if (!reduced(picture, width).save(&buffer, "PNG"))
        return QString();
    // The blank after the comma is part of the stored form; decoding skips it.
    return QStringLiteral("<img width=\"%1\" %2 src=\"data:image/png;base64, %3\" />")
        .arg(QString::number(width), placement, QString::fromLatin1(bytes.toBase64()));
}

} // namespace KvTextDocumentPicture
