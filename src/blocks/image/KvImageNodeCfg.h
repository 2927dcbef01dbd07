// SPDX-License-Identifier: MIT
#pragma once

#include "blocks/common/KvPicturePlacement.h"
#include "templates/KvBaseEditorNodeCfg.h"

#include <QByteArray>
#include <QPixmap>
#include <QString>

/** What the user set for a block with a picture. The picture itself goes into the template, too. */
class KvImageNodeCfg : public KvBaseEditorNodeCfg
{
    Q_OBJECT
public:
    explicit KvImageNodeCfg(KvTemplateContext *context, QObject *parent = nullptr);

    /** The picture is left out where \a config holds any value under "imgData" already. */
    bool toJson(QJsonObject &config) const override;
    /**
     * Requires "imgPath", "alignment" and "widthPercent"; otherwise false, and nothing changes. Also false
     * where one of the two numbers is none: what was read up to there is kept. The picture comes from
     * "imgData" if that is a text, else from the file "imgPath"; one that cannot be had is null.
     */
    bool fromJson(const QJsonObject &config) override;

    const KvPicturePlacement &placement() const { return m_placement; }
    void setPlacement(const KvPicturePlacement &placement) { m_placement = placement; }

    /** Where the picture came from; the file may be gone. */
    QString imagePath() const { return m_imagePath; }
    QPixmap image() const { return m_image; }
    void setImage(const QString &path, const QPixmap &image);

private:
    void readImage(const QJsonObject &config);
    QByteArray png() const;

    KvPicturePlacement m_placement;
    QString m_imagePath;
    QPixmap m_image;
    /** The picture's encoding as far as it is known: making it takes seconds, and every save needs it. */
    mutable QByteArray m_png;
};
