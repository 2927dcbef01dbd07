// SPDX-License-Identifier: MIT
#include "measuring/ZtTiffReader.h"

#include "measuring/ZtDeepGrey.h"
#include "measuring/ZtFault.h"
#include "measuring/ZtPicture.h"
#include "measuring/ZtPictureReader.h"
#include "measuring/ZtPixelSizeReader.h"
#include "measuring/ZtStillImageSource.h"
#include "measuring/ZtTextDecoder.h"

#include <QIODevice>
#include <QTransform>

#include <tiffio.h>

#include <cstdio>
#include <cstring>
#include <memory>

namespace {

/// No compression of TIFF shrinks a picture further than this; the strongest are LZW and Deflate.
constexpr quint64 strongestCompression = 4096;
/// Blocks of a picture may be a little larger than the picture, as tiles are padded.
constexpr quint64 blockSlack = 16 * 1024 * 1024;
constexpr tmsize_t largestAllocation = 2000 * 1000 * 1000;

struct TiffCloser
{
    void operator()(TIFF *tiff) const { TIFFClose(tiff); }
};
using TiffPointer = std::unique_ptr<TIFF, TiffCloser>;

struct OptionsDeleter
{
    void operator()(TIFFOpenOptions *options) const { TIFFOpenOptionsFree(options); }
};

QIODevice *deviceOf(thandle_t handle)
{
    return static_cast<QIODevice *>(handle);
}

tmsize_t readBytes(thandle_t handle, void *data, tmsize_t size)
{
    return deviceOf(handle)->read(static_cast<char *>(data), size);
}

tmsize_t writeNothing(thandle_t, void *, tmsize_t)
{
    return -1;
}

toff_t seekTo(thandle_t handle, toff_t offset, int whence)
{
    QIODevice *const device = deviceOf(handle);
    auto position = static_cast<qint64>(offset);
    if (whence == SEEK_CUR)
        position += device->pos();
    else if (whence == SEEK_END)
        position += device->size();
    // Some devices complain aloud about places behind their end.
    const bool isInside = position >= 0 && position <= device->size();
    return isInside && device->seek(position) ? static_cast<toff_t>(position) : static_cast<toff_t>(-1);
}

int closeNothing(thandle_t)
{
    return 0;
}

toff_t sizeOf(thandle_t handle)
{
    return static_cast<toff_t>(deviceOf(handle)->size());
}

// The first error is the one that says what is wrong, those after it are its consequences.
int keepError(TIFF *, void *message, const char *, const char *format, va_list arguments)
{
    auto *const text = static_cast<QString *>(message);
    if (text->isEmpty())
        *text = QString::vasprintf(format, arguments).trimmed();
    return 1;
}

// Unknown tags and the like are of no interest to the user, and not to standard error either.
int ignoreWarning(TIFF *, void *, const char *, const char *, va_list)
{
    return 1;
}

/// One file while it is read.
class Tiff
{
public:
    Tiff(QIODevice *device, ZtFault *fault)
        : m_fault(fault)
        , m_fileSize(static_cast<quint64>(device->size()))
    {
        const std::unique_ptr<TIFFOpenOptions, OptionsDeleter> options(TIFFOpenOptionsAlloc());
        TIFFOpenOptionsSetErrorHandlerExtR(options.get(), keepError, &m_error);
        TIFFOpenOptionsSetWarningHandlerExtR(options.get(), ignoreWarning, nullptr);
        TIFFOpenOptionsSetMaxSingleMemAlloc(options.get(), largestAllocation);
        // Neither mapped into memory, where a file that gets shorter would kill the program, nor written.
        m_tiff.reset(TIFFClientOpenExt("picture", "rm", device, readBytes, writeNothing, seekTo, closeNothing,
                                       sizeOf, nullptr, nullptr, options.get()));
    }

