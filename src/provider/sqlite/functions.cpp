#include "provider/sqlite/functions.h"

#include "provider/sqlite/date_forms.h"
#include "provider/sqlite/dialect_functions.h"
#include "provider/sqlite/like_pattern.h"
#include "provider/sqlite/plan.h"
#include "provider/sqlite/sort_keys.h"

namespace mirel::sqlite {
namespace {

std::string_view TextOf(sqlite3_value* value)
{
    const auto* text = reinterpret_cast<const char*>(sqlite3_value_text(value));
    return {text ? text : "", size_t(sqlite3_value_bytes(value))};
}

void SortKeyOf(sqlite3_context* context, int, sqlite3_value** arguments)
{
    if (sqlite3_value_type(arguments[0]) == SQLITE_NULL)
        return;
    auto* keys = static_cast<SortKeys*>(sqlite3_user_data(context));
    const std::span<const uint8_t> key = keys->KeyOf(TextOf(arguments[0]));
    sqlite3_result_blob64(context, key.data(), key.size(), SQLITE_TRANSIENT);
}

void ReturnDate(sqlite3_context* context, const std::optional<StoredDate>& date)
{
    if (date)
        sqlite3_result_text(context, date->characters.data(), date->length, SQLITE_TRANSIENT);
}

void DateOf(sqlite3_context* context, int, sqlite3_value** arguments)
{
    sqlite3_value* value = arguments[0];
    switch (sqlite3_value_type(value)) {
    case SQLITE_INTEGER:
    case SQLITE_FLOAT:
        return ReturnDate(context, StoredDateOfNumber(sqlite3_value_double(value)));
    case SQLITE_TEXT:
        if (HasStoredDateForm(TextOf(value)))
            return sqlite3_result_value(context, value);
        return ReturnDate(context, StoredDateOfText(TextOf(value)));
    default:
        return;
    }
}

void Like(sqlite3_context* context, int, sqlite3_value** arguments)
{
    const auto isNull = [](sqlite3_value* value) { return sqlite3_value_type(value) == SQLITE_NULL; };
    if (isNull(arguments[0]) || isNull(arguments[1]))
        return;
    // While the pattern is a constant, the library keeps what was made of it from row to row.
    auto* pattern = static_cast<LikePattern*>(sqlite3_get_auxdata(context, 1));
    if (pattern)
        return sqlite3_result_int(context, pattern->Matches(TextOf(arguments[0])));
    pattern = new LikePattern(TextOf(arguments[1]));
    sqlite3_result_int(context, pattern->Matches(TextOf(arguments[0])));
    sqlite3_set_auxdata(context, 1, pattern, [](void* kept) { delete static_cast<LikePattern*>(kept); });
}

} // namespace

int RegisterFunctions(sqlite3* handle)
{
    constexpr int kFlags = SQLITE_UTF8 | SQLITE_DETERMINISTIC | SQLITE_DIRECTONLY;
    auto keys = std::make_unique<SortKeys>();
    int result =
        sqlite3_create_function_v2(handle, kSortKeyFunction, 1, kFlags, keys.release(), SortKeyOf, nullptr,
                                   nullptr, [](void* kept) { delete static_cast<SortKeys*>(kept); });
    if (result == SQLITE_OK) {
        result = sqlite3_create_function_v2(handle, kDateFunction, 1, kFlags, nullptr, DateOf, nullptr, nullptr,
                                            nullptr);
    }
    if (result == SQLITE_OK) {
        result =
            sqlite3_create_function_v2(handle, kLikeFunction, 2, kFlags, nullptr, Like, nullptr, nullptr, nullptr);
    }
    return result == SQLITE_OK ? RegisterDialectFunctions(handle) : result;
}

} // namespace mirel::sqlite
