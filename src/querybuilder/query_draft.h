#pragma once

#include "forms/form_store.h"
#include "platform/user_prompt.h"
#include "querybuilder/query_clauses.h"

#include <QString>

#include <optional>

namespace mirel {

// What the query dialog begins with, and what of it may be changed.
struct QueryRequest {
    enum class Name {
        Required, // a saved query is made or changed
        Offered,  // the statement is wanted; with a name it is saved as well
        None,     // only the statement is wanted
    };

    Name nameUse = Name::Required;
    QString name; // of the query that is edited; empty: a new one
    QString statement;
    QString table; // the current table: what the query is kept under, what the lists begin with
    QString
        selectClause; // "SELECT *": fixed, the dialog shows and changes what stands behind it. Empty: it does not
};

// A query while it is being written: one statement, seen as a whole or as clauses. One of the two is in front and
// is what is edited; going to the other converts.
//
// The prompt must outlive it.
class QueryDraft {
public:
    QueryDraft(QueryRequest request, UserPrompt& prompt);

    const QueryRequest& Request() const { return request_; }
    bool FixesSelect() const { return !request_.selectClause.isEmpty(); }

    const QString& Name() const { return name_; }
    void SetName(const QString& name) { name_ = name; }
    const QString& Table() const { return table_; }
    void SetTable(const QString& table) { table_ = table; }

    // The text as the "SQL" tab shows it: without the select clause where that is fixed.
    QString Text() const;
    void SetText(const QString& text); // the statement is in front from now on
    const QueryClauses& Clauses() const { return clauses_; }
    void SetClauses(const QueryClauses& clauses) { clauses_ = clauses; }

    // Brings the clauses to the front. With an obstacle the statement stays there, unchanged.
    std::optional<SplitObstacle> ShowClauses();
    // Brings the statement to the front: the clauses are joined.
    void ShowText();

    // The whole statement as it would run now, whatever is in front.
    QString Statement() const;
    // Since the draft was made or saved.
    bool IsChanged() const;

    enum class Saved {
        Yes,
        NameMissing, // and nobody was asked
        No,          // the user took it back, or it failed, which was told
    };
    // Keeps the statement under the name: asks about brackets that are not closed, and before another query is
    // replaced. The edited query, saved under a new name, stays as it is beside the new one.
    Saved Save(FormStore& store);

private:
    QueryRequest request_;
    UserPrompt& prompt_;
    QString name_;
    QString table_;
    QString text_; // the whole statement
    QueryClauses clauses_;
    bool clausesInFront_ = false;
    std::optional<QueryDef> edited_; // as it was stored when the draft was made or saved
    QString savedName_;
    QString savedStatement_;
};

} // namespace mirel
