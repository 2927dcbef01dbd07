// SPDX-License-Identifier: MIT
#include "measuring/ZtMeasuringDocument.h"

#include "kernel/ZtKernelData.h"
#include "kernel/ZtKernelObjectDataDescr.h"
#include "kernel/ZtSignalCenter.h"
#include "measuring/ZtDrawnManipulator.h"
#include "measuring/ZtDrawnObjectData.h"
#include "measuring/ZtDrawnType.h"
#include "measuring/ZtImportedManipulator.h"
#include "measuring/ZtImportedObjectData.h"
#include "measuring/ZtImportedTable.h"
#include "measuring/ZtKernelImage.h"
#include "measuring/ZtLoadedSession.h"
#include "measuring/ZtObjectsPainter.h"
#include "measuring/ZtReadyObjects.h"
#include "measuring/ZtSession.h"
#include "measuring/ZtStillImageSource.h"
#include "measuring/ZtTableImport.h"
#include "measuring/ZtTakenTables.h"
#include "measuring/ZtUnitSettings.h"

#include <algorithm>
#include <utility>

namespace {

ZtKernelData *kernel()
{
    return ZtKernelData::getInstance();
}

const ZtImportedManipulator *importedManipulator(int typeId)
{
    return static_cast<const ZtImportedManipulator *>(kernel()->getGsManipulator(typeId));
}

void hideValues(int typeId, int id, const QVector<int> &positions)
{
    if (positions.isEmpty())
        return;
    auto *manipulator = static_cast<ZtMeasuringManipulator *>(kernel()->getGsManipulator(typeId));
    auto *object = static_cast<ZtMeasuredObjectData *>(kernel()->object(typeId, id));
    for (const int position : positions)
        manipulator->setValueShown(object, position, false);
}

// The first object of each type that has any. No copy of the maps: the next change would copy all objects.
QVector<QPair<int, int>> firstObjects()
{
    QVector<QPair<int, int>> first;
    const QMap<int, ZtObjectMap> &all = kernel()->objects();
    for (auto it = all.constBegin(); it != all.constEnd(); ++it) {
        if (!it->isEmpty())
            first.append({it.key(), it->firstKey()});
    }
    return first;
}

// One announcement per type stands for all of its objects: receivers refresh everything.
void announceFirst(int type)
{
    const auto objects = kernel()->objects().constFind(type);
    if (objects != kernel()->objects().constEnd() && !objects->isEmpty())
        emit ZtSignalCenter::getInstance()->signalObjectCreated(type, objects->firstKey(), objects->first());
}

void announceTypes()
{
    for (const QPair<int, int> &object : firstObjects())
        announceFirst(object.first);
}

ZtSessionRow toSessionRow(const ZtImportedManipulator &manipulator, int id, const ZtKernelObjectData *data)
{
    const auto *object = static_cast<const ZtImportedObjectData *>(data);
    return {id, object->row(), manipulator.ownName(id), object->hiddenValues()};
}

ZtSessionObject toSessionObject(const ZtDrawnType &type, int id, const ZtKernelObjectData *data)
{
    const auto *drawn = static_cast<const ZtDrawnObjectData *>(data);
    ZtSessionObject object;
    object.type = &type;
    object.id = id;
    object.name = static_cast<ZtMeasuringManipulator *>(kernel()->getGsManipulator(type.id))->ownName(id);
    object.text = drawn->text();
    object.points = drawn->points();
    object.hiddenValues = drawn->hiddenValues();
    return object;
}

} // namespace

ZtMeasuringDocument::ZtMeasuringDocument(QObject *parent)
    : QObject(parent)
    , m_calibration(std::make_shared<ZtCalibration>())
    , m_kernelImage(std::make_unique<ZtKernelImage>())
    , m_objectsPainter(std::make_unique<ZtObjectsPainter>(m_calibration))
{
    // From now on changed unit settings are announced.
    ZtUnitSettings::getInstance();
    registerTypes();
    kernel()->setKernelImage(m_kernelImage.get());
    kernel()->setObjectPainter(m_objectsPainter.get());
    connectSignals();
}