    bool read(qint64 pixelLimit, ZtPicture *picture)
    {
        if (!m_tiff)
            return cannotDecode();
        readHeader();
        if (m_width == 0 || m_height == 0)
            return cannotDecode(ZtStillImageSource::tr("it has no size"));
        return ZtPictureReader::isUsableSize(m_width, m_height, pixelLimit, m_fault) && isPlausible() &&
               (isDeepGrey() ? readDeepGrey(picture) : readColours(picture)) && finish(picture);
    }

private:
    bool cannotDecode(const QString &reason = QString())
    {
        QString shown = reason.isEmpty() ? m_error : reason;
        if (shown.isEmpty())
            shown = ZtStillImageSource::tr("the file is damaged");
        m_fault->message = ZtStillImageSource::tr("The picture cannot be decoded (%1)").arg(shown);
        return false;
    }

    template <typename T>
    T field(uint32_t tag, T missing) const
    {
        T value = missing;
        return TIFFGetField(m_tiff.get(), tag, &value) ? value : missing;
    }

    template <typename T>
    T fieldOrDefault(uint32_t tag) const
    {
        T value = 0;
        TIFFGetFieldDefaulted(m_tiff.get(), tag, &value);
        return value;
    }

    void readHeader()
    {
        m_width = field<uint32_t>(TIFFTAG_IMAGEWIDTH, 0);
        m_height = field<uint32_t>(TIFFTAG_IMAGELENGTH, 0);
        m_bits = fieldOrDefault<uint16_t>(TIFFTAG_BITSPERSAMPLE);
        m_samples = fieldOrDefault<uint16_t>(TIFFTAG_SAMPLESPERPIXEL);
        m_photometric = field<uint16_t>(TIFFTAG_PHOTOMETRIC, PHOTOMETRIC_MINISBLACK);
        const char *text = nullptr;
        if (TIFFGetField(m_tiff.get(), TIFFTAG_IMAGEDESCRIPTION, &text) && text)
            m_description = decoded(text);
    }

    // TIFF says ASCII, OME writes UTF-8, and others write whatever their system uses.
    static QString decoded(const QByteArray &text)
    {
        return ZtTextDecoder::firstInvalidByte(text) < 0 ? QString::fromUtf8(text)
                                                         : QString::fromLatin1(text);
    }

    quint64 pixelBytes() const
    {
        return (static_cast<quint64>(m_width) * m_height * m_samples * m_bits + 7) / 8;
    }

    // A header of a hundred bytes can announce gigabytes; all memory depends on these numbers.
    bool isPlausible()
    {
        const quint64 blockBytes =
            TIFFIsTiled(m_tiff.get()) ? TIFFTileSize64(m_tiff.get()) : TIFFStripSize64(m_tiff.get());
        // Colours of a lower resolution than the brightness are a compression, too.
        const bool isPacked = fieldOrDefault<uint16_t>(TIFFTAG_COMPRESSION) != COMPRESSION_NONE ||
                              m_photometric == PHOTOMETRIC_YCBCR;
        const quint64 enough = isPacked ? pixelBytes() / strongestCompression : pixelBytes();
        if (enough > m_fileSize)
            return cannotDecode(ZtStillImageSource::tr("the file is too short for its picture"));
        if (blockBytes == 0 || blockBytes > 4 * pixelBytes() + blockSlack)
            return cannotDecode();
        return true;
    }

    bool isDeepGrey() const
    {
        uint16_t sampleFormat = SAMPLEFORMAT_UINT;
        TIFFGetFieldDefaulted(m_tiff.get(), TIFFTAG_SAMPLEFORMAT, &sampleFormat);
        return m_bits == 16 && m_samples == 1 &&
               (sampleFormat == SAMPLEFORMAT_UINT || sampleFormat == SAMPLEFORMAT_VOID) &&
               (m_photometric == PHOTOMETRIC_MINISBLACK || m_photometric == PHOTOMETRIC_MINISWHITE);
    }

    bool readDeepGrey(ZtPicture *picture)
    {
        QImage deep(static_cast<int>(m_width), static_cast<int>(m_height), QImage::Format_Grayscale16);
        if (deep.isNull())
            return cannotDecode(ZtStillImageSource::tr("there is not enough memory"));
        if (!(TIFFIsTiled(m_tiff.get()) ? readTiles(&deep) : readStrips(&deep)))
            return cannotDecode();
        picture->greyBits = greyBits(deep);
        picture->image = ZtDeepGrey::toEightBits(deep, picture->greyBits);
        if (m_photometric == PHOTOMETRIC_MINISWHITE)
            picture->image.invertPixels();
        return true;
    }

