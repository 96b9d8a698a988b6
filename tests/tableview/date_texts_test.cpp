#include "tableview/date_texts.h"

#include "platform/ole_date.h"
#include "support/printing.h"

#include <gtest/gtest.h>

#include <QRandomGenerator>

namespace mirel {
namespace {

// Twice each, so that the second text is the remembered one; more days and times than are remembered.
TEST(DateTexts, AreThoseOfTheFormat)
{
    std::vector<std::string> stored = {"1899-12-30",
                                       "1899-12-30 18:30:00",
                                       "2001-07-04 00:00:00",
                                       "2001-07-04 09:05:00",
                                       "2001-07-04T09:05",
                                       "2001-07-04 09:05:00.250",
                                       "0099-01-02",
                                       "9999-12-31 23:59:59",
                                       "no date",
                                       "2001-02-30",
                                       ""};
    QRandomGenerator random(3);
    for (int i = 0; i < 4000; ++i) {
        if (const std::optional<StoredDate> date =
                StoredDateOf(random.bounded(2'900'000) + random.generateDouble()))
            stored.push_back(std::string(date->Text().substr(0, i % 3 == 0 ? 10 : 19)));
    }
    for (const DateFormat& format :
         {DateFormat{DateOrder::Locale, 0, 0}, DateFormat{DateOrder::YearMonthDay, u'-', u':'},
          DateFormat{DateOrder::YearMonthDay, 0, u':'}, DateFormat{DateOrder::DayMonthYear, u'.', u'\u00B7'}}) {
        DateTexts texts(format);
        for (int round = 0; round < 2; ++round) {
            for (const std::string& each : stored) {
                const std::optional<double> date = OleDateFromStored(each);
                const std::string expected = date ? FormatDateText(format, *date).toStdString() : std::string();
                ASSERT_EQ(texts.Of(each), expected) << each << ", order " << int(format.order);
            }
        }
    }
}

} // namespace
} // namespace mirel
