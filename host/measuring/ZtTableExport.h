// SPDX-License-Identifier: MIT
#pragma once

#include "measuring/ZtMeasuringGlobal.h"

#include <QByteArray>
#include <QHash>
#include <QLocale>
#include <QPair>
#include <QVector>

#include <vector>

class QString;
class ZtGsManipulator;
class ZtImportedManipulator;
class ZtKernelObjectData;
class ZtUnit;
struct ZtFault;
struct ZtImportedCell;

/**
 * Writes measured values as a table in UTF-8: those values that reports show, in the order of types, objects
 * and values.
 *
 * Numbers have all their digits: the shortest ones that read back as the same number, or those that an
 * imported table had. Values are in the length and angle units that the user chose, else in micrometres,
 * square micrometres and degrees; imported values stay in the unit of their table. So a tidy table that is
 * imported again gives the same values; where the user chose a unit, up to the last bit of the conversion.
 *
 * Objects are written portion by portion, so that somebody can be told how far it is. GUI thread only.
 */
class ZT_MEASURING_EXPORT ZtTableExport
{
public:
    enum Layout {
        TidyCsv, ///< one row per value: object_type, object_index, object_name, value_name, unit, value
        WideCsv, ///< one row per object, one column per value with its unit in the heading
        Json     ///< a list of objects with their values
    };

    /** Type and id of an object. */
    using ObjectId = QPair<int, int>;

    struct Options
    {
        Layout layout = TidyCsv;
        /** Whose decimal mark the numbers of CSV have: a point or a comma. Fields are separated by commas, or
         * by semicolons where the comma is the decimal mark. */
        QLocale locale = QLocale::c();
        /** Starts CSV with a byte order mark, by which some spreadsheets recognise UTF-8. */
        bool hasByteOrderMark = false;
        /**
         * Writes an apostrophe before texts of CSV that begin with =, +, -, @, a tabulator or a line end,
         * which spreadsheets may run as formulas. Such names are then not the same when they are imported
         * again, so at first the texts stay as they are.
         */
        bool guardsFormulas = false;
        bool isSelectionOnly = false;
        QVector<ObjectId> selection; ///< in any order; those that are no measured objects are left out
    };

    explicit ZtTableExport(const Options &options);

    int objectCount() const { return m_objects.size(); }
    int doneCount() const { return m_done; }
    bool isFinished() const { return m_done == m_objects.size() && m_isClosed; }
    /** Writes the next objects. Those that are gone meanwhile are left out. */
    void advance(int objects);
    /** The table as far as it is written. */
    QByteArray bytes() const { return m_bytes; }

    /** The whole table. */
    static QByteArray toBytes(const Options &options);
    /** Writes the file as a whole or not at all. */
    static bool writeFile(const QString &path, const Options &options, ZtFault *fault);

private:
    /** One value of the type that is being written. */
    struct Value
    {
        QByteArray name; ///< as it stands in the file
        int column = -1; ///< among m_columns
    };
    struct Type
    {
        const ZtGsManipulator *manipulator = nullptr;
        const ZtImportedManipulator *imported = nullptr; ///< the same, if it is one
        QByteArray name;
        std::vector<Value> values;
    };
    struct Cell
    {
        int value = 0;
        QByteArray unit;
        QByteArray number;
    };

    void collectObjects();
    void collectColumns();
    const Type &type(int typeId);
    void writeHeader();
    void writeObject(const ObjectId &object);
    void writeTidyRows(const ObjectId &object, const Type &type);
    void writeWideRow(const ObjectId &object, const Type &type);
    void writeJsonObject(const ObjectId &object, const Type &type);
    void writeEnd();
    void readCells(const ObjectId &object, const Type &type);
    void readImportedCell(const Type &type, const ZtKernelObjectData *data, int value);
    void readCell(const Type &type, const ZtKernelObjectData *data, int value);
    ZtUnit columnUnit(const Type &type, const ObjectId &object, int value) const;
    QByteArray number(double value) const;
    QByteArray importedNumber(const ZtImportedManipulator &manipulator, const ZtImportedCell &cell,
                              const ZtUnit &unit) const;
    QByteArray field(const QString &text) const;
    QByteArray csvField(const QString &text) const;
    QByteArray unitField(const QString &unit);
    bool isJson() const { return m_options.layout == Json; }

    Options m_options;
    char m_separator = ',';
    bool m_hasDecimalComma = false;
    QVector<ObjectId> m_objects;
    QHash<int, Type> m_types;
    QHash<QString, QByteArray> m_unitFields;
    QVector<QPair<QString, QString>> m_columns; ///< of the wide table: value name and unit
    std::vector<Cell> m_cells;                  ///< of the object that is being written
    QByteArray m_bytes;
    int m_done = 0;
    bool m_isClosed = false;
};
