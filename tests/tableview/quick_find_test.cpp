#include "data/db_transaction.h"
#include "tableview/quick_find.h"

#include "tableview/people_fixture.h"

namespace mirel {
namespace {

using namespace Qt::StringLiterals;
using enum QuickFind::Direction;
using enum QuickFind::From;

constexpr int kAtOnce = 1000;
constexpr int kNoTime = 0;

class Find : public PeopleFixture {
protected:
    Find()
    {
        browser.SetRowsPerPage(10);
        EXPECT_TRUE(browser.Open(RecordBrowser::StatementOfTable(u"People")));
        Run(u"UPDATE People SET Name='Ärger' WHERE Name='P3'"_s);
        Run(u"UPDATE People SET Note='see P7, P8' WHERE Name='P20'"_s);
    }

    // "record/field", with "~" where it went around; how it ended when nothing was found.
    QString Search(const QString& text, QuickFind::Direction direction, QuickFind::From from,
                   int budgetMs = kAtOnce)
    {
        find.Begin(text, direction, from);
        int steps = 0;
        while (find.Step(budgetMs) == QuickFind::State::Searching && ++steps < 10'000)
            continue;
        if (find.Current() != QuickFind::State::Found)
            return find.Current() == QuickFind::State::NotFound ? u"nothing"_s : u"failed"_s;
        return u"%1/%2%3"_s.arg(QString::number(browser.SelectedRecord()),
                                browser.FieldName(browser.SelectedField()), find.HasWrapped() ? u"~"_s : u""_s);
    }

    RecordBrowser browser{connection, path, prompt, {}};
    QuickFind find{browser};
};

TEST_F(Find, WalksFromTheSelectedCellAndAroundTheEnd)
{
    const struct {
        const char* what;
        QString text;
        QuickFind::Direction direction;
        QuickFind::From from;
        QString found;
    } steps[] = {
        {"the selected cell", u"p1"_s, Forward, SelectedCell, u"0/Name"_s},
        {"behind it", u"p1"_s, Forward, BehindIt, u"9/Name"_s},
        {"case does not count", u"NOTE 12"_s, Forward, BehindIt, u"11/Note"_s},
        {"the same record, to the left, is last", u"p12"_s, Forward, BehindIt, u"11/Name~"_s},
        {"only itself", u"p12"_s, Forward, BehindIt, u"11/Name~"_s},
        {"inside a longer text", u", p8"_s, Forward, BehindIt, u"19/Note"_s},
        {"back", u"p8"_s, Backward, BehindIt, u"7/Name"_s},
        {"back around the beginning", u"p8"_s, Backward, BehindIt, u"19/Note~"_s},
        {"back in the same record", u"p20"_s, Backward, BehindIt, u"19/Name"_s},
        {"beyond ASCII", u"äRG"_s, Forward, BehindIt, u"2/Name~"_s},
        {"a number", u"44"_s, Forward, BehindIt, u"23/Age"_s},
        {"a date as the user reads it", u"7/4/2001"_s, Forward, BehindIt, u"23/Born"_s},
        {"not as the file has it", u"2001-07"_s, Forward, BehindIt, u"nothing"_s},
        {"a word of Yes/No", u"yes"_s, Forward, BehindIt, u"23/Member"_s},
        {"not there", u"P99"_s, Forward, BehindIt, u"nothing"_s},
        {"not there, back", u"P99"_s, Backward, BehindIt, u"nothing"_s},
        {"nothing to look for", u""_s, Forward, SelectedCell, u"nothing"_s},
    };
    for (const auto& step : steps)
        EXPECT_EQ(Search(step.text, step.direction, step.from), step.found) << step.what;
}

TEST_F(Find, FindsTheSameInSlices)
{
    constexpr int kMore = 1500;
    DbTransaction whole(connection, path);
    EXPECT_TRUE(whole.Begin());
    for (int i = 0; i < kMore; ++i)
        Run(u"INSERT INTO People (Name) VALUES ('M%1')"_s.arg(i));
    EXPECT_TRUE(whole.Commit());
    ASSERT_TRUE(browser.RunAgain());
    for (const int budgetMs : {kNoTime, kAtOnce}) {
        ASSERT_TRUE(browser.GoToCell(700, 0));
        EXPECT_EQ(Search(u"see"_s, Forward, BehindIt, budgetMs), u"19/Note~"_s);
        EXPECT_EQ(Search(u"M1400"_s, Forward, BehindIt, budgetMs), u"1425/Name"_s);
        EXPECT_EQ(Search(u"M140"_s, Backward, BehindIt, budgetMs), u"165/Name"_s) << "the nearest one before";
        EXPECT_EQ(Search(u"M1400"_s, Backward, BehindIt, budgetMs), u"1425/Name~"_s);
        for (const QuickFind::Direction direction : {Forward, Backward}) {
            EXPECT_EQ(Search(u"P99"_s, direction, BehindIt, budgetMs), u"nothing"_s);
            EXPECT_GE(find.Records(), kPeople + kMore);
        }
    }
}

TEST_F(Find, LooksAtWhatIsShown)
{
    ASSERT_TRUE(browser.GoToCell(0, 4));
    ASSERT_TRUE(browser.HideColumn());
    EXPECT_EQ(Search(u"note 5"_s, Forward, BehindIt), u"nothing"_s);
    ASSERT_TRUE(browser.TogglePresentation());
    EXPECT_EQ(Search(u"note 5"_s, Forward, BehindIt), u"4/Note"_s) << "a single record shows all of its fields";
    ASSERT_TRUE(browser.Open(u"SELECT * FROM People WHERE Age>40 ORDER BY Age DESC"_s));
    EXPECT_EQ(Search(u"P21"_s, Forward, BehindIt), u"3/Name"_s);
}

TEST_F(Find, StaysWhereAPendingEditIsRefused)
{
    browser.EditText(u"longer than ten"_s);
    EXPECT_EQ(Search(u"P5"_s, Forward, BehindIt), u"failed"_s);
    EXPECT_EQ(browser.SelectedRecord(), 0);
    EXPECT_TRUE(browser.HasPendingEdit());
}

} // namespace
} // namespace mirel
