// SPDX-License-Identifier: MIT
#pragma once

#include "DeskFiles.h"
#include "KvDeskCalibrator.h"
#include "KvDeskObjectEditor.h"
#include "KvDeskSelection.h"
#include "KvDeskSession.h"
#include "host/measuring/Polygon.h"
#include "measuring/ZtDrawnType.h"
#include "measuring/ZtFault.h"
#include "measuring/ZtMeasuringDocument.h"

#include <QUndoStack>

/** A session with everything that calibrating it needs, and settings of its own. */
class CalibratedDesk
{
public:
    CalibratedDesk()
        : session(&document)
        , editor(&session, &selection)
        , calibrator(&session, &editor)
    {}

    KvDeskObjectId add(int type, const QPolygonF &points) { return {type, document.addObject(type, points)}; }

    KvDeskObjectId line(const QPointF &from, const QPointF &to)
    {
        return add(ZtDrawnType::Line, polygon({from, to}));
    }

    /** A picture whose file states how many micrometres a pixel is wide and high. */
    static QString picture(const QString &name, double x, double y)
    {
        QImage image(40, 30, QImage::Format_RGB32);
        image.fill(Qt::blue);
        image.setDotsPerMeterX(qRound(1e6 / x));
        image.setDotsPerMeterY(qRound(1e6 / y));
        const QString path = StatReportTest::temporaryPath(name);
        image.save(path);
        return path;
    }

    bool open(const QString &path)
    {
        ZtFault fault;
        return session.openImage(path, &fault);
    }

    ZtMeasuringDocument document;
    KvDeskSession session;
    KvDeskSelection selection;
    KvDeskObjectEditor editor;
    KvDeskCalibrator calibrator;
};