void ZtMeasuringDocument::connectSignals()
{
    const ZtSignalCenter *const center = ZtSignalCenter::getInstance();
    connect(center, SIGNAL(signalObjectCreated(int,int,const ZtKernelObjectData*)), this,
                           SLOT(slotObjectTouched(int,int,const ZtKernelObjectData*)));
    connect(center, SIGNAL(signalObjectChanged(int,int,const ZtKernelObjectData*)), this,
                           SLOT(slotObjectTouched(int,int,const ZtKernelObjectData*)));
    connect(center, SIGNAL(signalObjectRemoved(int,int)), this, SLOT(slotObjectRemoved(int,int)));
}

ZtMeasuringDocument::~ZtMeasuringDocument()
{
    if (kernel()->kernelImage() == m_kernelImage.get())
        kernel()->setKernelImage(nullptr);
    if (kernel()->objectPainter() == m_objectsPainter.get())
        kernel()->setObjectPainter(nullptr);
    unregisterTypes(takeObjects(m_importedTypes).get());
    for (const ZtDrawnType &type : ZtDrawnType::all())
        kernel()->unregisterType(type.id);
}

void ZtMeasuringDocument::registerTypes()
{
    for (const ZtDrawnType &type : ZtDrawnType::all())
        kernel()->registerType(type.id, std::make_unique<ZtDrawnManipulator>(type, m_calibration),
                               std::make_unique<ZtKernelObjectDataDescr>(type.id, QLatin1String(type.key)));
}

void ZtMeasuringDocument::retranslate()
{
    for (const ZtDrawnType &type : ZtDrawnType::all())
        static_cast<ZtDrawnManipulator *>(kernel()->getGsManipulator(type.id))->retranslate();
}

void ZtMeasuringDocument::clear()
{
    std::unique_ptr<ZtTakenTables> taken = removeObjects();
    unregisterTypes(taken.get());
    setFrameSource(nullptr);
    setCalibration(ZtCalibration());
    ZtTakenTables::retire(std::move(taken));
}

std::unique_ptr<ZtTakenTables> ZtMeasuringDocument::removeObjects()
{
    const QVector<QPair<int, int>> first = firstObjects();
    std::unique_ptr<ZtTakenTables> taken = takeObjects(m_importedTypes);
    for (const QPair<int, int> &object : first) {
        if (m_importedTypes.contains(object.first))
            continue;
        qDeleteAll(kernel()->takeObjects(object.first));
        if (ZtGsManipulator *const manipulator = kernel()->getGsManipulator(object.first))
            manipulator->clearObjectNames();
    }
    for (const QPair<int, int> &object : first)
        emit ZtSignalCenter::getInstance()->signalObjectRemoved(object.first, object.second);
    return taken;
}

std::unique_ptr<ZtTakenTables> ZtMeasuringDocument::takeObjects(const QVector<int> &types)
{
    auto taken = std::make_unique<ZtTakenTables>();
    for (const int id : types) {
        if (!m_importedTypes.contains(id))
            continue;
        ZtTakenTables::Table table;
        table.typeId = id;
        table.objects = kernel()->takeObjects(id);
        if (m_tables.contains(id))
            table.rows = m_tables.take(id);
        taken->tables.push_back(std::move(table));
    }
    return taken;
}

void ZtMeasuringDocument::unregisterTypes(ZtTakenTables *taken)
{
    for (ZtTakenTables::Table &table : taken->tables) {
        table.manipulator = kernel()->unregisterType(table.typeId);
        m_importedTypes.removeAll(table.typeId);
    }
}

std::unique_ptr<ZtTakenTables> ZtMeasuringDocument::takeTables(const QVector<int> &types)
{
    std::unique_ptr<ZtTakenTables> taken = takeObjects(types);
    // As long as the types are known: receivers ask what went.
    for (const ZtTakenTables::Table &table : taken->tables) {
        if (!table.objects.isEmpty())
            emit ZtSignalCenter::getInstance()->signalObjectRemoved(table.typeId, table.objects.firstKey());
    }
    unregisterTypes(taken.get());
    return taken;
}

void ZtMeasuringDocument::restoreTables(std::unique_ptr<ZtTakenTables> taken)
{
    for (ZtTakenTables::Table &table : taken->tables) {
        const int id = table.typeId;
        const QString name = table.manipulator->objectTypeName(0);
        kernel()->registerType(id, std::move(table.manipulator),
                               std::make_unique<ZtKernelObjectDataDescr>(id, name));
        ZtObjectMap objects;
        objects.swap(table.objects);
        kernel()->setObjects(id, std::move(objects));
        if (table.rows)
            m_tables.insert(id, *std::exchange(table.rows, std::nullopt));
        m_importedTypes.insert(std::lower_bound(m_importedTypes.begin(), m_importedTypes.end(), id), id);
    }
    for (const ZtTakenTables::Table &table : taken->tables)
        announceFirst(table.typeId);
}

