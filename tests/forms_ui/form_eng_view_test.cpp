#include "forms/ui/form_eng_view.h"

#include "forms/ui/control_look.h"
#include "forms/ui/record_list.h"
#include "forms_ui/form_fixture.h"
#include "platform/ui/error_line.h"
#include "tableview/ui/filter_bar.h"

#include <QCheckBox>
#include <QClipboard>
#include <QComboBox>
#include <QDialog>
#include <QHeaderView>
#include <QLineEdit>
#include <QMenu>
#include <QPlainTextEdit>
#include <QPushButton>
#include <QScrollArea>
#include <QScrollBar>
#include <QSignalSpy>
#include <QTimer>
#include <QToolButton>
#include <QWheelEvent>

#include <limits>

namespace mirel {
namespace {

using namespace Qt::StringLiterals;

class FormView : public FormFixture {};

const ControlDraft kFriend = {
    .type = ControlType::CheckBox, .name = u"Friend"_s, .source = u"WHERE People.Friend=1"_s};
const ControlDraft kCounter = {.name = u"rec"_s, .source = u"RECNO()+'/'+RECCOUNT()"_s};

// --- the controls' windows ------------------------------------------------------------------------------------

TEST_F(FormView, PutsEachControlsWindowsWhereTheFormHasThem)
{
    settings.fitToWindow = false;
    Show({{.name = u"plain"_s, .place = {10, 5, 100, 18}},
          {.name = u"date"_s, .kind = EditKind::DatePicker, .place = {10, 30, 100, 18}},
          {.name = u"long"_s, .kind = EditKind::Extendable, .place = {10, 55, 100, 18}},
          {.type = ControlType::Label, .name = u"label"_s, .place = {10, 80, 100, 18}},
          {.type = ControlType::Button, .name = u"button"_s, .place = {10, 105, 100, 18}},
          {.type = ControlType::DropDownBox, .name = u"drop"_s, .place = {10, 130, 100, 18}},
          {.type = ControlType::List, .name = u"list"_s, .place = {10, 155, 100, 60}}});
    const struct {
        int window;
        QRect main;
        QRect strip; // empty: there is none
    } rows[] = {{40000, {10, 5, 100, 18}, {}},
                {40001, {10, 30, 85, 18}, {10, 30, 100, 18}},
                {40002, {10, 55, 85, 18}, {95, 55, 15, 18}},
                {40003, {10, 80, 100, 18}, {}},
                {40004, {10, 105, 100, 18}, {}},
                {40005, {10, 130, 100, 18}, {}},
                {40006, {10, 155, 100, 60}, {}}};
    for (const auto& row : rows) {
        const QString name = QString::number(row.window);
        const auto* main = view->Surface().findChild<QWidget*>(name);
        const auto* strip = view->Surface().findChild<QWidget*>(name + u".strip"_s);
        ASSERT_TRUE(main) << row.window;
        EXPECT_EQ(main->geometry(), row.main) << row.window;
        EXPECT_EQ(strip ? strip->geometry() : QRect(), row.strip) << row.window;
    }
}

TEST_F(FormView, TabGoesThroughTheControlsInListOrder)
{
    // The places go the other way.
    Show({{.name = u"low"_s, .source = u"People.Name"_s, .place = {10, 90, 80, 18}},
          {.type = ControlType::Label, .name = u"label"_s, .place = {10, 110, 80, 18}},
          {.type = ControlType::CheckBox, .name = u"tick"_s, .place = {10, 60, 80, 18}},
          {.type = ControlType::Button, .name = u"press"_s, .place = {10, 30, 80, 18}},
          {.name = u"high"_s, .place = {10, 5, 80, 18}}});
    for (const QString& name : {u"40000"_s, u"40002"_s, u"40003"_s, u"40004"_s, u"40000"_s}) {
        EXPECT_EQ(QApplication::focusWidget()->objectName(), name);
        Press(Qt::Key_Tab);
    }
    Press(Qt::Key_Backtab, Qt::ShiftModifier);
    Press(Qt::Key_Backtab, Qt::ShiftModifier);
    EXPECT_EQ(QApplication::focusWidget()->objectName(), u"40004"_s);
}

TEST_F(FormView, NumbersBeyondAllMeasureNeitherCrashNorHang)
{
    constexpr int kMost = std::numeric_limits<int>::max();
    FormDef form = FormOf({{.name = u"huge"_s, .source = u"People.Name"_s},
                           {.type = ControlType::List, .name = u"list"_s, .source = u"\u0002\u0003\u0002"_s},
                           {.type = ControlType::DropDownBox, .name = u"drop"_s, .source = u"SELECT\u0008"_s},
                           {.type = ControlType(999), .name = u"unknown"_s},
                           {.name = u"name"_s, .source = u"People.Name"_s}});
    form.width = form.height = kMost;
    form.textStyle.pointSize = kMost;
    for (size_t i = 0; i < 4; ++i) {
        ControlDef& control = form.controls[i];
        control.left = control.top = i % 2 == 0 ? -kMost : kMost;
        control.width = control.height = kMost;
        control.textStyle.pointSize = i % 2 == 0 ? kMost : -kMost;
        control.windowStyle = 0xFFFFFFFF;
    }
    Show(form);
    EXPECT_EQ(TextOf(u"name"_s), u"Ann"_s);
    EXPECT_FALSE(view->grab().isNull());
}

TEST_F(FormView, AFormWhoseTableIsGoneOpensWithItsOtherControls)
{
    FormDef form = FormOf({Edit(u"Name"_s), {.name = u"clock"_s, .source = u"SYSTIME()"_s}});
    form.SetTableName(u"Nowhere");
    form.SetDefaultQuery(u"SELECT * FROM Nowhere");
    Show(form);
    EXPECT_EQ(prompt_.shown.size(), 1);
    EXPECT_EQ(view->Form().RecordCount(), -1);
    EXPECT_NE(TextOf(u"clock"_s), QString());
    EXPECT_FALSE(ActionOf(Str::FormNext)->isEnabled());
}

TEST_F(FormView, AFieldThatIsGoneIsAnEmptyBox)
{
    Show({Edit(u"Name"_s), Edit(u"Lost"_s)});
    EXPECT_EQ(TextOf(u"Lost"_s), QString());
    EXPECT_EQ(Find<QLineEdit>(u"Name"_s)->text(), u"Ann"_s);
}

// --- walking and editing --------------------------------------------------------------------------------------

TEST_F(FormView, WalksThroughTheRecordsWithItsKeys)
{
    Show({Edit(u"Name"_s), kFriend, kCounter});
    Find(u"Friend"_s)->setFocus(); // a control without keys of its own for these
    const struct {
        Qt::Key key;
        QString counter;
    } steps[] = {{Qt::Key_PageDown, u"2/3"_s}, {Qt::Key_PageUp, u"1/3"_s},   {Qt::Key_PageUp, u"1/3"_s},
                 {Qt::Key_End, u"3/3"_s},      {Qt::Key_PageDown, u"3/3"_s}, {Qt::Key_Home, u"1/3"_s}};
    for (const auto& step : steps) {
        Press(step.key, Qt::ControlModifier);
        EXPECT_EQ(Find<QLineEdit>(u"rec"_s)->text(), step.counter)
            << QKeySequence(step.key).toString().toStdString();
    }
}

TEST_F(FormView, AnEditorKeepsTheKeysThatMoveWithinItsText)
{
    Show({Edit(u"Name"_s), kCounter});
    Press(Qt::Key_End, Qt::ControlModifier);
    EXPECT_EQ(Find<QLineEdit>(u"Name"_s)->cursorPosition(), 3);
    EXPECT_EQ(TextOf(u"rec"_s), u"1/3"_s);
    Press(Qt::Key_PageDown, Qt::ControlModifier);
    EXPECT_EQ(TextOf(u"rec"_s), u"2/3"_s);
}

TEST_F(FormView, AMoveSetsOnlyTheTextsThatAreOthers)
{
    Show({Edit(u"Name"_s), {.name = u"search"_s}});
    auto* search = Find<QLineEdit>(u"search"_s);
    search->setFocus();
    Type(u"abcd"_s);
    search->setCursorPosition(2);
    const QSignalSpy changed(search, &QLineEdit::textChanged);
    Press(Qt::Key_PageDown, Qt::ControlModifier);
    EXPECT_EQ(Find<QLineEdit>(u"Name"_s)->text(), u"Bob"_s);
    EXPECT_EQ(search->cursorPosition(), 2);
    EXPECT_TRUE(changed.isEmpty());
}

TEST_F(FormView, AsksBeforeAChangedRecordIsLeft)
{
    Show({Edit(u"Name"_s), Edit(u"City"_s)});
    Type(u"x"_s);
    EXPECT_TRUE(view->isWindowModified());
    Press(Qt::Key_PageDown, Qt::ControlModifier);
    EXPECT_EQ(prompt_.questions, QStringList(StringText(Str::IgnoreChangesQuestion)));
    EXPECT_EQ(Find<QLineEdit>(u"Name"_s)->text(), u"x"_s) << "the answer was No";
    prompt_.answers = {true};
    Press(Qt::Key_PageDown, Qt::ControlModifier);
    EXPECT_EQ(Find<QLineEdit>(u"Name"_s)->text(), u"Bob"_s);
    EXPECT_FALSE(view->isWindowModified());
}

TEST_F(FormView, DropsEditsSilentlyWhenTheQuestionIsOff)
{
    settings.confirmSave = false;
    Show({Edit(u"Name"_s)});
    Type(u"x"_s);
    Press(Qt::Key_PageDown, Qt::ControlModifier);
    EXPECT_EQ(TextOf(u"Name"_s), u"Bob"_s);
    EXPECT_TRUE(prompt_.questions.isEmpty());
}

TEST_F(FormView, ClosingAsksAndStaysOnNo)
{
    Show({Edit(u"Name"_s)});
    Type(u"x"_s);
    EXPECT_FALSE(view->close());
    EXPECT_TRUE(view->isVisible());
    EXPECT_EQ(TextOf(u"Name"_s), u"x"_s);
    prompt_.answers = {true};
    EXPECT_TRUE(view->close());
    EXPECT_FALSE(view->isVisible());
    EXPECT_EQ(prompt_.questions.size(), 2);
}

TEST_F(FormView, EscapeGivesAControlItsOldValueBack)
{
    Show({Edit(u"Name"_s), kFriend, {.name = u"search"_s}, Save({u"Name"_s, u"Friend"_s})});
    Type(u"xyz"_s);
    Press(Qt::Key_Escape);
    EXPECT_EQ(Find<QLineEdit>(u"Name"_s)->text(), u"Ann"_s);
    EXPECT_FALSE(view->isWindowModified());
    Find(u"Friend"_s)->setFocus();
    Press(Qt::Key_Space);
    EXPECT_TRUE(view->isWindowModified());
    Press(Qt::Key_Escape);
    EXPECT_TRUE(Find<QCheckBox>(u"Friend"_s)->isChecked());
    EXPECT_FALSE(view->isWindowModified());
    Find(u"search"_s)->setFocus();
    Type(u"q"_s);
    Press(Qt::Key_Escape);
    EXPECT_EQ(TextOf(u"search"_s), QString());
}

TEST_F(FormView, SavesWithItsKeyAndTellsOnClosing)
{
    Show({Edit(u"Name"_s), Save({u"Name"_s})});
    const QSignalSpy told(view.get(), &CFormEngView::dataChanged);
    Type(u"Zoe"_s);
    Press(Qt::Key_S, Qt::ControlModifier);
    EXPECT_FALSE(view->isWindowModified());
    EXPECT_EQ(Stored(u"SELECT Name FROM People WHERE City='Oslo'"_s), u"Zoe"_s);
    EXPECT_TRUE(view->close());
    EXPECT_EQ(told.count(), 1);
    EXPECT_TRUE(prompt_.questions.isEmpty());
}

TEST_F(FormView, WithoutAnUpdateButtonThereIsNothingToSave)
{
    Show({Edit(u"Name"_s)});
    EXPECT_FALSE(ActionOf(Str::FormSave)->isEnabled());
    EXPECT_EQ(ActionOf(Str::FormSave)->toolTip(), StringText(Str::FormSaveNone));
}

TEST_F(FormView, AddsAndDeletesRecordsWithItsKeys)
{
    Show({Edit(u"Name"_s), kCounter});
    Press(Qt::Key_N, Qt::ControlModifier);
    EXPECT_EQ(TextOf(u"rec"_s), u"4/4"_s);
    EXPECT_EQ(TextOf(u"Name"_s), QString());
    Press(Qt::Key_Delete, Qt::ControlModifier);
    EXPECT_EQ(TextOf(u"rec"_s), u"4/4"_s) << "the answer was No";
    prompt_.answers = {true};
    Press(Qt::Key_Delete, Qt::ControlModifier);
    EXPECT_EQ(TextOf(u"rec"_s), u"3/3"_s);
}

TEST_F(FormView, EnterGoesOnAndPressesButtons)
{
    Show({Edit(u"Name"_s), Button(u"CLEAR"_s, ButtonFunction::ClearForm)});
    Press(Qt::Key_Return);
    EXPECT_EQ(QApplication::focusWidget(), Find(u"CLEAR"_s));
    Press(Qt::Key_Return);
    EXPECT_EQ(Find<QLineEdit>(u"Name"_s)->text(), QString());
}

// --- lists, drop-down boxes, longer texts -----------------------------------------------------------------------

TEST_F(FormView, AListFollowsTapsKeysAndHeaders)
{
    Show({Edit(u"Name"_s),
          {.type = ControlType::List,
           .name = u"list"_s,
           .source = JoinListColumns({{u"Who"_s, u"People.Name"_s}, {u"Shout"_s, u"UPPER(People.Name)"_s}}),
           .place = {10, 30, 220, 150}}});
    auto* list = Find<RecordList>(u"list"_s);
    QTest::mouseClick(list->viewport(), Qt::LeftButton, {}, list->RowRect(1).center());
    EXPECT_EQ(TextOf(u"Name"_s), u"Bob"_s);
    list->setFocus();
    Press(Qt::Key_End);
    EXPECT_EQ(TextOf(u"Name"_s), u"Cid"_s);
    Press(Qt::Key_Up);
    EXPECT_EQ(TextOf(u"Name"_s), u"Bob"_s);

    const auto tapHeader = [list](int column) {
        const int x = list->Header()->sectionViewportPosition(column) + 12;
        QTest::mouseClick(list->Header()->viewport(), Qt::LeftButton, {}, QPoint(x, 5));
    };
    tapHeader(0);
    EXPECT_EQ(TextOf(u"Name"_s), u"Ann"_s);
    tapHeader(0);
    EXPECT_EQ(TextOf(u"Name"_s), u"Cid"_s) << "the second tap sorts the other way";
    tapHeader(1);
    EXPECT_EQ(TextOf(u"Name"_s), u"Cid"_s) << "an expression sorts nothing";
}

TEST_F(FormView, ADropDownBoxOffersItsItemsAndTakesOtherTexts)
{
    const ControlDraft city = {.type = ControlType::DropDownBox,
                               .name = u"City"_s,
                               .source = JoinDropDown({u"SELECT City FROM People"_s, u"Rome"_s})};
    Show({city, Save({u"City"_s})});
    auto* box = Find<QComboBox>(u"City"_s);
    QStringList items;
    for (int i = 0; i < box->count(); ++i)
        items += box->itemText(i);
    EXPECT_EQ(items, QStringList({u"Rome"_s, u"Oslo"_s, u"Cork"_s}));
    box->setFocus();
    Press(Qt::Key_Down);
    EXPECT_EQ(TextOf(u"City"_s), u"Rome"_s);
    EXPECT_TRUE(view->isWindowModified());
    box->lineEdit()->selectAll();
    Type(u"Bern"_s);
    EXPECT_EQ(TextOf(u"City"_s), u"Bern"_s);
}

TEST_F(FormView, ADropDownBoxChangesNothingUnderTheWheelOrAHold)
{
    settings.holdTimeMs = 50;
    Show({Edit(u"Name"_s),
          {.type = ControlType::DropDownBox, .name = u"City"_s, .source = JoinDropDown({{}, u"Cork;Oslo;Rome"_s})},
          Save({u"City"_s})});
    Find(u"Name"_s)->setFocus();
    auto* box = Find<QComboBox>(u"City"_s);
    const QPoint middle = box->rect().center();
    QWheelEvent wheel(middle, box->mapToGlobal(middle), {}, {0, -120}, Qt::NoButton, {}, Qt::NoScrollPhase, false);
    QApplication::sendEvent(box, &wheel);
    EXPECT_EQ(TextOf(u"City"_s), QString());
    EXPECT_FALSE(view->Form().IsDirty());

    bool listAlone = false;
    QTimer::singleShot(200, view.get(), [&] {
        const QWidget* popup = QApplication::activePopupWidget();
        listAlone = popup && !qobject_cast<const QMenu*>(popup);
        while (QWidget* open = QApplication::activePopupWidget())
            open->close();
    });
    QTest::mousePress(box, Qt::LeftButton, {}, QPoint(box->width() - 5, box->height() / 2));
    QTest::qWait(300);
    EXPECT_TRUE(listAlone) << "the list, and no menu over it";
}

TEST_F(FormView, PastesAtTheCaret)
{
    Show({Edit(u"Name"_s), Save({u"Name"_s})});
    auto* name = Find<QLineEdit>(u"Name"_s);
    name->setFocus();
    name->setCursorPosition(1);
    QApplication::clipboard()->setText(u"nn"_s);
    ActionOf(Str::ActionPaste)->trigger();
    EXPECT_EQ(TextOf(u"Name"_s), u"Annnn"_s);
    EXPECT_TRUE(view->Form().IsDirty());
}

TEST_F(FormView, SaysWhichTextCannotBeStoredOnceItIsLeft)
{
    Show({Edit(u"Born"_s, EditKind::DatePicker), Edit(u"Name"_s), Save({u"Born"_s, u"Name"_s})});
    auto* error = view->findChild<ErrorLine*>();
    auto* born = Find<QLineEdit>(u"Born"_s);
    const QString before = born->text();
    born->setFocus();
    born->selectAll();
    Type(u"31.31.99"_s);
    EXPECT_EQ(error->Text(), QString()) << "not while it is typed";
    Press(Qt::Key_Tab);
    EXPECT_EQ(error->Text(), u"Born: not a date: 31.31.99"_s);
    QTest::mouseClick(error->findChild<QToolButton*>(), Qt::LeftButton);
    EXPECT_EQ(born->text(), before);
    EXPECT_EQ(error->Text(), QString());
}

TEST_F(FormView, NobodyTypesOverWhatAFormComputes)
{
    Show({kCounter,
          Edit(u"Name"_s),
          {.name = u"from"_s, .source = u"SYSDATE()"_s},
          Button(u"find"_s, ButtonFunction::Select, u"SELECT * FROM People WHERE Born > &from"_s)});
    EXPECT_TRUE(Find<QLineEdit>(u"rec"_s)->isReadOnly());
    EXPECT_FALSE(Find<QLineEdit>(u"Name"_s)->isReadOnly());
    EXPECT_FALSE(Find<QLineEdit>(u"from"_s)->isReadOnly()) << "a button reads it";
}

TEST_F(FormView, TheLargerEditorChangesTheTextAndKeepsItsLineEnds)
{
    Run(u"UPDATE People SET Notes='a\r\nb' WHERE Name='Ann'"_s);
    Show({Edit(u"Notes"_s, EditKind::Extendable), Save({u"Notes"_s})});
    const auto answer = [this](const QString& added, QDialog::DialogCode code) {
        QTimer::singleShot(0, view.get(), [added, code] {
            auto* dialog = qobject_cast<QDialog*>(QApplication::activeModalWidget());
            ASSERT_TRUE(dialog);
            QTest::keyClicks(dialog->findChild<QPlainTextEdit*>(), added);
            dialog->done(code);
        });
        EXPECT_TRUE(view->Surface().OpenMoreOf(0));
    };
    answer(u"lost"_s, QDialog::Rejected);
    EXPECT_FALSE(view->isWindowModified());
    answer(u"!"_s, QDialog::Accepted);
    EXPECT_TRUE(view->isWindowModified());
    EXPECT_EQ(TextOf(u"Notes"_s), u"a\r\nb!"_s);
}

// --- commands ---------------------------------------------------------------------------------------------------

TEST_F(FormView, TheToolBarSaysWhatItDoesAndWhen)
{
    Show({Edit(u"Name"_s)});
    const QList<QAction*> actions = view->actions();
    for (const QString& tip :
         {u"First Record"_s, u"Previous Record"_s, u"Next Record"_s, u"Last Record"_s, u"Add New Record"_s,
          u"Delete Record"_s, u"Scroll Up"_s, u"Scroll Down"_s, u"Form Scroll Bar"_s})
        EXPECT_TRUE(std::ranges::any_of(actions, [&](QAction* action) { return action->toolTip() == tip; }))
            << tip.toStdString();
    EXPECT_TRUE(ActionOf(Str::FormEdit)->isEnabled());
    EXPECT_FALSE(ActionOf(Str::FormPrevious)->isEnabled());
    EXPECT_TRUE(ActionOf(Str::FormNext)->isEnabled());
    ActionOf(Str::FormLast)->trigger();
    EXPECT_TRUE(ActionOf(Str::FormPrevious)->isEnabled());
    EXPECT_FALSE(ActionOf(Str::FormNext)->isEnabled());
}

TEST_F(FormView, FiltersAndSortsByTheFocusedControlsField)
{
    Show({Edit(u"City"_s), kCounter, Edit(u"Name"_s)});
    ActionOf(Str::FormFilterBy)->trigger();
    EXPECT_EQ(TextOf(u"rec"_s), u"1/2"_s);
    EXPECT_TRUE(view->findChild<FilterBar*>()->isVisible());
    ActionOf(Str::ActionRemoveFilter)->trigger();
    ActionOf(Str::FormFilterExcluding)->trigger();
    EXPECT_EQ(TextOf(u"Name"_s), u"Bob"_s);
    ActionOf(Str::ActionRemoveFilter)->trigger();
    EXPECT_FALSE(view->findChild<FilterBar*>()->isVisible());
    Find(u"Name"_s)->setFocus();
    ActionOf(Str::FormSortDescending)->trigger();
    EXPECT_EQ(TextOf(u"Name"_s), u"Cid"_s);
    Find(u"rec"_s)->setFocus();
    EXPECT_FALSE(ActionOf(Str::FormSortDescending)->isEnabled()) << "an expression is no field";
}

TEST_F(FormView, TheScrollBarIsTheFormsAndScrollingTheSettings)
{
    FormDef form = FormOf({Edit(u"Name"_s)});
    form.height = 3000;
    form.formScrollBar = 1;
    Show(form);
    const QScrollBar* bar = view->findChild<QScrollArea*>()->verticalScrollBar();
    EXPECT_TRUE(bar->isVisible());
    ActionOf(Str::FormScrollDown)->trigger();
    EXPECT_EQ(bar->value(), settings.scrollPixels);
    EXPECT_TRUE(ActionOf(Str::FormScrollUp)->isEnabled());
    ActionOf(Str::FormScrollBar)->trigger();
    EXPECT_FALSE(bar->isVisible());
}

TEST_F(FormView, OpensAtItsTopWithTheFocusInSight)
{
    const ControlDraft title = {.type = ControlType::Label, .name = u"title"_s, .place = {10, 2, 100, 24}};
    const ControlDraft search = {
        .type = ControlType::DropDownBox, .name = u"search"_s, .place = {10, 30, 100, 18}};
    const ControlDraft press = {.type = ControlType::Button, .name = u"press"_s, .place = {120, 30, 60, 18}};
    const auto list = [](int heightPx) {
        return ControlDraft{.type = ControlType::List, .name = u"list"_s, .place = {10, 55, 200, heightPx}};
    };
    const auto name = [](int top) {
        return ControlDraft{.name = u"Name"_s, .source = u"People.Name"_s, .place = {10, top, 100, 18}};
    };
    const struct {
        const char* what;
        std::vector<ControlDraft> controls;
        QString focused;
        bool atTop;
    } rows[] = {
        {"the first field fits", {title, search, press, name(60)}, u"Name"_s, true},
        {"the first field is further down", {title, press, search, list(100), name(300)}, u"search"_s, true},
        {"so is all but a list", {title, list(60), name(300)}, u"list"_s, true},
        {"nothing above is for input", {title, kCounter, press, name(300)}, u"Name"_s, false}};
    settings.fitToWindow = false;
    for (const auto& row : rows) {
        FormDef form = FormOf(row.controls);
        form.height = 600;
        for (const bool opensHidden : {false, true}) { // as a form does that an earlier run has left open
            Make(form);
            view->resize(320, 200);
            if (opensHidden)
                (void)view->Open();
            view->show();
            EXPECT_TRUE(QTest::qWaitForWindowActive(view.get()));
            if (!opensHidden)
                (void)view->Open();
            QCoreApplication::processEvents();
            EXPECT_TRUE(Find(row.focused)->hasFocus()) << row.what << opensHidden;
            const int scrolled = view->findChild<QScrollArea*>()->verticalScrollBar()->value();
            EXPECT_EQ(scrolled == 0, row.atTop) << row.what << opensHidden;
        }
    }
}

TEST_F(FormView, ShowsItsRecordsAsAListToo)
{
    settings.sortByHeader = true;
    Show({Edit(u"Name"_s)});
    ActionOf(Str::FormList)->trigger();
    auto* list = qobject_cast<RecordList*>(QApplication::focusWidget());
    ASSERT_TRUE(list && list->isVisible());
    Press(Qt::Key_Down);
    EXPECT_EQ(TextOf(u"Name"_s), u"Bob"_s);
    const auto tapHeader = [list](int column) {
        const int x = list->Header()->sectionViewportPosition(column) + 12;
        QTest::mouseClick(list->Header()->viewport(), Qt::LeftButton, {}, QPoint(x, 5));
    };
    tapHeader(0);
    tapHeader(0);
    EXPECT_EQ(TextOf(u"Name"_s), u"Cid"_s);
    ActionOf(Str::FormDetail)->trigger();
    EXPECT_FALSE(list->isVisible());
    EXPECT_FALSE(ActionOf(Str::FormList)->isChecked());
    ActionOf(Str::FormDetail)->trigger();
    EXPECT_EQ(QApplication::focusWidget(), Find(u"Name"_s));
}

TEST_F(FormView, CallsOtherFormsAndClosesWhenItsButtonSaysSo)
{
    FormDef other = FormOf({});
    other.SetName(u"Other");
    store.AddForm(other);
    FormDef form = FormOf({Edit(u"Name"_s), Button(u"CALL"_s, ButtonFunction::CallForm, u"Other"_s)});
    form.controls[1].option1 = 1;
    form.controls[1].option2 = 1;
    Show(form);
    QStringList called;
    QObject::connect(view.get(), &CFormEngView::formCalled, view.get(), [&called](const FormCall& call) {
        called = {call.form.name.Text(), call.query};
    });
    QTest::mouseClick(Find(u"CALL"_s), Qt::LeftButton);
    EXPECT_EQ(called, QStringList({u"Other"_s, u"SELECT * FROM People"_s}));
    EXPECT_TRUE(QTest::qWaitFor([this] { return !view->isVisible(); }));
}

// --- how it looks -----------------------------------------------------------------------------------------------

TEST(ControlLook, AStoredColourLeavesTheOtherOneReadable)
{
    QPalette dark;
    dark.setColor(QPalette::Base, Qt::black);
    dark.setColor(QPalette::Text, Qt::white);
    constexpr quint32 kYellow = 0x80FFFF;
    constexpr quint32 kBlack = 0;
    const struct {
        const char* what;
        quint32 background;
        quint32 text;
        Qt::GlobalColor seen;
    } rows[] = {{"neither: the palette's", kDefaultColor, kDefaultColor, Qt::white},
                {"light paper gets dark ink", kYellow, kDefaultColor, Qt::black},
                {"dark ink on the dark palette gives way", kDefaultColor, kBlack, Qt::white},
                {"both are the user's", kBlack, kBlack, Qt::black}};
    for (const auto& row : rows) {
        const QPalette palette = PaletteOf(dark, row.background, row.text, QPalette::Base, QPalette::Text);
        EXPECT_EQ(palette.color(QPalette::Text), QColor(row.seen)) << row.what;
    }
}

TEST(SurfaceScale, FillsTheWindowAndStaysReadable)
{
    const struct {
        const char* what;
        QSize form;
        QSize window;
        QSize shown;
    } rows[] = {{"as it is", {240, 260}, {240, 260}, {240, 260}},
                {"a little too wide is squeezed", {250, 260}, {240, 260}, {240, 260}},
                {"far too large is scrolled", {600, 900}, {240, 260}, {600, 900}},
                {"a low form is stretched, not beyond its shape", {240, 50}, {240, 500}, {240, 100}},
                {"a large window has its limit", {100, 100}, {1000, 1000}, {200, 200}},
                {"no size at all", {0, 0}, {240, 260}, {0, 0}}};
    for (const auto& row : rows)
        EXPECT_EQ(SurfaceScale::ToFit(row.form, row.window).Of(row.form), row.shown) << row.what;
}

} // namespace
} // namespace mirel
