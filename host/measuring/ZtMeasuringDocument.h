// SPDX-License-Identifier: MIT
#pragma once

#include "measuring/ZtCalibration.h"
#include "measuring/ZtFault.h"
#include "measuring/ZtMeasuringGlobal.h"
#include "measuring/ZtSession.h"
#include "measuring/ZtTableImportOptions.h"
#include "measuring/ZtUnit.h"

#include <QHash>
#include <QObject>
#include <QPolygonF>
#include <QVector>

#include <memory>
#include <optional>
#include <vector>

class QIODevice;
class ZtFrameSource;
class ZtKernelImage;
class ZtKernelObjectData;
class ZtObjectsPainter;
class ZtReadyObjects;
class ZtStillImageSource;
struct ZtLoadedSession;
struct ZtTakenTables;

/**
 * What a measuring application works on: the image, its calibration, and the objects in ZtKernelData.
 *
 * There is one at a time. While it lives the built-in object types are registered and the kernel has an
 * image; when it dies they are gone, with all objects. Operations that read a file change nothing when they
 * fail. GUI thread only.
 */
class ZT_MEASURING_EXPORT ZtMeasuringDocument : public QObject
{
    Q_OBJECT
public:
    enum class MissingImage { IsFault, IsIgnored };

    explicit ZtMeasuringDocument(QObject *parent = nullptr);
    ~ZtMeasuringDocument() override;

    /** Removes all objects, imported types, the image and the calibration. */
    void clear();

    const ZtCalibration &calibration() const { return *m_calibration; }
    /** Another pixel size changes the measured values of all drawn objects, which is announced as a change of
     * the length unit. */
    void setCalibration(const ZtCalibration &calibration);

    /** Absolute path of the image file; empty when there is none. */
    QString imagePath() const { return m_imagePath; }
    /** Shows an image file. The calibration stays; what the file says about it is in offeredCalibration(). */
    bool loadImage(const QString &path, ZtFault *fault);
    /** Shows an image file that was read already. */
    void showImage(std::unique_ptr<ZtStillImageSource> source);
    /** The pixel size that the image file states; uncalibrated when it states none. */
    ZtCalibration offeredCalibration() const { return m_offered; }

    ZtFrameSource *frameSource() const { return m_source.get(); }
    /** Takes frames from another source, such as a camera, or from none. */
    void setFrameSource(std::unique_ptr<ZtFrameSource> source);
    ZtKernelImage *kernelImage() const { return m_kernelImage.get(); }

    /** Draws all objects with their labels, on pictures as on the screen. */
    ZtObjectsPainter *objectsPainter() const { return m_objectsPainter.get(); }

    /**
     * Draws an object and returns its id: the next free one of its type, or \a id, then in place of the
     * object that has it.
     * \param typeId a ZtDrawnType::Id
     * \param points as ZtDrawnType::acceptsPoints() takes them
     * \param name   a name of its own, or empty
     * \param id     from 1, or 0 for a new one
     * \return 0 when there is no such type, or for points or an id that no object can have
     */
    int addObject(int typeId, const QPolygonF &points, const QString &name = QString(),
                  const QString &text = QString(), int id = 0);

    /** Adds the objects of a table. \a notes, unless null, takes what was left out of it. */
    bool importTable(const QString &path, const ZtTableImportOptions &options, ZtFault *fault,
                     QStringList *notes = nullptr);
    bool importTable(QIODevice *device, const QString &fileName, const ZtTableImportOptions &options,
                     ZtFault *fault, QStringList *notes = nullptr);
    /** Adds the objects of a table that was read already, which costs the same for any number of rows;
     * returns the ids of its types. */
    QVector<int> addTable(std::vector<ZtReadyObjects> *ready);
    /** Takes types that tables brought out of the kernel, with their objects and names as they are: at the
     * same cost for any number of rows, and announced as one removal per type. */
    std::unique_ptr<ZtTakenTables> takeTables(const QVector<int> &types);
    /** Puts them back under their ids, which no other types have got meanwhile. Costs and announces as
     * addTable(). */
    void restoreTables(std::unique_ptr<ZtTakenTables> taken);
    /** Ids of the types that tables brought, in ascending order. */
    const QVector<int> &importedTypes() const { return m_importedTypes; }

    /**
     * The unit in which imported tables give a value; no unit at all (an empty one) for values without.
     * \param typeName display name of the type; empty takes the first type that has the value
     */
    std::optional<ZtUnit> importedUnit(const QString &typeName, const QString &valueName) const;

    /** Replaces everything by a session's contents. An image that is missing can be ignored; its path is
     * kept. */
    bool loadSession(const QString &path, ZtFault *fault, MissingImage missingImage = MissingImage::IsFault);
    /** Replaces everything by a session that was read already; takes its image and the objects of its tables,
     * which costs the same for any number of rows. What was there before is freed by another thread. */
    void setSession(ZtLoadedSession *loaded);
    bool saveSession(const QString &path, ZtFault *fault) const;
    /** Everything that a session file holds, as it is now. The rows of tables are shared, and remembered
     * until some come or go: so this is quick even for large ones. */
    ZtSession toSession() const;

    /** Fetches the names of the built-in types again after the language changed. */
    void retranslate();

signals:
    void signalImageChanged();
    void signalCalibrationChanged();

private slots:
    void slotObjectTouched(int aType, int aId, const ZtKernelObjectData *aObject);
    void slotObjectRemoved(int aType, int aId);

private:
    void connectSignals();
    void registerTypes();
    std::unique_ptr<ZtTakenTables> removeObjects();
    std::unique_ptr<ZtTakenTables> takeObjects(const QVector<int> &types);
    void unregisterTypes(ZtTakenTables *taken);
    void useSource(std::unique_ptr<ZtFrameSource> source, const QString &imagePath,
                   const ZtCalibration &offered);
    void apply(ZtLoadedSession *loaded);
    void addSessionObjects(const ZtSession &session);
    void addSessionTables(ZtLoadedSession *loaded);
    ZtSessionTable toSessionTable(int importedType) const;

    std::shared_ptr<ZtCalibration> m_calibration;
    std::unique_ptr<ZtKernelImage> m_kernelImage;
    std::unique_ptr<ZtObjectsPainter> m_objectsPainter;
    std::unique_ptr<ZtFrameSource> m_source;
    QString m_imagePath;
    ZtCalibration m_offered;
    QVector<int> m_importedTypes;
    mutable QHash<int, ZtSessionTable> m_tables; ///< of imported types of which no objects came or went
};
