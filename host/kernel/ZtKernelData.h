// SPDX-License-Identifier: MIT
#pragma once

#include "kernel/ZtKernelGlobal.h"

#include <QMap>

#include <map>
#include <memory>

class iZTKernelImage;
class iZTObjectPainter;
class ZtGsManipulator;
class ZtKernelObjectData;
class ZtKernelObjectDataDescr;

/** Objects of one type by object id. */
using ZtObjectMap = QMap<int, ZtKernelObjectData *>;

/**
 * The process-wide data of the application: object types, the objects on the image, and the image itself.
 *
 * Object changes are announced by ZtSignalCenter, not by this class: addObject() and removeObject() emit
 * there, and who edits an object calls notifyObjectChanged(). GUI thread only.
 */
class ZT_KERNEL_EXPORT ZtKernelData
{
public:
    static ZtKernelData *getInstance(); ///< made at the first call

    /** All objects: object type id, then object id. */
    const QMap<int, ZtObjectMap> &objects() const { return m_objects; }
    ZtKernelObjectData *object(int type, int id) const; ///< null when there is none

    /** The manipulator of an object type, or null. */
    ZtGsManipulator *getGsManipulator(int type) const;
    /** The descriptor of an object type, or null. */
    ZtKernelObjectDataDescr *getDataDescriptor(int type) const;

    /** The image that delivers frames, or null. */
    iZTKernelImage *kernelImage() const { return m_image; }
    /** Installs the image; not owned, and forgotten by the caller with null before it dies. */
    void setKernelImage(iZTKernelImage *image) { m_image = image; }

    /** Draws all objects at once, or null: then every manipulator draws its own. */
    const iZTObjectPainter *objectPainter() const { return m_objectPainter; }
    /** Installs the painter; not owned, and forgotten by the caller with null before it dies. */
    void setObjectPainter(const iZTObjectPainter *painter) { m_objectPainter = painter; }

    /** Makes a type known, replacing what was registered under its id. Either pointer may be null. */
    void registerType(int type, std::unique_ptr<ZtGsManipulator> manipulator,
                      std::unique_ptr<ZtKernelObjectDataDescr> descriptor);
    /** Removes a type with all its objects, silently. The manipulator may be kept for a moment when it is
     * better freed later. */
    std::unique_ptr<ZtGsManipulator> unregisterType(int type);

    /**
     * Adds an object and emits its creation; returns its id. With \a id 0 it is one more than the type's
     * largest, from 1. An object that has the id already is removed first. Null is not added: the answer is
     * 0.
     */
    int addObject(int type, std::unique_ptr<ZtKernelObjectData> object, int id = 0);
    /** Removes and deletes an object and emits its removal; false when there is none. */
    bool removeObject(int type, int id);
    /** Announces that an object was edited. */
    void notifyObjectChanged(int type, int id) const;
    /** Removes all objects of all types, emitting a removal for each. Types stay registered. */
    void clearObjects();

    /**
     * Adds many objects of a type at once, silently, in the place of those that it had; takes them all. Costs
     * the same for any number of them, as long as nobody shares the map.
     */
    void setObjects(int type, ZtObjectMap objects);
    /** Removes all objects of a type, silently, and gives them to the caller. Their names stay. */
    ZtObjectMap takeObjects(int type);

    /** Another number after every change of objects, announced or not; the change counts before anybody hears
     * of it. For whoever keeps what was computed of many objects. */
    quint64 revision() const { return m_revision; }

    /** While at least one blocker lives, object changes are not announced (bulk loads). */
    class ZT_KERNEL_EXPORT SignalBlocker
    {
    public:
        SignalBlocker();
        ~SignalBlocker();
        SignalBlocker(const SignalBlocker &) = delete;
        SignalBlocker &operator=(const SignalBlocker &) = delete;
    };

private:
    ZtKernelData();
    ~ZtKernelData();
    Q_DISABLE_COPY(ZtKernelData)

    QMap<int, ZtObjectMap> m_objects;
    std::map<int, std::unique_ptr<ZtGsManipulator>> m_manipulators;
    std::map<int, std::unique_ptr<ZtKernelObjectDataDescr>> m_descriptors;
    iZTKernelImage *m_image = nullptr;
    const iZTObjectPainter *m_objectPainter = nullptr;
    mutable quint64 m_revision = 0; ///< announcing a change leaves the data as they are
    int m_blockers = 0;
};
