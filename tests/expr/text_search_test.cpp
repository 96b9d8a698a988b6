#include "expr/text_search.h"

#include "support/printing.h"

#include <gtest/gtest.h>

#include <QString>

#include <random>

namespace mirel {
namespace {

qint64 PlainPosition(const QString& text, const QString& wanted, qint64 start, qint64 occurrence)
{
    const bool forward = start > 0;
    for (qsizetype at = forward ? start - 1 : text.size() + start + 1 - wanted.size();;) {
        at = forward ? text.indexOf(wanted, at) : at < 0 ? -1 : text.lastIndexOf(wanted, at);
        if (at < 0 || --occurrence == 0)
            return at + 1;
        at += forward ? wanted.size() : -wanted.size();
    }
}

// A long text is searched for in its own way. Pieces of it that nearly match are where that could miss one.
TEST(TextSearch, FindsLongTextsWherePlainComparingDoes)
{
    std::mt19937 random(1);
    const auto below = [&random](int end) { return int(random() % unsigned(end)); };
    int found = 0;
    for (int round = 0; round < 3000; ++round) {
        QString wanted;
        while (wanted.size() < 65 + round % 8)
            wanted += QStringLiteral("aab").repeated(below(4)) + QStringLiteral("ab").repeated(below(20));
        QString text;
        for (int piece = below(8); piece >= 0; --piece)
            text += below(3) == 0 ? wanted : wanted.mid(below(6), below(int(wanted.size())));
        const qsizetype from = std::min<qsizetype>(below(3), text.size());
        ASSERT_EQ(FindText(text, wanted, from), text.indexOf(wanted, from)) << round;
        for (const qint64 start : {1, 3, -1, -3}) {
            for (const qint64 occurrence : {1, 2, 3}) {
                if (std::abs(start) > text.size())
                    continue;
                const qint64 expected = PlainPosition(text, wanted, start, occurrence);
                ASSERT_EQ(PositionOfMatch(text, wanted, start, occurrence), expected)
                    << round << ": " << start << ", " << occurrence;
                found += expected > 0 ? 1 : 0;
            }
        }
    }
    EXPECT_GT(found, 1000);
}

} // namespace
} // namespace mirel
