#include "platform/ole_date.h"
#include "support/printing.h"

#include <gtest/gtest.h>

namespace mirel {
namespace {

// A text passes exactly when reading and writing it would change nothing.
TEST(StoredDate, IsKnownByItsLetters)
{
    for (const std::string_view text : {"2001-07-04",
                                        "2000-02-29",
                                        "0001-01-01",
                                        "9999-12-31 23:59:59.999",
                                        "2001-07-04 09:05:00",
                                        "2001-07-04 00:00:00.001",
                                        "2001-07-04 00:00:00",
                                        "2001-07-04 09:05:00.000",
                                        "2001-02-29",
                                        "2001-13-01",
                                        "0000-01-01",
                                        "2001-07-04 24:00:00",
                                        "2001-07-04 09:60:00",
                                        "2001-07-04T09:05:00",
                                        "2001-07-04 09:05",
                                        "2001-07-04 09:05:00.25",
                                        "2001/07/04",
                                        "2001-7-4",
                                        "2001-07-04Z",
                                        "2001-07-0x",
                                        ""}) {
        const std::optional<double> days = OleDateFromStored(text);
        const bool roundTrips = days && StoredDateOf(*days)->Text() == text;
        EXPECT_EQ(IsStoredDate(text), roundTrips) << text;
    }
}

} // namespace
} // namespace mirel
