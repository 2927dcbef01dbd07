// SPDX-License-Identifier: MIT
#pragma once

#include "KvDeskObjectChanges.h"
#include "KvDeskObjectId.h"

#include <QAbstractTableModel>
#include <QCollator>
#include <QHash>
#include <QPair>
#include <QVector>

#include <memory>
#include <optional>
#include <vector>

/** One measured value of one object. */
struct KvDeskValueRow
{
    KvDeskObjectId object;
    int objectIndex = 0; ///< among the objects of the table
    int position = 0;    ///< among the names of the type's values
    int kind = 0;        ///< ZtGsManipulator::MeasureKind
    double value = 0.0;  ///< in base units

    bool isSameValue(const KvDeskValueRow &other) const
    {
        return object == other.object && position == other.position;
    }
};

/**
 * The measured values of all objects, one row each, in the order of types, objects and values; the rows are
 * those that reports show. Follows the kernel's objects; many changes at a time are one update.
 *
 * A change costs what it changes: only the objects that came, went or changed are read again, and texts are
 * made when they are asked for. When many objects come or go at once, the model is reset.
 */
class KvDeskValueTableModel : public QAbstractTableModel
{
    Q_OBJECT
public:
    enum Column { TypeColumn, ObjectColumn, NameColumn, ValueColumn, ColumnCount };

    /** Rows that lie next to each other. */
    struct Range
    {
        int first = 0;
        int count = 0;
    };

    /** With more objects than this coming or going at a time, the model is reset. */
    static constexpr int maximumMoves = 8;

    explicit KvDeskValueTableModel(QObject *parent = nullptr);

    int rowCount(const QModelIndex &parent = QModelIndex()) const override;
    int columnCount(const QModelIndex &parent = QModelIndex()) const override;
    QVariant data(const QModelIndex &index, int role = Qt::DisplayRole) const override;
    QVariant headerData(int section, Qt::Orientation orientation, int role = Qt::DisplayRole) const override;
    /** Names of objects can be edited. */
    Qt::ItemFlags flags(const QModelIndex &index) const override;
    /** Asks for another name of an object; an answer of true says only that it was asked for. */
    bool setData(const QModelIndex &index, const QVariant &value, int role = Qt::EditRole) override;

    KvDeskValueRow row(int row) const;
    QString text(int row, int column) const;
    /** The text of a row's value with all its digits, as reports show it. */
    QString fullText(int row) const;
    /** The rows of an object; none for an object without values. */
    Range rowsOf(const KvDeskObjectId &object) const;
    /** The row of one value, or -1. */
    int rowOf(const KvDeskObjectId &object, int position) const;
    /** Less than, equal to or greater than 0 as people sort the texts of two rows: "Circle 2" comes before
     * "Circle 10". */
    int compareTexts(int left, int right, int column) const;
    /** Of every row, the place of its text among all different texts of a column, in the order of
     * compareTexts(): quicker than comparing when all rows are sorted. Not for ValueColumn. */
    std::vector<int> ranks(int column) const;

    /** Number and unit of a value's text; a text that does not start with a number has no unit. */
    static QString numberOf(const QString &text);
    static QString unitOf(const QString &text);

    /** Shows pending changes at once. */
    void flush() { m_changes.flush(); }

signals:
    /** Rows changed, ascending; \a aNamesChanged: more than their values. Comes before dataChanged(). */
    void signalRowsChanged(const QVector<int> &aRows, bool aNamesChanged);
    /** The user gave an object another name. */
    void signalRenamed(int aType, int aId, const QString &aName);

private slots:
    void slotRefresh();

private:
    /** What an object was called when somebody asked first. */
    struct Name
    {
        QString text;
        std::optional<QCollatorSortKey> sortKey;
    };
    struct Object
    {
        KvDeskObjectId id;
        int firstRow = 0;
        mutable std::unique_ptr<Name> name; ///< null as long as nobody asked: most are never seen
    };
    struct Row
    {
        double value = 0.0;
        int objectIndex = 0;
        int position = 0;
        int kind = 0;
    };
    class Reader;
    using Rows = std::vector<Row>;
    using Objects = std::vector<Object>;

    /** What a batch means to the objects of the table. */
    struct Moves
    {
        QVector<KvDeskObjectId> came;
        QVector<KvDeskObjectId> went;
        QVector<KvDeskObjectId> changed;
    };

    void reset();
    void readAgain();
    static void readAll(Objects *objects, Rows *rows);
    static Rows readObject(std::size_t index, const KvDeskObjectId &id);
    const Object &objectOf(int row) const;
    Name *nameOf(const Object &object) const;
    bool sortOut(const KvDeskObjectChanges::Batch &batch, Moves *moves) const;
    bool isInStep(const Moves &moves) const;
    void addDependent(const QSet<KvDeskObjectId> &touched, Moves *moves) const;
    void apply(const Moves &moves);
    void insertObject(const KvDeskObjectId &id);
    void removeObject(const KvDeskObjectId &id);
    void changeObjects(const QVector<KvDeskObjectId> &ids);
    void reshapeObject(std::size_t index);
    bool rename(std::size_t index);
    bool hasRows(std::size_t index, const Rows &rows) const;
    void replaceRows(std::size_t index, const Rows &rows);
    void shiftRows(std::size_t fromObject, int count);
    void announceRows(const QVector<int> &rows, bool namesChanged);
    std::size_t lowerBound(const KvDeskObjectId &id) const;
    bool isKnown(const KvDeskObjectId &id) const;
    int knownCount(int type) const;
    Range rowsAt(std::size_t object) const;
    const QCollatorSortKey &sortKey(int row, int column) const;
    const QCollatorSortKey &sortKey(const Object &object) const;
    void group(int column, std::vector<int> *groups, std::vector<int> *firstRows) const;

    KvDeskObjectChanges m_changes;
    Objects m_objects; ///< ascending
    Rows m_rows;
    QCollator m_collator;
    mutable QHash<QPair<int, int>, QCollatorSortKey> m_nameKeys; ///< of values, by type and position
    mutable QHash<int, QCollatorSortKey> m_typeKeys;
};
