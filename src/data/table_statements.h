#pragma once

#include "platform/field_type.h"

#include <QString>

#include <span>
#include <vector>

namespace mirel {

// The statements that make and change tables: the one place in the program that writes them. Names stand in
// brackets, whatever they hold; they are given without.

// Whether a field has an index of its own, and how that sorts.
enum class IndexOrder { None, Ascending, Descending };

// "NO", "ASC", "DESC". What begins with "N" is no index; "YES" means "ASC", and so does any other word.
IndexOrder IndexOrderOfWord(QStringView word);
QString WordOfIndexOrder(IndexOrder order);

struct FieldDefinition {
    QString name;
    FieldType type = FieldType::Text;
    int size = kMaxTextSize; // of a Text

    friend bool operator==(const FieldDefinition&, const FieldDefinition&) = default;
};

struct IndexDefinition {
    struct Part {
        QString field;
        bool descending = false;

        friend bool operator==(const Part&, const Part&) = default;
    };
    QString name;
    std::vector<Part> parts;
    bool unique = false;

    friend bool operator==(const IndexDefinition&, const IndexDefinition&) = default;
};

QString NameInBrackets(QStringView name);

QString CreateTableStatement(const QString& table, std::span<const FieldDefinition> fields);
QString CreateStampTableStatement(const QString& stamp);
QString DropTableStatement(const QString& table);
QString RenameTableStatement(const QString& table, const QString& newName);

QString AddFieldStatement(const QString& table, const FieldDefinition& field);
QString DropFieldStatement(const QString& table, const QString& field);
QString RenameFieldStatement(const QString& table, const QString& field, const QString& newName);
// Puts `field` in front of `before`.
QString MoveFieldStatement(const QString& table, const QString& field, const QString& before);
// Sets `field` of every record to what `source` holds there, converted to the field's type.
QString CopyFieldStatement(const QString& table, const QString& field, const QString& source);

// The name that the index on a new table's field gets.
QString IndexNameOfField(const QString& table, const QString& field);
QString CreateIndexStatement(const QString& table, const IndexDefinition& index);
QString DropIndexStatement(const QString& table, const QString& index);

} // namespace mirel
