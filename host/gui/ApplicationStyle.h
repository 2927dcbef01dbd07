// SPDX-License-Identifier: MIT
#pragma once

#include <QProxyStyle>

namespace acss {

/**
 * The widget style below the application's style sheet: Fusion, with the application's own icons in message
 * boxes and in Qt's file dialogs, in the colours of the theme.
 *
 * Letters of shortcuts are underlined, but not where writing runs from right to left: Qt draws an underlined
 * letter on its own, which tears apart the joined letters of Arabic. The keys work all the same.
 */
class ApplicationStyle : public QProxyStyle
{
    Q_OBJECT
public:
    ApplicationStyle();

    int styleHint(StyleHint hint, const QStyleOption *option, const QWidget *widget,
                  QStyleHintReturn *returnData) const override;
    int pixelMetric(PixelMetric metric, const QStyleOption *option, const QWidget *widget) const override;
    QIcon standardIcon(StandardPixmap standardPixmap, const QStyleOption *option,
                       const QWidget *widget) const override;
};

} // namespace acss
