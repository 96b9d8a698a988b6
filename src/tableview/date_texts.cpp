#include "tableview/date_texts.h"

#include "platform/ole_date.h"

#include <algorithm>

namespace mirel {
namespace {

constexpr std::string_view kBaseDate = "1899-12-30"; // on which a time of day stands alone
constexpr size_t kTimeAt = 11;
constexpr size_t kWholeSeconds = 19; // "2001-07-04 09:05:00"
// Each has its own place, so that none takes another's: a hash let the times of a day push one another out.
constexpr size_t kDaysOfMonth = 32;
constexpr size_t kDaysOfYear = 13 * kDaysOfMonth;
constexpr size_t kMostDays = 40 * kDaysOfYear; // days of more years share their places
constexpr size_t kMostTimes = size_t(24) * 60 * 60;

size_t Number(std::string_view digits)
{
    size_t number = 0;
    for (const char digit : digits)
        number = number * 10 + size_t(digit - '0');
    return number;
}

size_t PlaceOfDay(std::string_view stored) // "2001-07-04"
{
    return (Number(stored.substr(0, 4)) * kDaysOfYear + Number(stored.substr(5, 2)) * kDaysOfMonth +
            Number(stored.substr(8, 2))) %
           kMostDays;
}

size_t PlaceOfTime(std::string_view stored) // "09:05:00"
{
    return (Number(stored.substr(0, 2)) * 60 + Number(stored.substr(3, 2))) * 60 + Number(stored.substr(6, 2));
}

} // namespace

DateTexts::DateTexts(const DateFormat& format)
    : format_(format)
    , isStoredForm_(format == DateFormat{DateOrder::YearMonthDay, u'-', u':'})
{
}

std::string_view DateTexts::Of(std::string_view stored)
{
    if (!IsStoredDate(stored) || stored.size() > kWholeSeconds || stored.starts_with(kBaseDate)) {
        text_ = Format(std::string(stored));
        return text_;
    }
    if (isStoredForm_)
        return stored;
    if (days_.empty()) {
        days_.resize(kMostDays);
        times_.resize(kMostTimes);
    }
    text_.clear();
    Append(stored.substr(0, kBaseDate.size()), days_);
    if (stored.size() > kTimeAt) {
        text_ += ' ';
        Append(stored.substr(kTimeAt), times_);
    }
    return text_;
}

void DateTexts::Append(std::string_view stored, Memory& memory)
{
    const bool isTime = &memory == &times_;
    Remembered& slot = memory[isTime ? PlaceOfTime(stored) : PlaceOfDay(stored)];
    if (stored == std::string_view(slot.stored.data(), slot.size)) {
        text_.append(slot.text.data(), slot.textSize);
        return;
    }
    const std::string text =
        Format(isTime ? std::string(kBaseDate) + ' ' + std::string(stored) : std::string(stored));
    text_ += text;
    if (text.size() > slot.text.size())
        return;
    std::ranges::copy(stored, slot.stored.begin());
    std::ranges::copy(text, slot.text.begin());
    slot.size = quint8(stored.size());
    slot.textSize = quint8(text.size());
}

std::string DateTexts::Format(const std::string& stored) const
{
    const std::optional<double> date = OleDateFromStored(stored);
    return date ? FormatDateText(format_, *date).toStdString() : std::string();
}

} // namespace mirel
