// SPDX-License-Identifier: MIT
#pragma once

#include <QObject>

class KvBaseEditorNodeCfg;

/** Carries the signals of a display widget, which is a plain interface and can have none of its own. */
class KvBaseDisplayWidgetSignals : public QObject
{
    Q_OBJECT
public:
    KvBaseDisplayWidgetSignals();

signals:
    void signalWidgetChanged();                                      ///< a piece changed its size or content
    void signalWidgetConfigChanged(const KvBaseEditorNodeCfg *aCfg); ///< the user changed the block's options
    void signalSubWidgetsChanged();   ///< number or identity of the pieces changed
    void signalFocusBackToPageView(); ///< an inline editor gave up the keyboard focus
};
