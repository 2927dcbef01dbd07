// SPDX-License-Identifier: MIT
#include "blocks/image/KvImageNodeCfg.h"

#include "blocks/common/KvJsonRead.h"
#include "blocks/image/KvImageFile.h"

#include <QBuffer>
#include <QJsonObject>

namespace {

const char kPathKey[] = "imgPath";
const char kDataKey[] = "imgData";

const char kPngSignature[] = "\x89PNG\r\n\x1a\n";

} // namespace

KvImageNodeCfg::KvImageNodeCfg(KvTemplateContext *context, QObject *parent)
    : KvBaseEditorNodeCfg(context, parent)
{}

bool KvImageNodeCfg::toJson(QJsonObject &config) const
{
    config[QLatin1String(kPathKey)] = m_imagePath;
    m_placement.toJson(config);
    if (!config.contains(QLatin1String(kDataKey)))
        config[QLatin1String(kDataKey)] = QString::fromLatin1(png().toBase64());
    return true;
}

bool KvImageNodeCfg::fromJson(const QJsonObject &config)
{
    if (!config.contains(QLatin1String(kPathKey)) || !KvPicturePlacement::isIn(config))
        return false;
    m_imagePath = KvJsonRead::readString(config, QLatin1String(kPathKey), m_imagePath);
    if (!m_placement.readFrom(config))
        return false;
    readImage(config);
    return true;
}

void KvImageNodeCfg::readImage(const QJsonObject &config)
{
    const QJsonValue data = config.value(QLatin1String(kDataKey));
    if (!data.isString()) {
        setImage(m_imagePath, KvImageFile::load(m_imagePath));
        return;
    }
    // A damaged picture does not fall back to the file: what the template embeds decides.
    const QByteArray bytes = QByteArray::fromBase64(data.toString().toLocal8Bit());
    setImage(m_imagePath, KvImageFile::decode(bytes, m_imagePath));
    if (!m_image.isNull() && bytes.startsWith(kPngSignature))
        m_png = bytes;
}

QByteArray KvImageNodeCfg::png() const
{
    // Stays empty for a null picture, which has no encoding.
    if (m_png.isEmpty()) {
        QBuffer buffer(&m_png);
        buffer.open(QIODevice::WriteOnly);
        m_image.save(&buffer, "PNG");
    }
    return m_png;
}

void KvImageNodeCfg::setImage(const QString &path, const QPixmap &image)
{
    m_imagePath = path;
    m_image = image;
    m_png.clear();
}
