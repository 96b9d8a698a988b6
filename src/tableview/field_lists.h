#pragma once

#include "data/db_connection.h"
#include "platform/user_prompt.h"

#include <QHash>
#include <QStringList>

#include <vector>

namespace mirel {

// The tables of a database and their fields with their types, as dialogs offer them for choice. Read once each;
// failures are reported through the prompt and give an empty list. Connection and prompt must outlive this.
class FieldLists {
public:
    struct Field {
        QString name;
        FieldType type = FieldType::None;
    };

    FieldLists(DbConnection& connection, DatabaseLocation database, UserPrompt& prompt);

    const QStringList& Tables();
    const std::vector<Field>& FieldsOf(const QString& table);
    FieldType TypeOf(const QString& table, const QString& field); // None: there is no such field

private:
    DbConnection& connection_;
    DatabaseLocation database_;
    UserPrompt& prompt_;
    QStringList tables_;
    bool tablesRead_ = false;
    QHash<QString, std::vector<Field>> fields_;
};

} // namespace mirel
