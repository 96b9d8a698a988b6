#pragma once

#include "forms/running_form.h"
#include "support/test_database.h"

#include <memory>

namespace mirel {

// Puts a form together in a line each: what a form maker would do.
class FormBuilder {
public:
    explicit FormBuilder(QStringView table, QStringView name = u"Test")
    {
        form.SetName(name);
        form.SetTableName(table);
    }

    FormBuilder& Edit(QStringView name, QStringView source)
    {
        return Add(ControlType::EditBox, name, source, SourceScope::Record);
    }
    FormBuilder& Whole(QStringView name, QStringView source)
    {
        return Add(ControlType::EditBox, name, source, SourceScope::WholeResult);
    }
    FormBuilder& Check(QStringView name, QStringView source)
    {
        return Add(ControlType::CheckBox, name, source, SourceScope::Record);
    }
    FormBuilder& Input(QStringView name, ControlType type = ControlType::EditBox)
    {
        Add(type, name, {}, SourceScope::None);
        return *this;
    }
    FormBuilder& DropDown(QStringView name, QStringView source)
    {
        Add(ControlType::DropDownBox, name, source, SourceScope::Record);
        form.controls.back().hasSource = 0;
        return *this;
    }
    FormBuilder& List(QStringView name, const std::vector<SourceColumn>& columns)
    {
        return Add(ControlType::List, name, JoinListColumns(columns), SourceScope::Record);
    }
    FormBuilder& Button(QStringView name, ButtonFunction function, QStringView source = {})
    {
        Add(ControlType::Button, name, source, SourceScope::Record);
        form.controls.back().buttonFunction = function;
        return *this;
    }
    FormBuilder& Button(QStringView name, ButtonFunction function,
                        const std::vector<SourceAssignment>& assignments)
    {
        return Button(name, function, JoinAssignments(assignments));
    }
    // The control added last.
    ControlDef& Last() { return form.controls.back(); }

    FormDef form;

private:
    FormBuilder& Add(ControlType type, QStringView name, QStringView source, SourceScope scope)
    {
        ControlDef control;
        control.controlId = qint32(form.controls.size());
        control.type = type;
        control.name.Set(name);
        if (!source.isNull()) {
            control.hasSource = 1;
            control.sourceScope = scope;
            control.SetSource(source);
        }
        form.AddControl(std::move(control));
        return *this;
    }
};

// Keeps what running forms ask of the program.
struct RecordingHost : FormHost {
    std::vector<FormCall> calls;
    int closed = 0;
    int changed = 0;

    void CallForm(const FormCall& call) override { calls.push_back(call); }
    void CloseForm() override { ++closed; }
    void DataChanged() override { ++changed; }
};

// A running form over the table "Birds": ID, Name, Price, Seen (date), Wild, Notes, and four records.
class FormFixture : public TestDatabase {
protected:
    using Outcome = RunningForm::Outcome;

    FormFixture()
    {
        using namespace Qt::StringLiterals;
        Run(u"CREATE TABLE [Birds] ([ID] INTEGER, [Name] VARCHAR(20), [Price] FLOAT, [Seen] DATETIME, [Wild] BIT, "
            "[Notes] TEXT, [Small] SMALLINT)"_s);
        const auto add = [this](const char16_t* values) {
            Run(u"INSERT INTO Birds (ID,Name,Price,Seen,Wild,Notes) VALUES(%1)"_s.arg(QStringView(values)));
        };
        add(u"1,'Osprey',1.5,'2001-07-04',1,'one'");
        add(u"2,'Gull',2.25,'2001-07-05 09:05:00',0,NULL");
        add(u"3,'Tern',NULL,NULL,1,'three'");
        add(u"4,'O''Brien',10,'1999-12-31',0,''");
    }

    RunningForm& Start(const FormBuilder& builder, const QString& query = {}, qint64 record = -1)
    {
        running = std::make_unique<RunningForm>(FormCall{builder.form, query, record},
                                                FormEnvironment{connection_, path_, store, prompt_, host, settings,
                                                                activeTable, [this] { return now; }});
        opened = running->Open();
        return *running;
    }

    int Control(QStringView name) const { return running->FindControl(name); }
    QString Text(QStringView name) const { return running->Controls()[size_t(Control(name))].text; }
    bool Ticked(QStringView name) const { return running->Controls()[size_t(Control(name))].ticked; }
    void Type(QStringView name, const QString& text) { running->SetText(Control(name), text); }
    Outcome Press(QStringView name) { return running->PressButton(Control(name)); }

    // The first field of all records of a statement, parted by "|".
    QString Stored(const QString& statement)
    {
        DbRecordset rows(connection_);
        EXPECT_TRUE(Open(rows, statement)) << statement.toStdString();
        QStringList texts;
        for (; !rows.IsEof(); (void)rows.MoveNext())
            texts += rows.FieldValue(0).IsNull() ? QStringLiteral("NULL") : rows.ValueText(0);
        return texts.join(u'|');
    }

    FormStore store;
    RecordingHost host;
    FormViewSettings settings;
    QString activeTable;
    QDateTime now{QDate(2001, 7, 4), QTime(9, 5, 7)};
    std::unique_ptr<RunningForm> running;
    bool opened = false;
};

} // namespace mirel
