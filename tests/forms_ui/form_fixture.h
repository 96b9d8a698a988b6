#pragma once

#include "forms/control_source.h"
#include "forms/ui/form_eng_view.h"
#include "forms/ui/form_surface.h"
#include "platform/user_locale.h"
#include "resources/string_table.h"
#include "support/test_database.h"

#include <QAction>
#include <QApplication>
#include <QTest>

#include <algorithm>

namespace mirel {

// A control to put into a form.
struct ControlDraft {
    ControlType type = ControlType::EditBox;
    QString name;
    QString source = {}; // empty: none
    EditKind kind = EditKind::Plain;
    ButtonFunction function = ButtonFunction::None;
    QRect place = {}; // empty: below the one before
};

// A running form's window over three people.
class FormFixture : public TestDatabase {
protected:
    FormFixture()
    {
        Run(QStringLiteral(
            "CREATE TABLE People (Name Varchar(40),City Varchar(40),Born Datetime,Friend Bit,Notes Text)"));
        for (const char* row : {"'Ann','Oslo','1990-01-02',1,'one'", "'Bob','Cork','1985-05-06',0,'two'",
                                "'Cid','Oslo','1970-07-08',1,'three'"})
            Run(QStringLiteral("INSERT INTO People (Name,City,Born,Friend,Notes) VALUES (%1)")
                    .arg(QString::fromLatin1(row)));
    }

    static ControlDef ControlOf(const ControlDraft& draft, QRect place)
    {
        ControlDef control;
        control.type = draft.type;
        control.name.Set(draft.name);
        control.editKind = draft.kind;
        control.buttonFunction = draft.function;
        control.sourceScope = SourceScope::Record;
        control.windowStyle = style::kBorder | style::kAutoHorizontalScroll;
        control.left = place.x();
        control.top = place.y();
        control.width = place.width();
        control.height = place.height();
        control.hasSource = draft.source.isEmpty() ? 0 : 1;
        if (!draft.source.isEmpty())
            control.SetSource(draft.source);
        return control;
    }

    static FormDef FormOf(const std::vector<ControlDraft>& drafts)
    {
        FormDef form;
        form.SetName(u"People form");
        form.SetTableName(u"People");
        form.SetDefaultQuery(u"SELECT * FROM People");
        form.defaultQueryOnStartup = 1;
        form.width = 240;
        form.height = 4;
        for (const ControlDraft& draft : drafts) {
            const QRect place = draft.place.isEmpty() ? QRect(10, form.height, 200, 18) : draft.place;
            form.AddControl(ControlOf(draft, place));
            form.height = std::max(form.height, place.y() + place.height() + 2);
        }
        return form;
    }

    static ControlDraft Edit(const QString& field, EditKind kind = EditKind::Plain)
    {
        return {.name = field, .source = QStringLiteral("People.") + field, .kind = kind};
    }
    static ControlDraft Button(const QString& name, ButtonFunction function, const QString& source = {})
    {
        return {.type = ControlType::Button, .name = name, .source = source, .function = function};
    }
    static ControlDraft Save(const QStringList& fields)
    {
        std::vector<SourceAssignment> assignments;
        for (const QString& field : fields)
            assignments.push_back({QStringLiteral("People.") + field, u'&' + field});
        return Button(QStringLiteral("SAVE"), ButtonFunction::Update, JoinAssignments(assignments));
    }

    void Make(const FormDef& form)
    {
        view = std::make_unique<CFormEngView>(
            FormCall{.form = form, .query = {}},
            FormSurroundings{connection_, path_, store, prompt_, settings, QString()});
    }
    void Show(const FormDef& form)
    {
        Make(form);
        view->resize(300, 400);
        view->show();
        EXPECT_TRUE(QTest::qWaitForWindowActive(view.get()));
        (void)view->Open();
    }
    void Show(const std::vector<ControlDraft>& drafts) { Show(FormOf(drafts)); }

    // Keys go where the focus is, as they do for the user.
    static void Press(int key, Qt::KeyboardModifiers modifiers = Qt::NoModifier)
    {
        QTest::keyClick(QApplication::focusWidget(), Qt::Key(key), modifiers);
    }
    static void Type(const QString& text) { QTest::keyClicks(QApplication::focusWidget(), text); }
    template <typename Widget = QWidget>
    Widget* Find(const QString& control) const
    {
        return dynamic_cast<Widget*>(view->Surface().WidgetOf(view->Form().FindControl(control)));
    }
    QString TextOf(const QString& control) const
    {
        return view->Form().Controls()[size_t(view->Form().FindControl(control))].text;
    }
    QAction* ActionOf(Str text) const
    {
        const QList<QAction*> actions = view->actions();
        return *std::ranges::find(actions, StringText(text), &QAction::text);
    }
    QString Stored(const QString& statement)
    {
        DbRecordset recordset(connection_);
        EXPECT_TRUE(Open(recordset, statement)) << statement.toStdString();
        return recordset.IsEof() ? QStringLiteral("none") : VariantText(recordset.FieldValue(0));
    }

    FormStore store{folder_.filePath(QStringLiteral("forms.raf"))};
    FormViewSettings settings;
    std::unique_ptr<CFormEngView> view;
};

} // namespace mirel
