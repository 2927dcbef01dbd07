// SPDX-License-Identifier: MIT
#include "report/KvReportDragData.h"

#include "kernel/ZtMediaInfo.h"
#include "report/KvReportNode.h"
#include "templates/KvBaseEditorNodeFactory.h"

#include <QDataStream>
#include <QFileInfo>
#include <QMimeData>
#include <QUrl>

const char KvReportDragData::GalleryFormat[] = "GalleryDrag";

namespace {

const QString kUriList = QStringLiteral("text/uri-list");

/** The first line that is no comment. */
QByteArray firstUri(const QByteArray &uriList)
{
    const QList<QByteArray> lines = uriList.split('\n');
    for (const QByteArray &line : lines) {
        const QByteArray uri = line.trimmed();
        if (!uri.isEmpty() && !uri.startsWith('#'))
            return uri;
    }
    return QByteArray();
}

bool isImageFile(const QFileInfo &file)
{
    const QString format = ZtMediaInfo::findMediaFileFormat(file.suffix());
    return ZtMediaInfo::findMediaType(format) == ZtMediaInfo::Image;
}

} // namespace

KvReportDragData KvReportDragData::fromMimeData(const QMimeData *data)
{
    KvReportDragData result;
    if (!data)
        return result;
    const QString newBlock = QLatin1String(KvBaseEditorNodeFactory::MimeFormat);
    const QString movedBlock = QLatin1String(KvReportNode::MimeFormat);
    if (data->hasFormat(newBlock))
        result.readNewBlock(data->data(newBlock));
    else if (data->hasFormat(movedBlock))
        result.readMovedBlock(data->data(movedBlock));
    else if (data->hasFormat(QLatin1String(GalleryFormat)) && data->hasFormat(kUriList))
        result.readGalleryImage(data->data(kUriList));
    return result;
}

void KvReportDragData::readNewBlock(const QByteArray &bytes)
{
    QDataStream stream(bytes);
    QString tag;
    stream >> tag >> m_typeName;
    if (stream.status() == QDataStream::Ok && tag == QLatin1String("nodeType"))
        m_kind = Kind::NewBlock;
}

void KvReportDragData::readMovedBlock(const QByteArray &bytes)
{
    QDataStream stream(bytes);
    QString tag;
    qint32 index = -1;
    stream >> tag >> index;
    if (stream.status() != QDataStream::Ok || tag != QLatin1String("nodeIndex"))
        return;
    m_kind = Kind::MovedBlock;
    m_nodeIndex = index;
}

void KvReportDragData::readGalleryImage(const QByteArray &uriList)
{
    const QUrl url = QUrl::fromEncoded(firstUri(uriList));
    if (!url.isLocalFile())
        return;
    const QFileInfo file(url.toLocalFile());
    if (!isImageFile(file))
        return;
    m_kind = Kind::GalleryImage;
    m_imagePath = file.absoluteFilePath();
}
