#include "provider/sqlite/dialect_functions.h"

#include "platform/ole_date.h"
#include "platform/user_locale.h"
#include "platform/utf8_bytes.h"
#include "provider/conversion.h"
#include "provider/sqlite/plan.h"

#include <sqlite3.h>

#include <algorithm>
#include <array>
#include <charconv>
#include <cmath>
#include <cstdio>

namespace mirel::sqlite {
namespace {

constexpr std::string_view kRefusal = "mirel refuses ";

QString TextOf(sqlite3_value* value)
{
    const auto* const bytes = reinterpret_cast<const char*>(sqlite3_value_text(value));
    return QString::fromUtf8(bytes, sqlite3_value_bytes(value));
}

void ResultText(sqlite3_context* context, const QByteArray& utf8)
{
    sqlite3_result_text64(context, utf8.constData(), sqlite3_uint64(utf8.size()), SQLITE_TRANSIENT, SQLITE_UTF8);
}

enum class Case : quint8 { Upper, Lower };

// Letters of every language; SQLite's own functions know those of ASCII alone.
template <Case Wanted>
void ChangeCase(sqlite3_context* context, int, sqlite3_value** arguments)
{
    const auto* const bytes = reinterpret_cast<const char*>(sqlite3_value_text(arguments[0]));
    if (!bytes)
        return;
    QByteArray text(bytes, sqlite3_value_bytes(arguments[0]));
    constexpr bool upper = Wanted == Case::Upper;
    if (IsAscii({text.constData(), size_t(text.size())}))
        return ResultText(context, upper ? std::move(text).toUpper() : std::move(text).toLower());
    const QString unicode = QString::fromUtf8(text);
    ResultText(context, (upper ? unicode.toUpper() : unicode.toLower()).toUtf8());
}

Value ValueOf(sqlite3_value* value)
{
    switch (sqlite3_value_type(value)) {
    case SQLITE_INTEGER:
        return Value::Text(QString::number(sqlite3_value_int64(value))); // to the last digit
    case SQLITE_FLOAT:
        return Value::Double(sqlite3_value_double(value));
    case SQLITE_TEXT:
        return Value::Text(TextOf(value));
    case SQLITE_BLOB:
        return Value::Binary(
            QByteArray(static_cast<const char*>(sqlite3_value_blob(value)), sqlite3_value_bytes(value)));
    default:
        return Value::Null();
    }
}

void ResultValue(sqlite3_context* context, const Value& value)
{
    switch (value.Tag()) {
    case ValueTag::Bool:
        return sqlite3_result_int(context, value.ToBool() ? 1 : 0);
    case ValueTag::SmallInt:
    case ValueTag::Integer:
    case ValueTag::Double:
        if (const std::optional<qint64> whole = value.WholeNumber())
            return sqlite3_result_int64(context, *whole);
        return sqlite3_result_double(context, value.Number());
    case ValueTag::Date: {
        const std::optional<StoredDate> stored = StoredDateOf(value.Number());
        return ResultText(context, QByteArray(stored->characters.data(), stored->length));
    }
    case ValueTag::Text:
        return ResultText(context, value.ToText().toUtf8());
    case ValueTag::Binary: {
        const QByteArray bytes = value.ToBinary();
        return sqlite3_result_blob64(context, bytes.constData(), sqlite3_uint64(bytes.size()), SQLITE_TRANSIENT);
    }
    case ValueTag::Empty:
    case ValueTag::Null:
        return sqlite3_result_null(context);
    }
}

// What nearly every value is: one of its column's own kind that plainly fits.
bool FitsAsItIs(sqlite3_value* value, FieldType type, int size)
{
    switch (sqlite3_value_type(value)) {
    case SQLITE_NULL:
        return true;
    case SQLITE_INTEGER: {
        const qint64 number = sqlite3_value_int64(value);
        return (type == FieldType::Integer && (size == kWideIntegerSize || qint32(number) == number)) ||
               (type == FieldType::SmallInt && qint16(number) == number);
    }
    case SQLITE_FLOAT:
        return type == FieldType::Double && std::isfinite(sqlite3_value_double(value));
    case SQLITE_TEXT: // no text has more UTF-16 units than UTF-8 bytes
        return type == FieldType::Memo || (type == FieldType::Text && sqlite3_value_bytes(value) <= size);
    default:
        return false;
    }
}

// (value, type, size) -> the value as such a column stores it; what it does not take ends the statement.
void Store(sqlite3_context* context, int, sqlite3_value** arguments)
{
    const auto type = FieldType(sqlite3_value_int(arguments[1]));
    const int size = sqlite3_value_int(arguments[2]);
    if (FitsAsItIs(arguments[0], type, size))
        return sqlite3_result_value(context, arguments[0]);
    Value value = ValueOf(arguments[0]);
    // A whole number is a day number, too, where a date is wanted.
    if (type == FieldType::Date && sqlite3_value_type(arguments[0]) == SQLITE_INTEGER)
        value = Value::Double(double(sqlite3_value_int64(arguments[0])));
    Value converted;
    const Hr hr = ConvertForColumn(value, type, size, converted);
    if (!Failed(hr))
        return ResultValue(context, converted);
    std::array<char, 40> message{};
    const int length =
        std::snprintf(message.data(), message.size(), "%s%08X", kRefusal.data(), static_cast<unsigned>(hr));
    sqlite3_result_error(context, message.data(), length);
}

// (value, type) -> the text that stands for the value elsewhere: "100" and not "100.0", a date as the user
// writes it.
void AsText(sqlite3_context* context, int, sqlite3_value** arguments)
{
    Value value;
    const auto type = FieldType(sqlite3_value_int(arguments[1]));
    if (sqlite3_value_type(arguments[0]) == SQLITE_NULL)
        return;
    if (Failed(ConvertForColumn(ValueOf(arguments[0]), type, -1, value)))
        return sqlite3_result_value(context, arguments[0]);
    ResultText(context, VariantText(value).toUtf8());
}

} // namespace

int RegisterDialectFunctions(sqlite3* database)
{
    struct Row {
        const char* name;
        int arguments;
        void (*function)(sqlite3_context*, int, sqlite3_value**);
    };
    constexpr std::array kRows = {
        Row{kUpperFunction, 1, ChangeCase<Case::Upper>},
        Row{kLowerFunction, 1, ChangeCase<Case::Lower>},
        Row{kStoreFunction, 3, Store},
        Row{kTextFunction, 2, AsText},
    };
    constexpr int kFlags = SQLITE_UTF8 | SQLITE_DETERMINISTIC | SQLITE_DIRECTONLY;
    int result = SQLITE_OK;
    for (const Row& row : kRows) {
        if (result == SQLITE_OK) {
            result = sqlite3_create_function_v2(database, row.name, row.arguments, kFlags, nullptr, row.function,
                                                nullptr, nullptr, nullptr);
        }
    }
    return result;
}

std::optional<Hr> StoreFailure(std::string_view errorMessage)
{
    if (!errorMessage.starts_with(kRefusal))
        return {};
    errorMessage.remove_prefix(kRefusal.size());
    quint32 code = 0;
    const auto read = std::from_chars(errorMessage.data(), errorMessage.data() + errorMessage.size(), code, 16);
    return read.ec == std::errc() ? std::optional(Hr(code)) : std::nullopt;
}

} // namespace mirel::sqlite
