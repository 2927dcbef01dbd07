// SPDX-License-Identifier: MIT
#pragma once

#include "measuring/ZtFault.h"
#include "measuring/ZtSession.h"
#include "measuring/ZtUnit.h"

#include <QCoreApplication>

#include <string>
#include <string_view>

class ZtImportedTypeBuilder;
class ZtJsonMembers;
class ZtJsonReader;
class ZtProgress;

/** Makes a session of JSON; every part is checked before the caller gets any of it. */
class ZtSessionReader
{
    Q_DECLARE_TR_FUNCTIONS(ZtSession)
public:
    /**
     * \a json stands at the object of the file, and has to outlive this. \a path is the file that was read:
     * relative image paths start in its folder.
     */
    ZtSessionReader(ZtJsonReader *json, const QString &path, ZtProgress *progress = nullptr);

    bool read(ZtSession *session);
    /** Place and message of what made read() fail. */
    const ZtFault &fault() const { return m_fault; }

private:
    bool readVersion(const ZtJsonMembers &members);
    bool readImage(const ZtJsonMembers &members, ZtSession *session);
    bool readCalibration(const ZtJsonMembers &members, ZtSession *session);
    bool readPixelSize(const ZtJsonMembers &members, ZtSession *session);
    bool readObjects(const ZtJsonMembers &members, ZtSession *session);
    bool readObject(ZtSessionObject *object);
    bool readObjectType(const ZtJsonMembers &members, ZtSessionObject *object);
    bool readPoints(const ZtJsonMembers &members, ZtSessionObject *object);
    bool readPointItems(QPolygonF *points);
    bool readPoint(QPointF *point);
    bool readCoordinate(double *coordinate);
    bool readTables(const ZtJsonMembers &members, ZtSession *session);
    bool readTable(ZtSessionTable *table);
    bool readValues(const ZtJsonMembers &members, ZtImportedTypeBuilder *builder);
    bool readValue(QString *name, QString *unit);
    bool readRows(const ZtJsonMembers &members, ZtImportedTypeBuilder *builder, ZtSessionTable *table);
    bool readRow(ZtImportedTypeBuilder *builder, ZtSessionRow *row);
    bool readRowItems(ZtImportedTypeBuilder *builder, ZtSessionRow *row);
    bool readRowName(QString *name);
    bool readCells(ZtImportedTypeBuilder *builder, int row);
    bool readCellList(ZtImportedTypeBuilder *builder, int row);
    bool readRisingCells(ZtImportedTypeBuilder *builder, int row);
    bool readMixedCells(ZtImportedTypeBuilder *builder, int row);
    bool readCell(ZtImportedTypeBuilder *builder, int row, int valueIndex);
    bool readCellWithUnit(ZtImportedTypeBuilder *builder, int row, int valueIndex);
    bool addCell(ZtImportedTypeBuilder *builder, int row, int valueIndex, std::string_view number,
                 const ZtUnit &unit);
    bool readHidden(const QStringList &names, QVector<int> *positions);
    const ZtUnit &unit(std::string_view text);

    /** False, with a fault, when the file is not wanted any more. */
    bool goOn(int done);
    bool readId(int *id);
    /** Goes into a member's list; one that is missing \a isThere not. */
    bool enterList(const ZtJsonMembers &members, const QString &key, bool *isThere);
    bool readText(const ZtJsonMembers &members, const QString &key, QString *text);
    bool fail(const QString &place, const QString &message);
    /** Completes the place of a fault from the inside outwards; always false. */
    bool inside(const QString &place);
    bool inside(const QString &place, int index);

    ZtJsonReader *m_json;
    QString m_path;
    ZtProgress *m_progress;
    int m_version = 0;        ///< of the file
    QStringList m_valueNames; ///< of the table that is being read
    std::string m_buffer;     ///< for a number that is not written plainly
    std::string m_unitText;   ///< of m_unit
    ZtUnit m_unit;            ///< the last one that stands beside a number: mostly the next is the same
    ZtFault m_fault;
};
