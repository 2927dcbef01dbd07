// SPDX-License-Identifier: MIT
#pragma once

#include <QHash>
#include <QObject>
#include <QPixmap>
#include <QTextObjectInterface>

/**
 * Measures and draws the pictures inside of a text, as Qt's own handler does, but knows them by their text.
 *
 * A picture's name is its whole data URL. Qt takes it apart as a URL whenever a line with it is laid out or
 * painted, which costs more than a keystroke may for a picture of a few hundred kilobytes.
 */
class KvTextPictureHandler
    : public QObject
    , public QTextObjectInterface
{
    Q_OBJECT
    Q_INTERFACES(QTextObjectInterface)
public:
    explicit KvTextPictureHandler(QObject *parent = nullptr);

    /** Size in the text's pixels: what the format says, the other side by the picture's proportions. */
    QSizeF intrinsicSize(QTextDocument *document, int position, const QTextFormat &format) override;
    void drawObject(QPainter *painter, const QRectF &rect, QTextDocument *document, int position,
                    const QTextFormat &format) override;

private:
    QPixmap picture(QTextDocument *document, const QString &name);

    QHash<QString, QPixmap> m_pictures;
};
