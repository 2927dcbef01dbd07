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

    /** Letters of shortcuts are not underlined from right to left, which would tear joined letters apart. */
    int styleHint(StyleHint hint, const QStyleOption *option, const QWidget *widget,
                  QStyleHintReturn *returnData) const override;
    /** Message boxes have icons of a size that suits their strokes. */
    int pixelMetric(PixelMetric metric, const QStyleOption *option, const QWidget *widget) const override;
    /** The family's own icons for message boxes and file dialogs. */
    QIcon standardIcon(StandardPixmap standardPixmap, const QStyleOption *option,
                       const QWidget *widget) const override;
};

} // namespace acss
