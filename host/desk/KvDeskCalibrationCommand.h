// SPDX-License-Identifier: MIT
#pragma once

#include "measuring/ZtCalibration.h"

#include <QUndoCommand>

class ZtMeasuringDocument;

/** A step of the history that measures with another calibration. */
class KvDeskCalibrationCommand : public QUndoCommand
{
public:
    /** \a document has to outlive the step. */
    KvDeskCalibrationCommand(const QString &text, ZtMeasuringDocument *document,
                             const ZtCalibration &calibration);

    void undo() override;
    void redo() override;

private:
    ZtMeasuringDocument *m_document;
    ZtCalibration m_before;
    ZtCalibration m_after;
};
