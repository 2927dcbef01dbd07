// SPDX-License-Identifier: MIT
#pragma once

#include <QByteArray>
#include <QMap>
#include <QSize>
#include <QVector>
#include <QtEndian>

/** Builds TIFF files tag by tag, so that they can say whatever a test wants. */
class TiffFile
{
public:
    enum Tag {
        Width = 256,
        Height = 257,
        BitsPerSample = 258,
        Compression = 259,
        Photometric = 262,
        Description = 270,
        StripOffsets = 273,
        Orientation = 274,
        SamplesPerPixel = 277,
        RowsPerStrip = 278,
        StripByteCounts = 279,
        MaxSampleValue = 281,
        XResolution = 282,
        YResolution = 283,
        PlanarConfig = 284,
        ResolutionUnit = 296,
        ColorMap = 320,
        TileWidth = 322,
        TileHeight = 323,
        TileOffsets = 324,
        TileByteCounts = 325,
        SampleFormat = 339
    };

    /** One strip of grey pixels without compression. */
    TiffFile(const QSize &size, int bits, bool isBigEndian = false)
        : m_isBigEndian(isBigEndian)
    {
        setLong(Width, static_cast<quint32>(size.width()));
        setLong(Height, static_cast<quint32>(size.height()));
        setShorts(BitsPerSample, {static_cast<quint16>(bits)});
        setShorts(Compression, {1});
        setShorts(Photometric, {1});
        setShorts(SamplesPerPixel, {1});
        setLong(RowsPerStrip, static_cast<quint32>(size.height()));
    }

    void setShorts(int tag, const QVector<quint16> &values)
    {
        QByteArray bytes;
        for (const quint16 value : values)
            append(&bytes, value);
        m_entries.insert(tag, {3, values.size(), bytes});
    }

    void setLong(int tag, quint32 value)
    {
        QByteArray bytes;
        append(&bytes, value);
        m_entries.insert(tag, {4, 1, bytes});
    }

    void setRational(int tag, quint32 numerator, quint32 denominator)
    {
        QByteArray bytes;
        append(&bytes, numerator);
        append(&bytes, denominator);
        m_entries.insert(tag, {5, 1, bytes});
    }

    void setText(int tag, const QByteArray &text)
    {
        m_entries.insert(tag, {2, text.size() + 1, text + '\0'});
    }

    void remove(int tag) { m_entries.remove(tag); }
    void setPixels(const QByteArray &pixels) { m_pixels = pixels; }

    void setDeepPixels(const QVector<quint16> &values)
    {
        m_pixels.clear();
        for (const quint16 value : values)
            append(&m_pixels, value);
    }

    /** Further directories follow the first. */
    void setNextDirectory(quint32 offset) { m_next = offset; }

    /** Header, pixels, values, directory. Place and length of the pixels are filled in where they are not
     * set. */
    QByteArray bytes() const
    {
        TiffFile file(*this);
        const int offsets = m_entries.contains(TileWidth) ? int(TileOffsets) : int(StripOffsets);
        const int counts = m_entries.contains(TileWidth) ? int(TileByteCounts) : int(StripByteCounts);
        if (!m_entries.contains(offsets))
            file.setLong(offsets, 8);
        if (!m_entries.contains(counts))
            file.setLong(counts, static_cast<quint32>(m_pixels.size()));
        return file.laidOut();
    }

private:
    struct Entry
    {
        quint16 type;
        int count;
        QByteArray value;
    };

    template <typename T>
    void append(QByteArray *bytes, T value) const
    {
        const T ordered = m_isBigEndian ? qToBigEndian(value) : qToLittleEndian(value);
        bytes->append(reinterpret_cast<const char *>(&ordered), sizeof(T));
    }

    QByteArray laidOut() const
    {
        QByteArray values = m_pixels + QByteArray(m_pixels.size() % 2, '\0');
        QByteArray directory;
        append(&directory, static_cast<quint16>(m_entries.size()));
        for (auto it = m_entries.constBegin(); it != m_entries.constEnd(); ++it) {
            append(&directory, static_cast<quint16>(it.key()));
            append(&directory, it->type);
            append(&directory, static_cast<quint32>(it->count));
            if (it->value.size() <= 4) {
                directory += it->value + QByteArray(4 - it->value.size(), '\0');
            } else {
                append(&directory, static_cast<quint32>(8 + values.size()));
                values += it->value + QByteArray(it->value.size() % 2, '\0');
            }
        }
        append(&directory, m_next);
        QByteArray header = m_isBigEndian ? QByteArray("MM\0*", 4) : QByteArray("II*\0", 4);
        append(&header, static_cast<quint32>(8 + values.size()));
        return header + values + directory;
    }

    bool m_isBigEndian;
    QMap<int, Entry> m_entries;
    QByteArray m_pixels;
    quint32 m_next = 0;
};
