#include "form_fixture.h"

namespace mirel {
namespace {

using namespace Qt::StringLiterals;

class RunningFormTest : public FormFixture {
protected:
    static FormBuilder BirdForm()
    {
        FormBuilder form(u"Birds");
        form.Edit(u"counter", u"RECNO()+'/'+RECCOUNT()")
            .Edit(u"Name", u"Birds.Name")
            .Edit(u"Price", u"Birds.Price");
        form.Edit(u"Seen", u"Birds.Seen").Check(u"Wild", u"WHERE Birds.Wild=1");
        form.Button(u"SAVE", ButtonFunction::Update,
                    {{u"Birds.Name"_s, u"&Name"_s},
                     {u"Birds.Price"_s, u"&Price"_s},
                     {u"Birds.Seen"_s, u"&Seen"_s},
                     {u"Birds.Wild"_s, u"&Wild"_s}});
        return form;
    }
};

TEST_F(RunningFormTest, ShowsEachRecordInItsControls)
{
    Start(BirdForm());
    EXPECT_TRUE(opened);
    EXPECT_EQ(Text(u"counter"), u"1/4"_s);
    EXPECT_EQ(Text(u"Name"), u"Osprey"_s);
    EXPECT_EQ(Text(u"Price"), u"1.5"_s);
    EXPECT_EQ(Text(u"Seen"), u"7/4/2001"_s);
    EXPECT_TRUE(Ticked(u"Wild"));
    EXPECT_EQ(running->GoToNext(), Outcome::Done);
    EXPECT_EQ(Text(u"Seen"), u"7/5/2001 9:05:00 AM"_s);
    EXPECT_FALSE(Ticked(u"Wild"));
    EXPECT_EQ(running->GoToNext(), Outcome::Done);
    EXPECT_EQ(Text(u"Price"), QString()); // NULL
    EXPECT_EQ(running->GoToLast(), Outcome::Done);
    EXPECT_EQ(Text(u"counter"), u"4/4"_s);
    EXPECT_EQ(running->GoToNext(), Outcome::Failed);
    EXPECT_EQ(running->GoToFirst(), Outcome::Done);
    EXPECT_EQ(running->GoToPrevious(), Outcome::Done); // stays, and is no failure
    EXPECT_EQ(Text(u"counter"), u"1/4"_s);
}

TEST_F(RunningFormTest, WritesWhatTheUserChanged)
{
    Start(BirdForm());
    Type(u"Name", u"  00501 "_s); // text is stored as it stands
    Type(u"Price", u"12.75"_s);
    Type(u"Seen", u""_s);
    running->SetTicked(Control(u"Wild"), false);
    EXPECT_TRUE(running->IsDirty());
    EXPECT_EQ(Press(u"SAVE"), Outcome::Done) << prompt_.shown.join(u'\n').toStdString();
    EXPECT_FALSE(running->IsDirty());
    EXPECT_EQ(Stored(u"SELECT Name FROM Birds WHERE ID=1"_s), u"  00501 "_s);
    EXPECT_EQ(Stored(u"SELECT Price FROM Birds WHERE ID=1"_s), u"12.75"_s);
    EXPECT_EQ(Stored(u"SELECT Seen FROM Birds WHERE ID=1"_s), u"NULL"_s);
    EXPECT_EQ(Stored(u"SELECT Wild FROM Birds WHERE ID=1"_s), u"0"_s);
}

} // namespace
} // namespace mirel
