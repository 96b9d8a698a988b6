#pragma once

#include "platform/field_type.h"

#include <QByteArray>
#include <QString>

#include <vector>

namespace mirel::dialect {

// What the dialect knows of a database: its tables, their columns, their indexes. Plain records, filled by the
// engine that holds the file; names keep the case in which they were declared and are looked up without regard
// to it.

struct Column {
    QString name;
    FieldType type = FieldType::None;
    int size = 0;              // characters of a Text, bytes of a VarBinary and of a wide Integer; -1: no limit
    int id = 0;                // FieldID: stable within a session
    bool foreignDates = false; // a date column whose values may be in forms other than ours: compared and
                               // sorted through a normalising function
    bool isRequired = false;   // takes no NULL, and a new record gets no default for it
};

struct Index {
    QString name;       // as people see it
    QString storedName; // as the engine knows it
    struct Part {
        int column; // position in the table
        bool descending;
    };
    std::vector<Part> parts;
    bool unique = false;
};

struct Table {
    QString name;
    QString storedName; // as the engine knows it: another name for the catalog's own tables
    int id = 0;         // TableID: stable within a session
    std::vector<Column> columns;
    std::vector<Index> indexes;
    QByteArray rowId;      // the alias under which rows are addressed (rowid, _rowid_, oid); empty: there is none
    bool writable = true;  // false for views, catalog and stamp tables, tables without an addressable row id
    bool isSystem = false; // the catalog's own tables
    bool isView = false;

    const Column* FindColumn(QStringView columnName) const; // null: none
    const Index* FindIndex(QStringView indexName) const;    // null: none
};

class Schema {
public:
    std::vector<Table> tables;

    const Table* FindTable(QStringView tableName) const; // null: none
};

// The digits behind "MirelSys" in the name of a stamp table, the one that gives a database its identity; empty
// for every other table, also for one that merely begins so.
QStringView StampOfTable(QStringView tableName);

// The one rule by which names are the same.
bool SameName(QStringView a, QStringView b);

} // namespace mirel::dialect
