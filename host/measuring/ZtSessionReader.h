// SPDX-License-Identifier: MIT
#pragma once

#include "measuring/ZtFault.h"
#include "measuring/ZtSession.h"

#include <QCoreApplication>
#include <QJsonObject>
#include <QSet>

class QJsonArray;
class ZtImportedTypeBuilder;
class ZtProgress;

/** Makes a session of JSON; every part is checked before the caller gets any of it. */
class ZtSessionReader
{
    Q_DECLARE_TR_FUNCTIONS(ZtSession)
public:
    /** \a path is the file that was read: relative image paths start in its folder. */
    explicit ZtSessionReader(const QString &path, ZtProgress *progress = nullptr);

    bool read(const QJsonObject &json, ZtSession *session);
    /** Place and message of what made read() fail. */
    const ZtFault &fault() const { return m_fault; }

private:
    bool readVersion(const QJsonObject &json);
    bool readImage(const QJsonObject &json, ZtSession *session);
    bool readCalibration(const QJsonObject &json, ZtSession *session);
    bool readPixelSize(const QJsonObject &json, ZtSession *session);
    bool readObjects(const QJsonObject &json, ZtSession *session);
    bool readObject(const QJsonValue &json, ZtSessionObject *object);
    bool readObjectType(const QJsonObject &json, ZtSessionObject *object);
    bool readPoints(const QJsonObject &json, ZtSessionObject *object);
    bool readTables(const QJsonObject &json, ZtSession *session);
    bool readTable(const QJsonValue &json, ZtSessionTable *table);
    bool readValues(const QJsonObject &json, ZtImportedTypeBuilder *builder, QStringList *names);
    bool readRows(const QJsonObject &json, ZtImportedTypeBuilder *builder, ZtSessionTable *table);
    bool readRow(const QJsonArray &json, ZtImportedTypeBuilder *builder, ZtSessionRow *row);
    bool readCells(const QJsonValue &json, ZtImportedTypeBuilder *builder, int row);
    bool readCell(const QJsonValue &json, ZtImportedTypeBuilder *builder, int row, int valueIndex);
    bool readHidden(const QJsonValue &json, const QStringList &names, QVector<int> *positions);

    /** False, with a fault, when the file is not wanted any more. */
    bool goOn(int done, int count);
    bool readId(const QJsonValue &json, int *id);
    bool readArray(const QJsonObject &json, const QString &key, QJsonArray *array);
    bool readText(const QJsonObject &json, const QString &key, QString *text);
    bool fail(const QString &place, const QString &message);
    /** Completes the place of a fault from the inside outwards; always false. */
    bool inside(const QString &place);
    bool inside(const QString &place, int index);

    QString m_path;
    ZtProgress *m_progress;
    int m_version = 0;        ///< of the file
    QStringList m_valueNames; ///< of the table that is being read
    ZtFault m_fault;
};
