// SPDX-License-Identifier: MIT
#pragma once

#include "measuring/ZtCalibration.h"
#include "measuring/ZtImportedType.h"
#include "measuring/ZtMeasuringGlobal.h"

#include <QPolygonF>

#include <memory>

class ZtProgress;
struct ZtDrawnType;
struct ZtFault;

/** An object of a session that was drawn on the image. */
struct ZtSessionObject
{
    const ZtDrawnType *type = nullptr;
    int id = 0;
    QString name; ///< given by the user, else empty
    QString text;
    QPolygonF points;
    QVector<int> hiddenValues; ///< positions in the type's values
};

/** An object of a session that came from a table. */
struct ZtSessionRow
{
    int id = 0;
    int row = 0; ///< in the table's type
    QString name;
    QVector<int> hiddenValues;
};

Q_DECLARE_TYPEINFO(ZtSessionRow, Q_MOVABLE_TYPE);

/** The objects of one imported type. */
struct ZT_MEASURING_EXPORT ZtSessionTable
{
    std::shared_ptr<const ZtImportedType> type;
    QVector<ZtSessionRow> rows; ///< in the order of their ids

    /** All rows of a type, which count from 1. */
    static ZtSessionTable ofType(const std::shared_ptr<const ZtImportedType> &type);
};

/**
 * What a session file holds: image, calibration, drawn objects and imported tables.
 *
 * Copies share their contents, so that a snapshot costs little and can be written by another thread. What
 * takes long ends with a fault when its progress is cancelled.
 */
struct ZT_MEASURING_EXPORT ZtSession
{
    QString imagePath; ///< absolute; empty for a session without an image
    ZtCalibration calibration;
    QVector<ZtSessionObject> objects;
    QVector<ZtSessionTable> tables;

    /** Reads and checks a whole file; false with the first fault found, then \a session is untouched. */
    static bool load(const QString &path, ZtSession *session, ZtFault *fault, ZtProgress *progress = nullptr);
    /** As load(), from the bytes of a file \a path. */
    static bool parse(const QByteArray &bytes, const QString &path, ZtSession *session, ZtFault *fault,
                      ZtProgress *progress = nullptr);

    /** Writes the file as a whole or not at all. */
    bool save(const QString &path, ZtFault *fault, ZtProgress *progress = nullptr) const;
    /** The bytes of a file \a path: the image's path is stored relative to its folder. */
    QByteArray toJson(const QString &path) const;

    /** Larger files are refused. */
    static constexpr qint64 maximumBytes = 512LL * 1024 * 1024;
};
