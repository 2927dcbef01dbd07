// SPDX-License-Identifier: MIT
#pragma once

#include <QHash>
#include <QObject>
#include <QSizeF>
#include <QTextObjectInterface>

/**
 * Measures and draws the pictures of a text that stand in files: never wider than the text, and smooth.
 *
 * A handler of QTextFormat::ImageObject for QAbstractTextDocumentLayout::registerHandler().
 */
class KvDeskGuidePictures
    : public QObject
    , public QTextObjectInterface
{
    Q_OBJECT
    Q_INTERFACES(QTextObjectInterface)
public:
    /** The names of pictures are paths in \a folder. */
    explicit KvDeskGuidePictures(const QString &folder, QObject *parent = nullptr);

    /** In pixels of the text; empty for a picture that cannot be read. */
    QSizeF intrinsicSize(QTextDocument *document, int position, const QTextFormat &format) override;
    void drawObject(QPainter *painter, const QRectF &rect, QTextDocument *document, int position,
                    const QTextFormat &format) override;

private:
    QString pathOf(const QTextFormat &format) const;
    QSizeF naturalSize(const QString &path);

    QString m_folder;
    QHash<QString, QSizeF> m_sizes;
};