    bool readStrips(QImage *deep)
    {
        const auto rows = static_cast<int>(qMin(fieldOrDefault<uint32_t>(TIFFTAG_ROWSPERSTRIP), m_height));
        const tmsize_t lineBytes = TIFFScanlineSize(m_tiff.get());
        if (rows <= 0 || lineBytes != static_cast<tmsize_t>(m_width) * 2)
            return false;
        QByteArray strip(static_cast<int>(qMin<tmsize_t>(TIFFStripSize(m_tiff.get()), INT_MAX)), 0);
        for (int y = 0; y < deep->height(); y += rows) {
            const int count = qMin(rows, deep->height() - y);
            const uint32_t number = TIFFComputeStrip(m_tiff.get(), static_cast<uint32_t>(y), 0);
            if (TIFFReadEncodedStrip(m_tiff.get(), number, strip.data(), count * lineBytes) !=
                count * lineBytes)
                return false;
            copyBlock(strip, lineBytes, QRect(0, y, deep->width(), count), deep);
        }
        return true;
    }

    bool readTiles(QImage *deep)
    {
        const auto width = static_cast<int>(field<uint32_t>(TIFFTAG_TILEWIDTH, 0));
        const auto height = static_cast<int>(field<uint32_t>(TIFFTAG_TILELENGTH, 0));
        const tmsize_t bytes = TIFFTileSize(m_tiff.get());
        if (width <= 0 || height <= 0 || bytes != static_cast<tmsize_t>(width) * height * 2)
            return false;
        QByteArray tile(static_cast<int>(qMin<tmsize_t>(bytes, INT_MAX)), 0);
        for (int y = 0; y < deep->height(); y += height) {
            for (int x = 0; x < deep->width(); x += width) {
                if (TIFFReadTile(m_tiff.get(), tile.data(), static_cast<uint32_t>(x),
                                 static_cast<uint32_t>(y), 0, 0) != bytes)
                    return false;
                copyBlock(tile, static_cast<tmsize_t>(width) * 2, QRect(x, y, width, height) & deep->rect(),
                          deep);
            }
        }
        return true;
    }

    static void copyBlock(const QByteArray &block, tmsize_t lineBytes, const QRect &place, QImage *deep)
    {
        for (int row = 0; row < place.height(); ++row)
            std::memcpy(deep->scanLine(place.top() + row) + 2 * place.left(),
                        block.constData() + row * lineBytes, static_cast<size_t>(place.width()) * 2);
    }

    int greyBits(const QImage &deep) const
    {
        const int used = ZtDeepGrey::significantBits(deep);
        const int stated = statedBits();
        // More than sixteen is nonsense, and fewer than the values use would cut them off.
        return stated >= used && stated <= 16 ? stated : used;
    }

    int statedBits() const
    {
        if (ZtPixelSizeReader::isOme(m_description))
            return ZtPixelSizeReader::significantBitsOfOme(m_description);
        int bits = 0;
        while (field<uint16_t>(TIFFTAG_MAXSAMPLEVALUE, 0) >> bits)
            ++bits;
        return bits;
    }

    bool readColours(ZtPicture *picture)
    {
        char reason[1024] = "";
        if (!TIFFRGBAImageOK(m_tiff.get(), reason))
            return cannotDecode(QString::fromLatin1(reason));
        QImage image(static_cast<int>(m_width), static_cast<int>(m_height),
                     hasAlpha() ? QImage::Format_RGBA8888_Premultiplied : QImage::Format_RGBX8888);
        if (image.isNull())
            return cannotDecode(ZtStillImageSource::tr("there is not enough memory"));
        // In the order of the file: turning upright follows for all pictures alike.
        if (!TIFFReadRGBAImageOriented(m_tiff.get(), m_width, m_height,
                                       reinterpret_cast<uint32_t *>(image.bits()), orientation(), 1))
            return cannotDecode();
        picture->image = std::move(image).convertToFormat(hasAlpha() ? QImage::Format_ARGB32_Premultiplied
                                                                     : QImage::Format_RGB32);
        return true;
    }

