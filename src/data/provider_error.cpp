#include "data/provider_error.h"

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

// The word JOIN outside quotes and brackets, whatever stands around it.
bool NamesAJoin(QStringView statement)
{
    constexpr QStringView kJoin = u"JOIN";
    QChar closing;
    for (qsizetype i = 0; i < statement.size(); ++i) {
        const QChar character = statement[i];
        if (!closing.isNull()) {
            if (character == closing)
                closing = QChar();
            continue;
        }
        if (character == u'\'' || character == u'"')
            closing = character;
        else if (character == u'[')
            closing = u']';
        if (!statement.sliced(i).startsWith(kJoin, Qt::CaseInsensitive))
            continue;
        const QChar before = i > 0 ? statement[i - 1] : QChar(u' ');
        const qsizetype end = i + kJoin.size();
        const QChar after = end < statement.size() ? statement[end] : QChar(u' ');
        const auto inName = [](QChar each) { return each.isLetterOrNumber() || each == u'_'; };
        if (!inName(before) && !inName(after))
            return true;
    }
    return false;
}

Str MessageOf(const DbRecordset* recordset, Hr hr)
{
    const auto row = std::ranges::find(kErrors, quint32(hr), &ErrorRow::code);
    if (row != kErrors.end())
        return row->message;
    const bool readOnlyJoin =
        recordset && recordset->Lock() == LockType::ReadOnly && NamesAJoin(recordset->Source());
    return readOnlyJoin ? Str::ErrorReadOnlyJoin : Str::ErrorInCommand;
}

// Which messages leave open what went wrong: those say it in their context.
bool ShowsContext(Str message)
{
    return message == Str::ErrorAccessDenied || message == Str::ErrorReadOnlyJoin ||
           message == Str::ErrorInCommand;
}

} // namespace

QString ProviderErrorText(const DbRecordset* recordset, Hr hr, const QString& context)
{
    const QString code = QString::number(quint32(hr), 16).toUpper();
    return StringText(Str::ErrorPrefix) + u'(' + code + u')' + context + u"\r\n"_s +
           StringText(MessageOf(recordset, hr));
}

void ReportProviderError(UserPrompt& prompt, const DbRecordset* recordset, Hr hr)
{
    if (!Failed(hr))
        return;
    const bool withContext = recordset && ShowsContext(MessageOf(recordset, hr));
    const QString context = withContext ? recordset->ErrorContext() : QString();
    prompt.ShowError(ProviderErrorText(recordset, hr, context.isEmpty() ? context : u' ' + context));
}

} // namespace mirel
