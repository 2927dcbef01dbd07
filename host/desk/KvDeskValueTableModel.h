// SPDX-License-Identifier: MIT
#pragma once

#include "KvDeskObjectChanges.h"
#include "KvDeskObjectId.h"

#include <QAbstractTableModel>
#include <QStringList>
#include <QVector>

class ZtGsManipulator;
class ZtKernelObjectData;

/** One measured value of one object, as the table shows it. */
struct KvDeskValueRow
{
    KvDeskObjectId object;
    QString typeName;
    QString objectName;
    QString valueName;
    QString text;       ///< number, blank, unit
    double value = 0.0; ///< in base units
    int kind = 0;       ///< ZtGsManipulator::MeasureKind

    bool isSameValue(const KvDeskValueRow &other) const
    {
        return object == other.object && valueName == other.valueName;
    }
};

/**
 * The measured values of all objects, one row each, in the order of types, objects and values; the rows are
 * those that reports show. Follows the kernel's objects; many changes at a time are one update.
 */
class KvDeskValueTableModel : public QAbstractTableModel
{
    Q_OBJECT
public:
    enum Column { TypeColumn, ObjectColumn, NameColumn, ValueColumn, ColumnCount };

    explicit KvDeskValueTableModel(QObject *parent = nullptr);

    int rowCount(const QModelIndex &parent = QModelIndex()) const override;
    int columnCount(const QModelIndex &parent = QModelIndex()) const override;
    QVariant data(const QModelIndex &index, int role = Qt::DisplayRole) const override;
    QVariant headerData(int section, Qt::Orientation orientation, int role = Qt::DisplayRole) const override;

    const KvDeskValueRow &row(int row) const { return m_rows.at(row); }
    /** The rows of an object, ascending. */
    QVector<int> rowsOf(const KvDeskObjectId &object) const;
    /** All units that the values' texts end with, each once. */
    const QStringList &units() const { return m_units; }
    /** The number with the most characters. */
    QString longestNumber() const { return m_longestNumber; }

    /** Number and unit of a value's text; a text that does not start with a number has no unit. */
    static QString numberOf(const QString &text);
    static QString unitOf(const QString &text);

    /** Shows pending changes at once. */
    void flush() { m_changes.flush(); }

private slots:
    void slotRefresh();

private:
    static QVector<KvDeskValueRow> readRows();
    static void readObject(const ZtGsManipulator &manipulator, const KvDeskObjectId &object,
                           const ZtKernelObjectData *data, QVector<KvDeskValueRow> *rows);
    bool hasSameValues(const QVector<KvDeskValueRow> &rows) const;
    void setRows(QVector<KvDeskValueRow> rows);
    QString text(const KvDeskValueRow &row, int column) const;

    KvDeskObjectChanges m_changes;
    QVector<KvDeskValueRow> m_rows;
    QStringList m_units;
    QString m_longestNumber;
};
