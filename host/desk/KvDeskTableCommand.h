// SPDX-License-Identifier: MIT
#pragma once

#include <QUndoCommand>
#include <QVector>

#include <memory>
#include <vector>

class ZtMeasuringDocument;
class ZtReadyObjects;
struct ZtTakenTables;

/** A step of the history that imported a table. Undone, it keeps the table's objects as they are; done, it
 * keeps nothing. */
class KvDeskTableCommand : public QUndoCommand
{
public:
    /** \a document has to outlive the step. */
    KvDeskTableCommand(const QString &text, ZtMeasuringDocument *document,
                       std::vector<ZtReadyObjects> objects);
    ~KvDeskTableCommand() override;

    void undo() override;
    void redo() override;

private:
    ZtMeasuringDocument *m_document;
    std::vector<ZtReadyObjects> m_ready; ///< until the table is imported
    std::unique_ptr<ZtTakenTables> m_taken;
    QVector<int> m_types;
};
