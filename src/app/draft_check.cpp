#include "app/draft_check.h"

#include "data/db_recordset.h"
#include "platform/user_locale.h"
#include "result/cell_text.h"

#include <algorithm>

namespace mirel {
namespace {

std::vector<Value> ValuesOf(const DbRecordset& records)
{
    std::vector<Value> values;
    for (int field = 0; field < records.FieldCount(); ++field)
        values.push_back(records.FieldValue(field));
    return values;
}

bool HoldsAlready(const DbRecordset& records, const TypedText& typed)
{
    if (records.FieldName(typed.place) != typed.name)
        return false;
    const Value value = records.FieldValue(typed.place);
    return typed.isTick ? value.ToBool() == (typed.text == u"1") : VariantText(value) == typed.text;
}

DraftState StateOfRecord(const Draft& draft, DbRecordset& records)
{
    if (!records.MoveToRecord(draft.typed.record))
        return DraftState::Gone;
    if (FingerprintOf(records.Fields(), ValuesOf(records)) == draft.typed.fingerprint)
        return DraftState::Fits;
    // Of a form only its controls are known, which need not show a field as it is.
    const bool isCell = draft.view.kind != EntryKind::Form;
    const auto holds = [&](const TypedText& typed) { return HoldsAlready(records, typed); };
    return isCell && std::ranges::all_of(draft.typed.texts, holds) ? DraftState::Saved : DraftState::Changed;
}

} // namespace

DraftState StateOf(const Draft& draft, DatabaseSession& session)
{
    if (draft.stamp != session.Stamp())
        return DraftState::OtherDatabase;
    const bool isForm = draft.view.kind == EntryKind::Form;
    if (isForm && !session.Store().FindForm(draft.view.name))
        return DraftState::NoView;
    const QString& statement = draft.typed.statement;
    if (statement.isEmpty())
        return isForm && draft.typed.record.IsNull() ? DraftState::Fits : DraftState::NoView;
    DbRecordset records(session.Connection());
    if (!OnlyReads(statement) ||
        !records.OpenSource(statement, session.Location(), CursorType::Static, LockType::Optimistic))
        return DraftState::NoView;
    if (!draft.typed.record.IsNull())
        return StateOfRecord(draft, records);
    return isForm && records.IsEof() ? DraftState::Fits : DraftState::Gone;
}

} // namespace mirel
