// SPDX-License-Identifier: MIT
#include "KvDeskGalleryModel.h"

#include "KvDeskGalleryFolder.h"
#include "KvDeskThumbnail.h"
#include "KvDeskThumbnailLoader.h"
#include "kernel/ZtLeftToRight.h"

#include <QFileInfo>
#include <QLocale>
#include <QMimeData>
#include <QSet>
#include <QUrl>

#include <algorithm>

const char KvDeskGalleryModel::dragFormat[] = "GalleryDrag";

namespace {

const char uriList[] = "text/uri-list";

// Names may look like markup.
QString asPlainToolTip(const QStringList &lines)
{
    return QStringLiteral("<p style=\"white-space:pre\">%1</p>")
        .arg(lines.join(QLatin1Char('\n')).toHtmlEscaped());
}

} // namespace

KvDeskGalleryModel::KvDeskGalleryModel(QObject *parent)
    : QAbstractListModel(parent)
    , m_folder(new KvDeskGalleryFolder(this))
    , m_thumbnails(new KvDeskThumbnailLoader(this))
{
    connect(m_folder, SIGNAL(signalRead()), this, SLOT(slotFolderRead()));
    connect(m_thumbnails, SIGNAL(signalLoaded(QString)), this, SLOT(slotThumbnailLoaded(QString)));
}

KvDeskGalleryModel::~KvDeskGalleryModel() = default;

void KvDeskGalleryModel::setFolder(const QString &path)
{
    const QString before = m_folder->path();
    m_folder->setPath(path);
    if (m_folder->path() == before)
        return;
    m_thumbnails->cancel();
    beginResetModel();
    m_entries.clear();
    endResetModel();
}

QModelIndex KvDeskGalleryModel::indexOf(const QString &path) const
{
    const QFileInfo file(path);
    if (file.absolutePath() != m_folder->path())
        return QModelIndex();
    for (int row = 0; row < m_entries.size(); ++row) {
        if (m_entries.at(row).name == file.fileName())
            return index(row);
    }
    return QModelIndex();
}

int KvDeskGalleryModel::rowCount(const QModelIndex &parent) const
{
    return parent.isValid() ? 0 : m_entries.size();
}

QString KvDeskGalleryModel::pathOf(int row) const
{
    return m_folder->path() + QLatin1Char('/') + m_entries.at(row).name;
}

QVariant KvDeskGalleryModel::data(const QModelIndex &index, int role) const
{
    if (!index.isValid())
        return QVariant();
    const KvDeskGalleryEntry &entry = m_entries.at(index.row());
    switch (role) {
    case Qt::DisplayRole:
        return entry.name;
    case Qt::ToolTipRole:
        return toolTip(index.row());
    case PathRole:
        return pathOf(index.row());
    case ThumbnailRole: {
        const KvDeskThumbnail *const thumbnail = m_thumbnails->thumbnail(m_folder->path(), entry);
        return thumbnail ? thumbnail->image : QImage();
    }
    case FaultRole: {
        const KvDeskThumbnail *const thumbnail = m_thumbnails->known(m_folder->path(), entry);
        return thumbnail ? thumbnail->fault : QString();
    }
    case Qt::AccessibleDescriptionRole:
        return data(index, FaultRole);
    default:
        return QVariant();
    }
}

QString KvDeskGalleryModel::toolTip(int row) const
{
    const KvDeskGalleryEntry &entry = m_entries.at(row);
    const KvDeskThumbnail *const thumbnail = m_thumbnails->known(m_folder->path(), entry);
    QStringList lines{ZtLeftToRight::isolated(entry.name)};
    if (thumbnail && !thumbnail->fault.isEmpty())
        lines.append(thumbnail->fault);
    else if (thumbnail)
        lines.append(ZtLeftToRight::isolated(
            tr("%1 × %2 px", "width, height").arg(thumbnail->size.width()).arg(thumbnail->size.height())));
    lines.append(QLocale().toString(entry.changed, QLocale::ShortFormat));
    return asPlainToolTip(lines);
}

Qt::ItemFlags KvDeskGalleryModel::flags(const QModelIndex &index) const
{
    if (!index.isValid())
        return Qt::NoItemFlags;
    const Qt::ItemFlags flags = Qt::ItemIsSelectable | Qt::ItemIsEnabled | Qt::ItemNeverHasChildren;
    return data(index, FaultRole).toString().isEmpty() ? flags | Qt::ItemIsDragEnabled : flags;
}

QStringList KvDeskGalleryModel::mimeTypes() const
{
    return {QLatin1String(dragFormat), QLatin1String(uriList)};
}

QMimeData *KvDeskGalleryModel::mimeData(const QModelIndexList &indexes) const
{
    QList<QUrl> urls;
    for (const QModelIndex &index : indexes)
        urls.append(QUrl::fromLocalFile(pathOf(index.row())));
    if (urls.isEmpty())
        return nullptr;
    auto *const data = new QMimeData;
    data->setUrls(urls);
    data->setData(QLatin1String(dragFormat), QByteArray());
    return data;
}

void KvDeskGalleryModel::slotFolderRead()
{
    const QVector<KvDeskGalleryEntry> entries = m_folder->entries();
    removeGone(entries);
    insertNew(entries);
    updateChanged(entries);
    emit signalFolderRead();
}

void KvDeskGalleryModel::removeGone(const QVector<KvDeskGalleryEntry> &entries)
{
    QSet<QString> names;
    for (const KvDeskGalleryEntry &entry : entries)
        names.insert(entry.name);
    const auto isGone = [this, &names](int row) { return !names.contains(m_entries.at(row).name); };
    for (int last = m_entries.size() - 1; last >= 0; --last) {
        if (!isGone(last))
            continue;
        int first = last;
        while (first > 0 && isGone(first - 1))
            --first;
        beginRemoveRows(QModelIndex(), first, last);
        m_entries.remove(first, last - first + 1);
        endRemoveRows();
        last = first;
    }
}

// The rows that are left are some of the entries, in the same order.
void KvDeskGalleryModel::insertNew(const QVector<KvDeskGalleryEntry> &entries)
{
    for (int first = 0; first < entries.size(); ++first) {
        const QString next = m_entries.value(first).name;
        int end = first;
        while (end < entries.size() && entries.at(end).name != next)
            ++end;
        if (end == first)
            continue;
        beginInsertRows(QModelIndex(), first, end - 1);
        m_entries.insert(first, end - first, KvDeskGalleryEntry());
        std::copy(entries.begin() + first, entries.begin() + end, m_entries.begin() + first);
        endInsertRows();
        first = end;
    }
}

void KvDeskGalleryModel::updateChanged(const QVector<KvDeskGalleryEntry> &entries)
{
    for (int row = 0; row < entries.size(); ++row) {
        if (m_entries.at(row) == entries.at(row))
            continue;
        m_entries[row] = entries.at(row);
        emit dataChanged(index(row), index(row));
    }
}

void KvDeskGalleryModel::slotThumbnailLoaded(const QString &aPath)
{
    const QModelIndex index = indexOf(aPath);
    if (index.isValid())
        emit dataChanged(index, index);
}