    bool hasAlpha() const
    {
        uint16_t count = 0;
        const uint16_t *kinds = nullptr;
        return TIFFGetField(m_tiff.get(), TIFFTAG_EXTRASAMPLES, &count, &kinds) && count == 1 &&
               kinds[0] != EXTRASAMPLE_UNSPECIFIED;
    }

    uint16_t orientation() const
    {
        const uint16_t value = field<uint16_t>(TIFFTAG_ORIENTATION, ORIENTATION_TOPLEFT);
        return value >= ORIENTATION_TOPLEFT && value <= ORIENTATION_LEFTBOT ? value
                                                                            : uint16_t(ORIENTATION_TOPLEFT);
    }

    bool finish(ZtPicture *picture)
    {
        picture->pixelSize = pixelSize();
        turnUpright(picture);
        return true;
    }

    ZtOfferedPixelSize pixelSize() const
    {
        const double x = static_cast<double>(field<float>(TIFFTAG_XRESOLUTION, 0.0F));
        const double y = static_cast<double>(field<float>(TIFFTAG_YRESOLUTION, 0.0F));
        ZtOfferedPixelSize size;
        if (ZtPixelSizeReader::isOme(m_description))
            size = ZtPixelSizeReader::fromOme(m_description);
        else if (ZtPixelSizeReader::isImageJ(m_description))
            size = ZtPixelSizeReader::fromImageJ(m_description, x, y);
        return size.isKnown() ? size : fromTags(x, y);
    }

    ZtOfferedPixelSize fromTags(double x, double y) const
    {
        switch (fieldOrDefault<uint16_t>(TIFFTAG_RESOLUTIONUNIT)) {
        case RESUNIT_INCH:
            return ZtPixelSizeReader::fromResolution(x / 0.0254, y / 0.0254, QStringLiteral("TIFF"));
        case RESUNIT_CENTIMETER:
            return ZtPixelSizeReader::fromResolution(x * 100.0, y * 100.0, QStringLiteral("TIFF"));
        default:
            return ZtOfferedPixelSize(); // a proportion only
        }
    }

    void turnUpright(ZtPicture *picture) const
    {
        const uint16_t value = orientation();
        if (value == ORIENTATION_TOPRIGHT || value == ORIENTATION_BOTLEFT || value == ORIENTATION_BOTRIGHT)
            picture->image =
                picture->image.mirrored(value != ORIENTATION_BOTLEFT, value != ORIENTATION_TOPRIGHT);
        if (value < ORIENTATION_LEFTTOP)
            return;
        std::swap(picture->pixelSize.x, picture->pixelSize.y);
        // Rows are columns: transposed first.
        picture->image = picture->image.transformed(QTransform(0, 1, 1, 0, 0, 0))
                             .mirrored(value == ORIENTATION_RIGHTTOP || value == ORIENTATION_RIGHTBOT,
                                       value == ORIENTATION_RIGHTBOT || value == ORIENTATION_LEFTBOT);
    }

    ZtFault *m_fault;
    quint64 m_fileSize;
    QString m_error;
    TiffPointer m_tiff; ///< dies before m_error, which it may write to
    QString m_description;
    uint32_t m_width = 0;
    uint32_t m_height = 0;
    uint16_t m_bits = 0;
    uint16_t m_samples = 0;
    uint16_t m_photometric = 0;
};

} // namespace

bool ZtTiffReader::isTiff(const QByteArray &header)
{
    const QByteArray start = header.left(4);
    return start == QByteArray("II*\0", 4) || start == QByteArray("MM\0*", 4) ||
           start == QByteArray("II+\0", 4) || start == QByteArray("MM\0+", 4);
}

bool ZtTiffReader::read(QIODevice *device, qint64 pixelLimit, ZtPicture *picture, ZtFault *fault)
{
    return Tiff(device, fault).read(pixelLimit, picture);
}
