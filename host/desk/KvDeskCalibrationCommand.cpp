// SPDX-License-Identifier: MIT
#include "KvDeskCalibrationCommand.h"

#include "measuring/ZtMeasuringDocument.h"

KvDeskCalibrationCommand::KvDeskCalibrationCommand(const QString &text, ZtMeasuringDocument *document,
                                                   const ZtCalibration &calibration)
    : QUndoCommand(text)
    , m_document(document)
    , m_before(document->calibration())
    , m_after(calibration)
{}

void KvDeskCalibrationCommand::undo()
{
    m_document->setCalibration(m_before);
}

void KvDeskCalibrationCommand::redo()
{
    m_document->setCalibration(m_after);
}
