// Date texts and patterns of any kind; what is read as a date and written in the same order reads the same again.
#include "expr/date_format.h"

#include <cmath>
#include <cstdint>
#include <cstring>

namespace {

void Check(const mirel::DateFormat& format, std::string_view text)
{
    const std::optional<double> date = mirel::ParseDateFields(format, text);
    if (!date)
        return;
    const mirel::DateFieldsText written = mirel::FormatDateFields(format, *date);
    if (mirel::ParseDateFields(format, written.Text()) == date)
        return;
    // A time on the base date is written alone. Separators that digits or blanks could be part of do not read
    // back.
    const auto separates = [](char16_t unit) {
        return unit > u' ' && !(unit >= u'0' && unit <= u'9') && unit != u'-' && unit != u'+';
    };
    if (std::abs(*date) >= 1 && separates(format.dateSeparator) && separates(format.timeSeparator) &&
        format.dateSeparator != format.timeSeparator)
        __builtin_trap();
}

} // namespace

extern "C" int LLVMFuzzerTestOneInput(const uint8_t* data, size_t size)
{
    using namespace mirel;
    if (size < 13)
        return 0;
    const auto order = DateOrder(data[0] % 7);
    const DateFormat format{order, char16_t(data[1] | (data[2] << 8)), char16_t(data[3] | (data[4] << 8))};
    double day = 0;
    std::memcpy(&day, data + 5, sizeof day);
    const std::string_view text(reinterpret_cast<const char*>(data) + 13, size - 13);
    const QString wide = QString::fromUtf8(text.data(), qsizetype(text.size()));

    if (order != DateOrder::Locale)
        Check(format, text);
    QString out;
    (void)ParseDateText(order, format.dateSeparator, format.timeSeparator, wide, out);
    FormatDateText(format, day);
    FormatDatePattern(day, wide);
    DateText(day);
    CompactDateText(wide);
    return 0;
}
