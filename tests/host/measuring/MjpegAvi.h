// SPDX-License-Identifier: MIT
#pragma once

#include <QBuffer>
#include <QByteArray>
#include <QImage>
#include <QVector>
#include <QtEndian>

/** Writes videos: AVI files whose frames are JPEG pictures. */
class MjpegAvi
{
public:
    /** \param frames of the same size, at least one */
    static QByteArray bytes(const QVector<QImage> &frames, int framesPerSecond)
    {
        QByteArray movie("movi");
        QByteArray index;
        for (const QImage &frame : frames) {
            const QByteArray data = jpeg(frame);
            index += "00dc" + number(0x10) + number(movie.size()) + number(data.size());
            movie += chunk("00dc", data);
        }
        const QByteArray content =
            "AVI " + header(frames, framesPerSecond) + chunk("LIST", movie) + chunk("idx1", index);
        return chunk("RIFF", content);
    }

private:
    static QByteArray number(int value)
    {
        const quint32 ordered = qToLittleEndian(static_cast<quint32>(value));
        return QByteArray(reinterpret_cast<const char *>(&ordered), 4);
    }

    static QByteArray numbers(std::initializer_list<int> values)
    {
        QByteArray result;
        for (const int value : values)
            result += number(value);
        return result;
    }

    static QByteArray chunk(const char *name, const QByteArray &data)
    {
        return name + number(data.size()) + data + QByteArray(data.size() % 2, '\0');
    }

    static QByteArray jpeg(const QImage &frame)
    {
        QByteArray data;
        QBuffer buffer(&data);
        buffer.open(QIODevice::WriteOnly);
        frame.save(&buffer, "jpg", 95);
        return data;
    }

    static QByteArray header(const QVector<QImage> &frames, int framesPerSecond)
    {
        const int count = frames.size();
        const int width = frames.first().width();
        const int height = frames.first().height();
        const QByteArray main =
            numbers({1000000 / framesPerSecond, 0, 0, 0x10, count, 0, 1, 1 << 20, width, height, 0, 0, 0, 0});
        const QByteArray stream = QByteArray("vidsMJPG") + numbers({0, 0, 0, 1, framesPerSecond, 0, count,
                                                                    1 << 20, -1, 0, 0, width | height << 16});
        const QByteArray format =
            numbers({40, width, height, 1 | 24 << 16}) + "MJPG" + numbers({width * height * 3, 0, 0, 0, 0});
        return chunk("LIST", "hdrl" + chunk("avih", main) +
                                 chunk("LIST", "strl" + chunk("strh", stream) + chunk("strf", format)));
    }
};
