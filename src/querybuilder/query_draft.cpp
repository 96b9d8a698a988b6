#include "querybuilder/query_draft.h"

#include "tableview/saved_queries.h"

namespace mirel {

QueryDraft::QueryDraft(QueryRequest request, UserPrompt& prompt)
    : request_(std::move(request))
    , prompt_(prompt)
    , name_(request_.name)
    , table_(request_.table)
    , savedName_(name_)
{
    SetText(FixesSelect() ? WithoutSelectClause(request_.statement, request_.selectClause) : request_.statement);
    savedStatement_ = Statement();
    if (!request_.name.isEmpty()) {
        edited_.emplace();
        edited_->SetName(request_.name);
        edited_->SetTableName(request_.table);
        edited_->SetText(request_.statement);
    }
}

QString QueryDraft::Text() const
{
    return FixesSelect() ? WithoutSelectClause(text_, request_.selectClause) : text_;
}

void QueryDraft::SetText(const QString& text)
{
    text_ = FixesSelect() ? WithSelectClause(request_.selectClause, text) : text;
    clausesInFront_ = false;
}

std::optional<SplitObstacle> QueryDraft::ShowClauses()
{
    if (clausesInFront_)
        return std::nullopt;
    if (std::optional<SplitObstacle> obstacle = ObstacleToSplitting(text_))
        return obstacle;
    clauses_ = SplitStatement(text_);
    if (FixesSelect())
        clauses_.select.clear();
    clausesInFront_ = true;
    return std::nullopt;
}

void QueryDraft::ShowText()
{
    if (!clausesInFront_)
        return;
    text_ = Statement();
    clausesInFront_ = false;
}

QString QueryDraft::Statement() const
{
    return clausesInFront_ ? JoinClauses(clauses_, request_.selectClause.trimmed()) : text_;
}

bool QueryDraft::IsChanged() const
{
    return name_ != savedName_ || !SayTheSame(Statement(), savedStatement_);
}

QueryDraft::Saved QueryDraft::Save(FormStore& store)
{
    QueryDef query;
    query.SetName(name_.trimmed());
    const QString kept = query.name.Text().trimmed();
    if (kept.isEmpty())
        return Saved::NameMissing;
    SavedQueries queries(store, prompt_);
    const QString statement = Statement();
    if (!queries.AskIfUnbalanced(statement) || !queries.Save(kept, table_, statement, edited_))
        return Saved::No;
    edited_ = *std::as_const(store).FindQuery(kept);
    name_ = savedName_ = kept;
    savedStatement_ = statement;
    return Saved::Yes;
}

} // namespace mirel
