// SPDX-License-Identifier: MIT
#pragma once

#include <QMetaType>
#include <QString>
#include <QVariant>
#include <QVector>

/** One measured value of one object of the host. */
struct KvMeasuredValue
{
    qint32 objectType = 0; ///< object type id of the host
    qint32 valueClass =
        0; ///< class of the value inside its type, see KvReportKernelData::valueClass(); 0 = none
    qint32 objectId = 0;    ///< id of the object within its type
    QString objectTypeName; ///< display name of the object type
    QString objectName;     ///< display name of the object
    QString valueName;      ///< name of the value
    QVariant value;         ///< in base units: length in micrometres, area in square micrometres
    qint32 measureKind = 0; ///< 1 length, 2 area, 3 angle, 4 count, 5 percentage; others have no unit
    QString valueText;      ///< the host's text of the value, unit included; never empty in a recorded value
};

// All members can be moved in memory, so growing an array of records needs no copies of them.
Q_DECLARE_TYPEINFO(KvMeasuredValue, Q_MOVABLE_TYPE);
Q_DECLARE_METATYPE(QVector<KvMeasuredValue>)
