// SPDX-License-Identifier: MIT
#pragma once

#include "KvDeskFileCommands.h"
#include "KvDeskSession.h"
#include "KvDeskSourceCommands.h"
#include "measuring/ZtMeasuringDocument.h"

#include <QWidget>

/** Everything that shows image sources, without a main window. */
class SourceDesk
{
public:
    SourceDesk()
        : session(&document)
        , files(&session, &window)
        , commands(&session, &files)
    {}

    ZtFrameSource *source() const { return document.frameSource(); }

    ZtMeasuringDocument document;
    KvDeskSession session;
    QWidget window;
    KvDeskFileCommands files;
    KvDeskSourceCommands commands;
};
