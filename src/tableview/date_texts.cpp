#include "tableview/date_texts.h"

#include "platform/ole_date.h"

#include <algorithm>

namespace mirel {
namespace {

constexpr std::string_view kBaseDate = "1899-12-30"; // on which a time of day stands alone
constexpr size_t kTimeAt = 11;
constexpr size_t kWholeSeconds = 19; // "2001-07-04 09:05:00"
constexpr size_t kMostDays = 1 << 14;
constexpr size_t kMostTimes = 1 << 17; // a day has 86,400 seconds

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
    Remembered& slot = memory[std::hash<std::string_view>()(stored) % memory.size()];
    if (stored == std::string_view(slot.stored.data(), slot.size)) {
        text_.append(slot.text.data(), slot.textSize);
        return;
    }
    const bool isTime = &memory == &times_;
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
