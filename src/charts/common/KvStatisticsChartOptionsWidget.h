// SPDX-License-Identifier: MIT
#pragma once

#include "blocks/common/KvThemedOptionsWidget.h"

/**
 * Base of the options panels of all charts. They write nothing to the configuration: what the user chooses is
 * announced, and the chart's display widget stores it.
 */
class KvStatisticsChartOptionsWidget : public KvThemedOptionsWidget
{
    Q_OBJECT
public:
    /** Shows the settings of any chart; other configurations are ignored. */
    void setFromConfig(const KvBaseEditorNodeCfg *cfg) override;

protected:
    KvStatisticsChartOptionsWidget(const QString &heading, QWidget *parent);

    /** Each checks its button, and no other, and returns the alignment that the button stands for. */
    Qt::Alignment chooseLeft();
    Qt::Alignment chooseCenter();
    Qt::Alignment chooseRight();

private:
    Qt::Alignment choose(Qt::Alignment alignment);
};
