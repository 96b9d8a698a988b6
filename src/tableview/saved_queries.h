#pragma once

#include "forms/form_store.h"
#include "platform/user_prompt.h"

#include <QString>
#include <QStringList>

#include <functional>
#include <optional>

namespace mirel {

class RecordBrowser;

// The saved queries of a database: statements under a name. Each change is written at once; what fails is told
// through the prompt, and nothing has changed then. Store and prompt must outlive this.
class SavedQueries {
public:
    enum class OnExisting { Ask, Replace };

    SavedQueries(FormStore& store, UserPrompt& prompt)
        : store_(store)
        , prompt_(prompt)
    {
    }

    // A database that cannot be written has no place for queries.
    bool CanSave() const { return !store_.Path().isEmpty(); }
    QStringList Names() const;
    std::optional<QString> StatementOf(QStringView name) const;
    bool Knows(QStringView name) const; // by the name as it would be kept

    // Asks before a statement is taken whose brackets or quotes are not closed; false: the user takes it back.
    bool AskIfUnbalanced(const QString& statement);
    // Asks before a query is opened that does more than show records, and shows its statement; false: it is not
    // run.
    bool AskIfItChanges(const QString& name, const QString& statement);
    // Names have up to 40 characters, those of tables up to 31; what is longer is cut. An empty name is none.
    bool Save(const QString& name, const QString& table, const QString& statement,
              OnExisting existing = OnExisting::Ask);
    // The same by somebody who edits the query `edited`: under its name nothing is asked while it is stored as it
    // was when the edit began.
    bool Save(const QString& name, const QString& table, const QString& statement,
              const std::optional<QueryDef>& edited);
    bool Remove(const QString& name);

private:
    bool Save(const QueryDef& query, const std::function<bool(const QueryDef& stored)>& mayReplace);
    void ReportFailure();

    FormStore& store_;
    UserPrompt& prompt_;
};

// What the browser shows, as a statement: the current one, with the visible columns alone where some are hidden.
QString ShownStatement(const RecordBrowser& browser);

} // namespace mirel
