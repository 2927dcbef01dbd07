// SPDX-License-Identifier: MIT
#pragma once

#include "blocks/common/KvPicturePlacement.h"
#include "templates/KvBaseEditorNodeCfg.h"

/** What the user set for a block with the camera's picture, which itself is no part of the template. */
class KvCameraImageNodeCfg : public KvBaseEditorNodeCfg
{
    Q_OBJECT
public:
    struct Options
    {
        KvPicturePlacement placement;
        bool renderMeasurements = false; ///< whether the measurement objects are drawn on the picture

        bool operator==(const Options &other) const;
    };

    explicit KvCameraImageNodeCfg(KvTemplateContext *context, QObject *parent = nullptr);

    bool toJson(QJsonObject &config) const override;
    /**
     * Requires "alignment", "widthPercent" and "renderMeasurements"; otherwise false, and nothing changes.
     * Also false where one of the two numbers is none: what was read up to there is kept.
     */
    bool fromJson(const QJsonObject &config) override;

    const Options &options() const { return m_options; }
    void setOptions(const Options &options) { m_options = options; }

private:
    Options m_options;
};
