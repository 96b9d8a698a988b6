// Forms come from files: whatever those hold, a form runs, and changes nothing but records.
#include "form_fixture.h"

#include <limits>

namespace mirel {
namespace {

using namespace Qt::StringLiterals;

class HostileFormTest : public FormFixture {
protected:
    // Everything that a user can do to a form, on all of its controls.
    void DoEverything()
    {
        settings.confirmDelete = settings.confirmSave = false;
        for (int i = 0; i < int(running->Controls().size()); ++i) {
            running->SetText(i, u"x'); DROP TABLE Birds; --"_s);
            running->SetTicked(i, true);
            (void)running->SelectListRow(i, std::numeric_limits<qint64>::max());
            (void)running->TapListHeader(i, std::numeric_limits<int>::max());
            (void)running->ListRows(i, -1, std::numeric_limits<int>::max());
            running->RefreshItems(i);
            (void)running->PressButton(i);
            (void)running->FilterByControl(i, CellFilter::BySelection);
            (void)running->SortByControl(i, SortOrder::Descending);
            (void)PartsOf(*running->Controls()[size_t(i)].definition);
        }
        for (const int none : {-1, int(running->Controls().size())}) {
            running->SetText(none, u"x"_s);
            EXPECT_EQ(running->PressButton(none), Outcome::Failed);
            EXPECT_EQ(running->FieldOfControl(none), -1);
        }
        running->Tick();
        (void)running->RemoveFilter();
    }
    QString Tables()
    {
        QStringList tables;
        EXPECT_TRUE(catalog_.ListTables(path_, tables));
        return tables.join(u' ');
    }
};

TEST_F(HostileFormTest, RunsAThousandControlsOfAbsurdSizes)
{
    constexpr std::array kNumbers = {0, -1, 1, std::numeric_limits<int>::max(), std::numeric_limits<int>::min()};
    FormBuilder form(u"Birds");
    for (int i = 0; i < 1000; ++i) {
        form.Edit(u"Name", u"Birds.Name");
        ControlDef& control = form.Last();
        const int number = kNumbers[size_t(i) % kNumbers.size()];
        control.controlId = control.left = control.top = control.lines = number;
        control.width = control.height = kNumbers[size_t(i / 5) % kNumbers.size()];
        control.type = ControlType(i % 9 < 7 ? 199 + i % 9 : number); // all kinds, and two that there are not
        control.editKind = EditKind(number);
        control.sourceScope = SourceScope(i % 4);
        control.fieldBound = control.hasSource = number;
        control.buttonFunction = ButtonFunction(i % 16);
    }
    Start(form);
    DoEverything();
    EXPECT_EQ(running->Controls().back().windowId, 40999);
    EXPECT_EQ(Tables(), u"Birds"_s);
}

TEST_F(HostileFormTest, ReadsAnyTextAsASource)
{
    const QString deep = QString(5000, u'(') + u'1' + QString(5000, u')');
    const QStringList sources = {u""_s,
                                 u"DROP TABLE Birds"_s,
                                 u"SELECT * FROM Birds; DROP TABLE Birds"_s,
                                 u"DELETE FROM Birds\x08"
                                 u"DELETE FROM Birds"_s,
                                 u"\x05[Birds].[Name]\x05\x06'; DROP TABLE Birds\x06\x05\x05\x06\x06"_s,
                                 u"\x02\x03\x02\x03"_s,
                                 u"&&&[[[]]]\"'"_s,
                                 QString(u"&[Name]"_s).repeated(2000),
                                 deep,
                                 QString(1 << 14, u'x'),
                                 QString(QChar(0xD800)) + QChar(1)};
    FormBuilder form(u"Birds; DROP TABLE Birds");
    for (const QString& source : sources) {
        for (int type = 200; type <= 205; ++type) {
            for (const int code : {1, 3, 4, 13, 14}) {
                form.Edit(source.left(40), source);
                form.Last().type = ControlType(type);
                form.Last().buttonFunction = ButtonFunction(code);
                form.Last().option1 = 1;
                form.Last().defaultValue.Set(source);
            }
        }
    }
    Start(form, u"SELECT * FROM Birds"_s);
    prompt_.answers.assign(1000, true);
    DoEverything();
    EXPECT_EQ(Tables(), u"Birds"_s);
    EXPECT_EQ(Stored(u"SELECT COUNT(*) FROM Birds"_s), u"4"_s);
}

} // namespace
} // namespace mirel
