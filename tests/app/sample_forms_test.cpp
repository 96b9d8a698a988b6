#include "app/sample_database.h"
#include "forms/running_form.h"
#include "support/printing.h"
#include "support/scripted_prompt.h"

#include <gtest/gtest.h>

#include <QTemporaryDir>

namespace mirel {
namespace {

using namespace Qt::StringLiterals;

struct CountingHost : FormHost {
    std::vector<FormCall> calls;
    void CallForm(const FormCall& call) override { calls.push_back(call); }
    void CloseForm() override {}
    void DataChanged() override {}
};

class SampleForms : public ::testing::Test {
protected:
    SampleForms()
    {
        EXPECT_TRUE(SampleDatabase(folder_, QStringLiteral(MIREL_SOURCE_DIR "/samples")).Open(session_));
    }

    std::unique_ptr<RunningForm> Start(const FormCall& call)
    {
        auto form = std::make_unique<RunningForm>(
            call, FormEnvironment{connection_, session_.Location(), session_.Store(), prompt_, host_, {}, {}});
        EXPECT_TRUE(form->Open());
        return form;
    }
    static RunningForm::Outcome Press(RunningForm& form, QStringView button)
    {
        return form.PressButton(form.FindControl(button));
    }

    QTemporaryDir home_;
    ProgramFolder folder_{home_.path()};
    DbConnection connection_;
    ScriptedPrompt prompt_;
    DatabaseSession session_{connection_, folder_, prompt_};
    CountingHost host_;
};

TEST_F(SampleForms, RunAndShowSomethingInEachOfTheirControls)
{
    ASSERT_FALSE(session_.Store().Forms().empty());
    for (const FormDef& definition : session_.Store().Forms()) {
        const auto form = Start({definition, {}, -1});
        EXPECT_GT(form->RecordCount(), 0) << definition.name.Text().toStdString();
        for (int i = 0; i < int(form->Controls().size()); ++i) {
            const ControlRun& control = form->Controls()[size_t(i)];
            const bool isFilled = control.type == ControlType::List          ? control.rows > 0
                                  : control.type == ControlType::DropDownBox ? !control.items.isEmpty()
                                                                             : !form->ShownText(i).isEmpty();
            EXPECT_TRUE(isFilled) << control.name.toStdString();
            const QRect place = PartsOf(*control.definition).main;
            EXPECT_LE(place.right(), definition.width) << control.name.toStdString();
            for (int other = 0; other < i; ++other) {
                EXPECT_FALSE(place.intersects(PartsOf(*form->Controls()[size_t(other)].definition).main))
                    << control.name.toStdString();
            }
        }
    }
    EXPECT_EQ(prompt_.shown, QStringList());
}

TEST_F(SampleForms, FindStrikesAndEditTheOneThatIsShown)
{
    const auto form = Start({*session_.Store().FindForm(u"Strikes"), {}, -1});
    form->SetText(form->FindControl(u"Species"), u"GULL"_s);
    EXPECT_EQ(Press(*form, u"Find"), RunningForm::Outcome::Done);
    EXPECT_GT(form->RecordCount(), 100);
    EXPECT_LT(form->RecordCount(), 1000);
    EXPECT_EQ(form->SelectListRow(form->FindControl(u"strikes"), 2), RunningForm::Outcome::Done);
    EXPECT_EQ(Press(*form, u"Edit this one"), RunningForm::Outcome::Done);
    ASSERT_EQ(host_.calls.size(), 1U);

    const auto entry = Start(host_.calls.front());
    EXPECT_EQ(entry->CounterText(), form->CounterText());
    entry->SetText(entry->FindControl(u"Wildlife Size"), u"Large"_s);
    entry->SetText(entry->FindControl(u"Cost Total $"), u"4711"_s);
    EXPECT_EQ(Press(*entry, u"Save"), RunningForm::Outcome::Done);
    EXPECT_EQ(entry->ShownText(entry->FindControl(u"Cost Total $")), u"4711"_s);
    EXPECT_EQ(prompt_.shown, QStringList());
}

} // namespace
} // namespace mirel
