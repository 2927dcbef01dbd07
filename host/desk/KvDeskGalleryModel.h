// SPDX-License-Identifier: MIT
#pragma once

#include "KvDeskGalleryEntry.h"

#include <QAbstractListModel>
#include <QVector>

class KvDeskGalleryFolder;
class KvDeskThumbnailLoader;
struct KvDeskThumbnail;

/**
 * The pictures of a folder with their thumbnails, which are loaded when they are asked for.
 *
 * Pictures can be dragged: as files, marked as coming from a gallery, which is what report pages take.
 */
class KvDeskGalleryModel : public QAbstractListModel
{
    Q_OBJECT
public:
    enum Role {
        PathRole = Qt::UserRole, ///< absolute path
        ThumbnailRole,           ///< QImage; null while it is loaded, and for a picture that cannot be shown
        FaultRole                ///< why it cannot be shown; empty when it can, or is not known yet
    };

    /** Marks a drag as one of the gallery; the files are in "text/uri-list". */
    static const char dragFormat[];

    explicit KvDeskGalleryModel(QObject *parent = nullptr);
    ~KvDeskGalleryModel() override;

    /** Shows another folder; its pictures come later. An empty path stands for none. */
    void setFolder(const QString &path);
    KvDeskGalleryFolder *folder() const { return m_folder; }
    KvDeskThumbnailLoader *thumbnails() const { return m_thumbnails; }
    /** Invalid for a file that is not in the folder. */
    QModelIndex indexOf(const QString &path) const;

    int rowCount(const QModelIndex &parent = QModelIndex()) const override;
    QVariant data(const QModelIndex &index, int role) const override;
    Qt::ItemFlags flags(const QModelIndex &index) const override;
    QStringList mimeTypes() const override;
    /** The files in the order of \a indexes. */
    QMimeData *mimeData(const QModelIndexList &indexes) const override;
    Qt::DropActions supportedDragActions() const override { return Qt::CopyAction; }

signals:
    void signalFolderRead(); ///< the rows are those of the folder

private slots:
    void slotFolderRead();
    void slotThumbnailLoaded(const QString &aPath);

private:
    QString pathOf(int row) const;
    QString toolTip(int row) const;
    void removeGone(const QVector<KvDeskGalleryEntry> &entries);
    void insertNew(const QVector<KvDeskGalleryEntry> &entries);
    void updateChanged(const QVector<KvDeskGalleryEntry> &entries);

    KvDeskGalleryFolder *m_folder;
    KvDeskThumbnailLoader *m_thumbnails;
    QVector<KvDeskGalleryEntry> m_entries; ///< the rows
};