void ZtMeasuringDocument::setCalibration(const ZtCalibration &calibration)
{
    if (calibration == *m_calibration)
        return;
    const bool isSameSize = calibration.hasSamePixelSize(*m_calibration);
    *m_calibration = calibration;
    emit signalCalibrationChanged();
    if (!isSameSize)
        emit ZtSignalCenter::getInstance()->signalLengthUnitChanged();
}

bool ZtMeasuringDocument::loadImage(const QString &path, ZtFault *fault)
{
    std::unique_ptr<ZtStillImageSource> source = ZtStillImageSource::load(path, fault);
    if (!source)
        return false;
    showImage(std::move(source));
    return true;
}

void ZtMeasuringDocument::showImage(std::unique_ptr<ZtStillImageSource> source)
{
    const QString path = source->path();
    const ZtCalibration offered = source->offeredCalibration();
    useSource(std::move(source), path, offered);
}

void ZtMeasuringDocument::setFrameSource(std::unique_ptr<ZtFrameSource> source)
{
    if (source || m_source || !m_imagePath.isEmpty())
        useSource(std::move(source), QString(), ZtCalibration());
}

void ZtMeasuringDocument::useSource(std::unique_ptr<ZtFrameSource> source, const QString &imagePath,
                                    const ZtCalibration &offered)
{
    m_kernelImage->setSource(source.get());
    m_source = std::move(source);
    m_imagePath = imagePath;
    m_offered = offered;
    emit signalImageChanged();
    m_kernelImage->requestImage();
}

int ZtMeasuringDocument::addObject(int typeId, const QPolygonF &points, const QString &name,
                                   const QString &text, int id)
{
    const ZtDrawnType *type = ZtDrawnType::find(typeId);
    if (!type || !type->acceptsPoints(points) || id < 0)
        return 0;
    // An object that gives way is announced, too.
    kernel()->removeObject(typeId, id);
    int added = 0;
    {
        // The name is set before anybody hears of the object.
        const ZtKernelData::SignalBlocker blocker;
        added = kernel()->addObject(typeId, std::make_unique<ZtDrawnObjectData>(points, text), id);
        kernel()->getGsManipulator(typeId)->setObjectName(added, name);
    }
    emit ZtSignalCenter::getInstance()->signalObjectCreated(typeId, added, kernel()->object(typeId, added));
    return added;
}

bool ZtMeasuringDocument::importTable(const QString &path, const ZtTableImportOptions &options,
                                      ZtFault *fault, QStringList *notes)
{
    ZtImportedTable table;
    if (!ZtTableImport::readFile(path, options, &table, fault))
        return false;
    if (notes)
        *notes = table.notes;
    std::vector<ZtReadyObjects> ready = ZtReadyObjects::ofTable(table);
    addTable(&ready);
    return true;
}

bool ZtMeasuringDocument::importTable(QIODevice *device, const QString &fileName,
                                      const ZtTableImportOptions &options, ZtFault *fault, QStringList *notes)
{
    ZtImportedTable table;
    if (!ZtTableImport::readDevice(device, fileName, options, &table, fault))
        return false;
    if (notes)
        *notes = table.notes;
    std::vector<ZtReadyObjects> ready = ZtReadyObjects::ofTable(table);
    addTable(&ready);
    return true;
}

QVector<int> ZtMeasuringDocument::addTable(std::vector<ZtReadyObjects> *ready)
{
    const QVector<int> ids = ZtTableImport::apply(ready);
    for (int i = 0; i < ids.size(); ++i)
        m_tables.insert(ids.at(i), (*ready)[static_cast<std::size_t>(i)].table());
    m_importedTypes += ids;
    return ids;
}

std::optional<ZtUnit> ZtMeasuringDocument::importedUnit(const QString &typeName,
                                                        const QString &valueName) const
{
    for (const int id : m_importedTypes) {
        const ZtImportedType &type = importedManipulator(id)->type();
        if (!typeName.isEmpty() && type.name() != typeName)
            continue;
        const int index = type.valueIndex(valueName);
        if (index >= 0)
            return type.values().at(index).unit;
    }
    return std::nullopt;
}

