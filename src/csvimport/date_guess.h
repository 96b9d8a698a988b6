#pragma once

#include "expr/date_format.h"

#include <optional>
#include <string_view>

namespace mirel {

// Which of the orders 0 to 5 reads every date of a column: three numbers with one separator between them, the year
// of two or four digits, then perhaps a blank and a time of three parts; or such a time alone.
class DateGuess {
public:
    void Add(std::string_view text);

    // Whether that order, with the separators of the texts, reads them all. False for no text.
    bool MayBe(DateOrder order) const { return (orders_ & MaskOf(order)) != 0 && any_; }
    bool MayBeAny() const { return orders_ != 0 && any_; }
    bool IsUnambiguous() const { return MayBeAny() && hasDates_ && (orders_ & (orders_ - 1)) == 0; }
    bool HasDates() const { return hasDates_; } // and not only times
    // That order with the separators of the texts.
    DateFormat Format(DateOrder order) const;
    // `wanted` where it reads all texts, otherwise the first order that does.
    DateFormat Best(DateOrder wanted) const;

private:
    static constexpr unsigned MaskOf(DateOrder order) { return 1U << unsigned(order); }
    static constexpr unsigned kAllOrders = (1U << unsigned(DateOrder::Locale)) - 1;

    bool TakeDate(std::string_view& text);
    bool TakeTime(std::string_view text);

    unsigned orders_ = kAllOrders;
    bool any_ = false;
    bool hasDates_ = false;
    char dateSeparator_ = 0; // 0: none yet
    char timeSeparator_ = 0;
};

// The order in which this user writes day, month and year.
DateOrder DateOrderOfLocale();

} // namespace mirel
