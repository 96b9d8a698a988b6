#pragma once

#include <QHash>
#include <QString>

namespace mirel::sqlite {

// Gives tables and fields numbers that stay the same while the file is open, through reloads of the schema and
// through renaming by this process. Names are taken as the file spells them: the engine tells names apart by
// letters beyond A to Z whose case alone differs, and two fields must not share a number.
class SchemaIds {
public:
    int OfTable(const QString& table) { return IdOf(table); }
    int OfField(const QString& table, const QString& field) { return IdOf(KeyOf(table, field)); }

    void RenameTable(const QString& table, const QString& newName);
    void RenameField(const QString& table, const QString& field, const QString& newName)
    {
        Move(KeyOf(table, field), KeyOf(table, newName));
    }

private:
    // No name holds a NUL.
    static QString KeyOf(const QString& table, const QString& field) { return table + QChar(u'\0') + field; }
    int IdOf(const QString& key);
    void Move(const QString& key, const QString& newKey);

    QHash<QString, int> ids_;
    int last_ = 0;
};

} // namespace mirel::sqlite
