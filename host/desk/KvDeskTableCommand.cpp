// SPDX-License-Identifier: MIT
#include "KvDeskTableCommand.h"

#include "measuring/ZtMeasuringDocument.h"
#include "measuring/ZtReadyObjects.h"
#include "measuring/ZtTakenTables.h"

#include <utility>

KvDeskTableCommand::KvDeskTableCommand(const QString &text, ZtMeasuringDocument *document,
                                       std::vector<ZtReadyObjects> objects)
    : QUndoCommand(text)
    , m_document(document)
    , m_ready(std::move(objects))
{}

KvDeskTableCommand::~KvDeskTableCommand()
{
    ZtTakenTables::retire(std::move(m_taken));
}

void KvDeskTableCommand::undo()
{
    m_taken = m_document->takeTables(m_types);
}

void KvDeskTableCommand::redo()
{
    if (m_taken) {
        m_document->restoreTables(std::move(m_taken));
        return;
    }
    m_types = m_document->addTable(&m_ready);
    m_ready.clear();
}
