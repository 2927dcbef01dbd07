// SPDX-License-Identifier: MIT
#pragma once

#include "DeskFiles.h"
#include "KvDeskObjectEditor.h"
#include "KvDeskResources.h"
#include "KvDeskSelection.h"
#include "KvDeskSession.h"
#include "KvDeskTableView.h"
#include "KvDeskValueCommands.h"
#include "KvDeskValueSelection.h"
#include "KvDeskValueTable.h"
#include "KvDeskValueTableModel.h"
#include "host/measuring/Polygon.h"
#include "kernel/ZtKernelData.h"
#include "measuring/ZtDrawnType.h"
#include "measuring/ZtFault.h"
#include "measuring/ZtMeasuringDocument.h"

/** A table of values with everything that it works on. */
class DeskValues
{
public:
    DeskValues()
        : session((KvDeskResources::ensure(), &document))
        , editor(&session, &selection)
    {
        table.setEditor(&editor);
        table.resize(416, 500);
        table.show();
    }

    bool openDemo()
    {
        ZtFault fault;
        const bool isOpen = session.open(DeskFiles::demoSession(), false, &fault);
        table.model()->flush();
        return isOpen;
    }

    KvDeskObjectId add(int type, const QPolygonF &points = polygon({QPointF(0, 0), QPointF(3, 4)}))
    {
        const KvDeskObjectId object{type, document.addObject(type, points)};
        table.model()->flush();
        return object;
    }

    QStringList selectedRows() const
    {
        return table.view()->selectedText().split(QLatin1Char('\n'), Qt::SkipEmptyParts);
    }

    ZtMeasuringDocument document;
    KvDeskSession session;
    KvDeskSelection selection;
    KvDeskObjectEditor editor;
    KvDeskValueTable table;
};
