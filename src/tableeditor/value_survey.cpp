#include "tableeditor/value_survey.h"

#include "data/db_recordset.h"
#include "data/provider_error.h"
#include "data/table_statements.h"
#include "platform/cell.h"
#include "platform/ole_date.h"
#include "platform/user_locale.h"
#include "provider/conversion.h"

#include <limits>

namespace mirel {
namespace {

using namespace Qt::StringLiterals;

constexpr qint64 kRecordsPerProgress = 1024;

Value ValueOf(const Cell& cell)
{
    switch (cell.kind) {
    case Cell::Kind::Integer:
        if (cell.integer >= std::numeric_limits<qint32>::min() &&
            cell.integer <= std::numeric_limits<qint32>::max())
            return Value::Integer(qint32(cell.integer));
        return Value::Double(double(cell.integer));
    case Cell::Kind::Real:
        return Value::Double(cell.real);
    case Cell::Kind::Text:
        return Value::Text(QString::fromUtf8(cell.bytes.data(), qsizetype(cell.bytes.size())));
    case Cell::Kind::Binary:
        return Value::Binary(QByteArray(cell.bytes.data(), qsizetype(cell.bytes.size())));
    case Cell::Kind::Null:
        break;
    }
    return Value::Null();
}

// The value as its column stores it, for the way back: a date is its stored text.
Value StoredForm(const Value& value)
{
    if (value.Tag() != ValueTag::Date)
        return value;
    const std::optional<StoredDate> stored = StoredDateOf(value.Number());
    return stored ? Value::Text(QString::fromLatin1(stored->characters.data(), stored->length)) : Value::Null();
}

qint64 Count(DbConnection& connection, const DatabaseLocation& database, const QString& statement,
             UserPrompt& prompt)
{
    DbRecordset rows(connection);
    if (rows.Open(statement, database, CursorType::ForwardOnly, LockType::ReadOnly) && !rows.IsEof())
        return qint64(rows.FieldValue(0).Number());
    ReportProviderError(prompt, &rows, rows.LastResult());
    return -1;
}

} // namespace

ValueFate FateOfValue(const Value& stored, FieldType from, FieldType to, int size, Hr& fault)
{
    // As a statement reads it: a number is a day number, too, where a date is wanted.
    const bool isDay = to == FieldType::Date && stored.Tag() == ValueTag::Integer;
    const Value given = isDay ? Value::Double(stored.Number()) : stored;
    Value converted;
    Value back;
    fault = ConvertForColumn(given, to, size, converted);
    if (Failed(fault) || IsBinary(to) != IsBinary(from)) {
        fault = Failed(fault) ? fault : Hr::BadLiteral;
        return ValueFate::Unfit;
    }
    const bool returns = !Failed(ConvertForColumn(StoredForm(converted), from, -1, back));
    if (!returns)
        return ValueFate::Altered;
    Value before;
    const bool readsNow = !Failed(ConvertForColumn(given, from, -1, before));
    return readsNow && before == back ? ValueFate::Same : ValueFate::Altered;
}

std::optional<ValuesAtStake> SurveyConversion(DbConnection& connection, const DatabaseLocation& database,
                                              const QString& table, const QString& field, FieldType to, int size,
                                              UserPrompt& prompt, Progress& progress)
{
    DbRecordset rows(connection);
    const QString statement = u"SELECT %1 FROM %2"_s.arg(NameInBrackets(field), NameInBrackets(table));
    if (!rows.Open(statement, database, CursorType::ForwardOnly, LockType::ReadOnly)) {
        ReportProviderError(prompt, &rows, rows.LastResult());
        return {};
    }
    const FieldType from = rows.TypeOfField(0);
    ValuesAtStake stake;
    qint64 records = 0;
    bool stopped = false;
    const bool read = rows.Read({}, [&](std::span<const Cell> cells) {
        if (++records % kRecordsPerProgress == 0 && !progress.Advance(records)) {
            stopped = true;
            return false;
        }
        if (cells[0].kind == Cell::Kind::Null)
            return true;
        const Value value = ValueOf(cells[0]);
        Hr fault = Hr::Ok;
        const ValueFate fate = FateOfValue(value, from, to, size, fault);
        ++stake.values;
        stake.altered += fate == ValueFate::Altered ? 1 : 0;
        stake.unfit += fate == ValueFate::Unfit ? 1 : 0;
        if (fate == ValueFate::Unfit && stake.unfit == 1) {
            stake.fault = fault;
            stake.firstUnfit = VariantText(value);
        }
        return true;
    });
    if (read)
        return stopped ? std::nullopt : std::optional(stake);
    ReportProviderError(prompt, &rows, rows.LastResult());
    return {};
}

qint64 CountValues(DbConnection& connection, const DatabaseLocation& database, const QString& table,
                   const QString& field, UserPrompt& prompt)
{
    return Count(connection, database,
                 u"SELECT COUNT(%1) FROM %2"_s.arg(NameInBrackets(field), NameInBrackets(table)), prompt);
}

qint64 CountRecords(DbConnection& connection, const DatabaseLocation& database, const QString& table,
                    UserPrompt& prompt)
{
    return Count(connection, database, u"SELECT COUNT(*) FROM "_s + NameInBrackets(table), prompt);
}

} // namespace mirel
