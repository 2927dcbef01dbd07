// SPDX-License-Identifier: MIT
#pragma once

#include "report/KvBaseDisplayWidget.h"
#include "report/KvBaseDisplayWidgetSignals.h"
#include "templates/KvTemplateContext.h"

#include <QSignalSpy>

/** Counts what a table block tells layout and window. */
struct TableSpies
{
    TableSpies(const KvBaseDisplayWidget &table, const KvTemplateContext *context)
        : pieces(table.displaySignals(), SIGNAL(signalSubWidgetsChanged()))
                 , changed(table.displaySignals(), SIGNAL(signalWidgetChanged()))
                           , config(table.displaySignals(),
                                    SIGNAL(signalWidgetConfigChanged(const KvBaseEditorNodeCfg *)))
                                    , modified(context, SIGNAL(signalTemplateModified()))
    {}

    QSignalSpy pieces;
    QSignalSpy changed;
    QSignalSpy config;
    QSignalSpy modified;
};