ZtSession ZtMeasuringDocument::toSession() const
{
    ZtSession session;
    session.imagePath = m_imagePath;
    session.calibration = *m_calibration;
    for (const ZtDrawnType &type : ZtDrawnType::all()) {
        const ZtObjectMap objects = kernel()->objects().value(type.id);
        for (auto it = objects.constBegin(); it != objects.constEnd(); ++it)
            session.objects.append(toSessionObject(type, it.key(), it.value()));
    }
    for (const int id : m_importedTypes)
        session.tables.append(toSessionTable(id));
    return session;
}

ZtSessionTable ZtMeasuringDocument::toSessionTable(int importedType) const
{
    const auto known = m_tables.constFind(importedType);
    if (known != m_tables.constEnd())
        return *known;
    const ZtImportedManipulator *manipulator = importedManipulator(importedType);
    ZtSessionTable table;
    table.type = manipulator->sharedType();
    const ZtObjectMap objects = kernel()->objects().value(importedType);
    table.rows.reserve(objects.size());
    for (auto it = objects.constBegin(); it != objects.constEnd(); ++it)
        table.rows.append(toSessionRow(*manipulator, it.key(), it.value()));
    m_tables.insert(importedType, table);
    return table;
}

void ZtMeasuringDocument::slotObjectTouched(int aType, int aId, const ZtKernelObjectData *aObject)
{
    const auto found = m_tables.find(aType);
    if (found == m_tables.end())
        return;
    QVector<ZtSessionRow> &rows = found->rows;
    const auto isBefore = [](const ZtSessionRow &row, int id) { return row.id < id; };
    const auto row = std::lower_bound(rows.begin(), rows.end(), aId, isBefore);
    const bool isKnown = row != rows.end() && row->id == aId;
    if (isKnown && kernel()->objects().value(aType).size() == rows.size())
        *row = toSessionRow(*importedManipulator(aType), aId, aObject);
    else
        m_tables.erase(found);
}

void ZtMeasuringDocument::slotObjectRemoved(int aType, int aId)
{
    Q_UNUSED(aId)
    m_tables.remove(aType);
}

bool ZtMeasuringDocument::saveSession(const QString &path, ZtFault *fault) const
{
    return toSession().save(path, fault);
}

bool ZtMeasuringDocument::loadSession(const QString &path, ZtFault *fault, MissingImage missingImage)
{
    ZtLoadedSession loaded;
    if (!loaded.read(path, fault))
        return false;
    if (!loaded.imageFault.isNull() && missingImage == MissingImage::IsFault) {
        *fault = {path, 0, 0, QStringLiteral("image"), loaded.imageFault.text()};
        return false;
    }
    setSession(&loaded);
    return true;
}

void ZtMeasuringDocument::setSession(ZtLoadedSession *loaded)
{
    clear();
    if (loaded->image)
        showImage(std::move(loaded->image));
    m_imagePath = loaded->session.imagePath;
    apply(loaded);
}

void ZtMeasuringDocument::apply(ZtLoadedSession *loaded)
{
    setCalibration(loaded->session.calibration);
    {
        const ZtKernelData::SignalBlocker blocker;
        addSessionObjects(loaded->session);
        addSessionTables(loaded);
    }
    announceTypes();
}

void ZtMeasuringDocument::addSessionObjects(const ZtSession &session)
{
    for (const ZtSessionObject &object : session.objects) {
        const int type = object.type->id;
        kernel()->addObject(type, std::make_unique<ZtDrawnObjectData>(object.points, object.text), object.id);
        kernel()->getGsManipulator(type)->setObjectName(object.id, object.name);
        hideValues(type, object.id, object.hiddenValues);
    }
}

void ZtMeasuringDocument::addSessionTables(ZtLoadedSession *loaded)
{
    std::vector<ZtReadyObjects> ready = std::move(loaded->tableObjects);
    if (ready.size() != static_cast<std::size_t>(loaded->session.tables.size()))
        ready = ZtReadyObjects::ofSession(loaded->session);
    for (ZtReadyObjects &objects : ready) {
        m_importedTypes.append(objects.handOver(m_importedTypes.isEmpty() ? 0 : m_importedTypes.last()));
        m_tables.insert(m_importedTypes.last(), objects.table());
    }
}
