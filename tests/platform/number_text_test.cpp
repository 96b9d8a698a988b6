// Numbers as text: what bulk work writes is what fifteen digits of printf would show.
#include "platform/number_text.h"
#include "support/printing.h"

#include <gtest/gtest.h>

#include <QRandomGenerator>

#include <cmath>
#include <cstring>

namespace mirel {
namespace {

std::string TextOf(double number)
{
    return std::string(NumberBuffer(number).Text());
}

std::string FifteenDigits(double number)
{
    std::array<char, 64> text;
    const int length = std::snprintf(text.data(), text.size(), "%.15G", number);
    return {text.data(), size_t(length)};
}

TEST(NumberBuffer, WritesDoublesShortly)
{
    const struct {
        double number;
        const char* text;
    } rows[] = {
        {0, "0"},
        {-0.0, "0"},
        {-12.5, "-12.5"},
        {0.1 + 0.2, "0.3"},
        {1.0 / 3, "0.333333333333333"},
        {0.0001, "0.0001"},
        {0.00012, "0.00012"},
        {0.000099, "9.9E-05"},
        {100, "100"},
        {1.1e14, "110000000000000"},
        {1e15, "1E+15"},
        {999999999999999, "999999999999999"},
        {9999999999999.994, "9999999999999.99"},
        {52.520008, "52.520008"},
        {1e300, "1E+300"},
        {std::nan(""), "nan"},
        {-HUGE_VAL, "-inf"},
    };
    for (const auto& row : rows)
        EXPECT_EQ(TextOf(row.number), row.text);
}

TEST(NumberBuffer, AgreesWithPrintfOnAnyNumber)
{
    QRandomGenerator random(20011024);
    for (int i = 0; i < 200'000; ++i) {
        const double whole = double(qint64(random.generate64()) >> random.bounded(64));
        quint64 bits = random.generate64();
        double any = 0;
        std::memcpy(&any, &bits, sizeof any);
        for (const double number :
             {whole / 100, whole / 1e6, whole / 1e7, whole * 0.01, std::isfinite(any) ? any : 0}) {
            const std::string expected = number == 0 ? "0" : FifteenDigits(number);
            ASSERT_EQ(TextOf(number), expected) << std::hexfloat << number;
        }
    }
}

} // namespace
} // namespace mirel
