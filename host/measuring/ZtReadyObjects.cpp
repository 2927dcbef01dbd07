// SPDX-License-Identifier: MIT
#include "measuring/ZtReadyObjects.h"

#include "measuring/ZtImportedManipulator.h"
#include "measuring/ZtImportedObjectData.h"
#include "measuring/ZtImportedTable.h"
#include "measuring/ZtProgress.h"
#include "measuring/ZtTableImport.h"

namespace {

std::vector<ZtReadyObjects> ofTables(const QVector<ZtSessionTable> &tables, ZtProgress *progress)
{
    std::vector<ZtReadyObjects> ready;
    ready.reserve(static_cast<std::size_t>(tables.size()));
    for (const ZtSessionTable &table : tables)
        ready.emplace_back(table, progress);
    return ready;
}

} // namespace

ZtReadyObjects::ZtReadyObjects(const ZtSessionTable &table, ZtProgress *progress)
    : m_table(table)
    , m_manipulator(std::make_unique<ZtImportedManipulator>(0, table.type))
{
    for (int i = 0; i < m_table.rows.size() && ZtProgress::look(progress, i, 0); ++i)
        add(&m_table.rows[i]);
}

ZtReadyObjects::ZtReadyObjects(ZtReadyObjects &&other) noexcept
    : m_table(std::move(other.m_table))
    , m_manipulator(std::move(other.m_manipulator))
{
    m_objects.swap(other.m_objects);
}

ZtReadyObjects::~ZtReadyObjects()
{
    qDeleteAll(m_objects);
}

std::vector<ZtReadyObjects> ZtReadyObjects::ofTable(const ZtImportedTable &table, ZtProgress *progress)
{
    QVector<ZtSessionTable> tables;
    for (const std::shared_ptr<const ZtImportedType> &type : table.types)
        tables.append(ZtSessionTable::ofType(type));
    return ofTables(tables, progress);
}

std::vector<ZtReadyObjects> ZtReadyObjects::ofSession(const ZtSession &session, ZtProgress *progress)
{
    return ofTables(session.tables, progress);
}

void ZtReadyObjects::add(ZtSessionRow *row)
{
    auto object = std::make_unique<ZtImportedObjectData>(row->row);
    for (const int position : qAsConst(row->hiddenValues))
        m_manipulator->setValueShown(object.get(), position, false);
    m_objects.insert(m_objects.constEnd(), row->id, object.release());
    // Reports ask for the names again and again: also those that could be made up are stored.
    const QString typeName = m_table.type->name();
    row->name = ZtMeasuringManipulator::ownName(row->name, typeName, row->id);
    m_manipulator->setObjectName(
        row->id, row->name.isEmpty() ? typeName + QLatin1Char(' ') + QString::number(row->id) : row->name);
}

int ZtReadyObjects::handOver(int afterId)
{
    const int id = ZtTableImport::registerType(std::move(m_manipulator), afterId);
    ZtObjectMap objects;
    objects.swap(m_objects);
    ZtKernelData::getInstance()->setObjects(id, std::move(objects));
    return id;
}
