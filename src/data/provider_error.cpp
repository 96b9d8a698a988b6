#include "data/provider_error.h"

#include "data/statement_text.h"
#include "provider/stop_check.h"
#include "resources/string_table.h"

#include <algorithm>
#include <array>

namespace mirel {
namespace {

using namespace Qt::StringLiterals;

struct ErrorRow {
    quint32 code;
    Str message;
};

constexpr std::array kErrors = {
    ErrorRow{0x80040E07, Str::ErrorBadLiteral},     ErrorRow{0x80040E57, Str::ErrorOverflow},
    ErrorRow{0x8007000E, Str::ErrorOutOfMemory},    ErrorRow{0x80070005, Str::ErrorAccessDenied},
    ErrorRow{0x80040E37, Str::ErrorNoSuchTable},    ErrorRow{0x80040E11, Str::ErrorNoSuchColumn},
    ErrorRow{0x80040E3F, Str::ErrorTableExists},    ErrorRow{0x80040E34, Str::ErrorIndexExists},
    ErrorRow{0x800A0F08, Str::ErrorJoinNeedsIndex}, ErrorRow{0x80040E40, Str::ErrorJoinNeedsIndex},
    ErrorRow{0x80040E35, Str::ErrorNoSuchIndex},    ErrorRow{0x80040E3E, Str::ErrorDuplicateColumn},
    ErrorRow{0x80040E41, Str::ErrorBadComparison},  ErrorRow{0x800A0F09, Str::ErrorBadComparison},
    ErrorRow{0x80040E42, Str::ErrorTooManyColumns}, ErrorRow{0x800A0F0A, Str::ErrorTooManyColumns},
};

// A faulty statement opens nothing, so its lock says nothing about it.
bool IsReadOnlyJoin(const DbRecordset& recordset)
{
    return recordset.IsOpen() && recordset.Lock() == LockType::ReadOnly &&
           KeywordPosition(recordset.Source(), u"JOIN") >= 0;
}

Str MessageOf(const DbRecordset* recordset, Hr hr)
{
    const auto row = std::ranges::find(kErrors, quint32(hr), &ErrorRow::code);
    if (row != kErrors.end())
        return row->message;
    return recordset && IsReadOnlyJoin(*recordset) ? Str::ErrorReadOnlyJoin : Str::ErrorInCommand;
}

} // namespace

QString ProviderErrorText(const DbRecordset* recordset, Hr hr, const QString& context)
{
    const QString code = QString::number(quint32(hr), 16).toUpper();
    const QString place = context.isEmpty() ? QString() : u' ' + context;
    return StringText(Str::ErrorPrefix) + u'(' + code + u')' + place + u"\r\n"_s +
           StringText(MessageOf(recordset, hr));
}

void ReportProviderError(UserPrompt& prompt, const DbRecordset* recordset, Hr hr)
{
    if (!Failed(hr) || hr == kStopped)
        return;
    prompt.ShowError(ProviderErrorText(recordset, hr, recordset ? recordset->ErrorContext() : QString()));
}

} // namespace mirel
