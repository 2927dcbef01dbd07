// SPDX-License-Identifier: MIT
#pragma once

#include <QString>

class QMimeData;

/** What is dragged over the pages, read from its mime data with all doubts about it. */
class KvReportDragData
{
public:
    enum class Kind {
        Nothing,     ///< nothing that pages take
        NewBlock,    ///< a block type from the palette
        MovedBlock,  ///< a block of the template
        GalleryImage ///< an image file from the host's gallery
    };

    KvReportDragData() = default;
    /** Null data is nothing; so is data of a known format that cannot be read to its end. */
    static KvReportDragData fromMimeData(const QMimeData *data);

    Kind kind() const { return m_kind; }
    QString typeName() const { return m_typeName; }   ///< of a new block
    int nodeIndex() const { return m_nodeIndex; }     ///< of a moved block, in the template
    QString imagePath() const { return m_imagePath; } ///< absolute path of a gallery image

    /** Marks a drag as one of the host's gallery; the file is in "text/uri-list". */
    static const char GalleryFormat[];

private:
    void readNewBlock(const QByteArray &bytes);
    void readMovedBlock(const QByteArray &bytes);
    void readGalleryImage(const QByteArray &uriList);

    Kind m_kind = Kind::Nothing;
    QString m_typeName;
    int m_nodeIndex = -1;
    QString m_imagePath;
};
