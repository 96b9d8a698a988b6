#include "provider/sqlite/statement.h"

#include "platform/ole_date.h"

#include <algorithm>

namespace mirel::sqlite {
namespace {

constexpr size_t kMostIdle = 48;

} // namespace

Statement::Statement(std::weak_ptr<StatementCache> cache, QByteArray sql, StatementPtr statement)
    : cache_(std::move(cache))
    , sql_(std::move(sql))
    , statement_(std::move(statement))
{
}

Statement::~Statement()
{
    if (!statement_)
        return;
    sqlite3_reset(statement_.get());
    if (const std::shared_ptr<StatementCache> cache = cache_.lock()) {
        sqlite3_clear_bindings(statement_.get());
        cache->TakeBack(std::move(sql_), std::move(statement_));
    }
}

void Statement::Bind(int parameter, const Value& value)
{
    const auto copied = [this, parameter](const QByteArray& bytes, auto bind) {
        const char* data = bytes.isNull() ? "" : bytes.constData();
        Keep(bind(parameter, data, sqlite3_uint64(bytes.size())));
    };
    switch (value.Tag()) {
    case ValueTag::Empty:
    case ValueTag::Null:
        return BindNull(parameter);
    case ValueTag::Bool:
        return Bind(parameter, qint64(value.ToBool()));
    case ValueTag::SmallInt:
    case ValueTag::Integer:
    case ValueTag::Double:
        if (const std::optional<qint64> whole = value.WholeNumber())
            return Bind(parameter, *whole);
        return Bind(parameter, value.Number());
    case ValueTag::Date:
        if (const std::optional<StoredDate> date = StoredDateOf(value.Number())) {
            const std::string_view text = date->Text();
            return Keep(
                sqlite3_bind_text64(Get(), parameter, text.data(), text.size(), SQLITE_TRANSIENT, SQLITE_UTF8));
        }
        return Keep(SQLITE_MISMATCH);
    case ValueTag::Text:
        return copied(value.ToText().toUtf8(), [this](int at, const char* data, sqlite3_uint64 size) {
            return sqlite3_bind_text64(Get(), at, data, size, SQLITE_TRANSIENT, SQLITE_UTF8);
        });
    case ValueTag::Binary:
        return copied(value.ToBinary(), [this](int at, const char* data, sqlite3_uint64 size) {
            return sqlite3_bind_blob64(Get(), at, data, size, SQLITE_TRANSIENT);
        });
    }
}

QString Statement::Text(int column) const
{
    const auto* text = reinterpret_cast<const char*>(sqlite3_column_text(Get(), column));
    return QString::fromUtf8(text, sqlite3_column_bytes(Get(), column));
}

std::optional<std::string_view> Statement::TextView(int column) const
{
    const auto* text = reinterpret_cast<const char*>(sqlite3_column_text(Get(), column));
    if (!text)
        return {};
    return std::string_view(text, size_t(sqlite3_column_bytes(Get(), column)));
}

Statement StatementCache::Lend(sqlite3* handle, const QByteArray& sql)
{
    const auto found = std::ranges::find(idle_, sql, &Idle::sql);
    if (found != idle_.end()) {
        StatementPtr statement = std::move(found->statement);
        idle_.erase(found);
        return {weak_from_this(), sql, std::move(statement)};
    }
    sqlite3_stmt* raw = nullptr;
    sqlite3_prepare_v3(handle, sql.constData(), int(sql.size()), SQLITE_PREPARE_PERSISTENT, &raw, nullptr);
    return {weak_from_this(), sql, StatementPtr(raw)};
}

void StatementCache::TakeBack(QByteArray sql, StatementPtr statement)
{
    idle_.push_front({std::move(sql), std::move(statement)});
    if (idle_.size() > kMostIdle)
        idle_.pop_back();
}

} // namespace mirel::sqlite
