// The commands on a whole result as the user reaches them: menus, dialogs and keys.
#include "data/filter_condition.h"
#include "forms/form_store.h"
#include "platform/ui/date_field.h"
#include "platform/ui/error_line.h"
#include "resources/string_table.h"
#include "tableview/export_draft.h"
#include "tableview/people_fixture.h"
#include "tableview/ui/cell_strip.h"
#include "tableview/ui/csv_options_dialog.h"
#include "tableview/ui/export_wizard.h"
#include "tableview/ui/filter_dialog.h"
#include "tableview/ui/pick_box.h"
#include "tableview/ui/record_grid.h"
#include "tableview/ui/sort_dialog.h"
#include "tableview/ui/table_view.h"

#include <QAbstractItemView>
#include <QAction>
#include <QApplication>
#include <QCheckBox>
#include <QDialogButtonBox>
#include <QGroupBox>
#include <QLabel>
#include <QLineEdit>
#include <QListWidget>
#include <QMenu>
#include <QPlainTextEdit>
#include <QPushButton>
#include <QRadioButton>
#include <QTabWidget>
#include <QTest>
#include <QTimer>
#include <QToolButton>
#include <QTreeWidget>

#include <algorithm>

namespace mirel {
namespace {

using namespace Qt::StringLiterals;

class ResultCommandsTest : public PeopleFixture {
protected:
    enum Field { Name, Age, Born, Member, Note };

    ResultCommandsTest()
    {
        view.resize(700, 400);
        EXPECT_TRUE(view.OpenTable(u"People"_s));
        view.show();
        EXPECT_TRUE(QTest::qWaitForWindowActive(&view));
    }

    QAction* ActionOf(Str text) const
    {
        const QList<QAction*> actions = view.actions();
        return *std::ranges::find(actions, StringText(text), &QAction::text);
    }
    static void Accept(const QDialog& dialog)
    {
        dialog.findChild<QDialogButtonBox*>()->button(QDialogButtonBox::Ok)->click();
    }
    void Select(int field)
    {
        auto* grid = view.findChild<RecordGrid*>();
        grid->setFocus();
        QTest::keyClick(grid, Qt::Key_Home, Qt::ControlModifier);
        QTest::keyClick(grid, Qt::Key_Home);
        for (int i = 0; i < field; ++i)
            QTest::keyClick(grid, Qt::Key_Right);
    }
    QString Label() const { return view.findChild<CellStrip*>()->findChild<QLabel*>()->text(); }
    QString Line() const { return view.findChild<CellStrip*>()->findChild<QLineEdit*>()->text(); }

    // Runs `actions` on the dialog that `open` brings up.
    template <typename Dialog>
    void InDialog(const std::function<void()>& open, const std::function<void(Dialog&)>& actions)
    {
        bool met = false;
        QTimer::singleShot(0, &view, [&] {
            auto* dialog = qobject_cast<Dialog*>(QApplication::activeModalWidget());
            met = dialog != nullptr;
            if (dialog)
                actions(*dialog);
            else if (QWidget* other = QApplication::activeModalWidget())
                other->close();
        });
        open();
        EXPECT_TRUE(met);
    }

    FormStore store{folder.filePath(u"store.raf"_s)};
    FieldLists lists{connection, path, prompt};
    CTableView view{connection, path, prompt, {}};
    const RecordBrowser& browser = view.Browser();
};

TEST_F(ResultCommandsTest, SumsUpFromTheMenuBehindItsEntry)
{
    QMenu* sums = ActionOf(Str::ActionAggregate)->menu();
    ASSERT_TRUE(sums);
    EXPECT_EQ(sums->actions().size(), 4);
    Select(Age);
    sums->actions()[0]->trigger();
    EXPECT_EQ(Label(), u"SUM: "_s);
    EXPECT_EQ(Line(), u"650"_s);
    EXPECT_FALSE(view.isWindowModified());
    QTest::keyClick(QApplication::focusWidget(), Qt::Key_Down);
    EXPECT_EQ(Label(), u"Age:"_s);
    EXPECT_EQ(Line(), u"22"_s) << "nothing was written, and the keys go on in the grid";
}

TEST_F(ResultCommandsTest, UpdatesWhatTheZoomedEditorHolds)
{
    Select(Note);
    ActionOf(Str::ZoomIn)->trigger();
    auto* zoom = view.findChild<QPlainTextEdit*>();
    zoom->setPlainText(u"one\ntwo"_s);
    prompt.answers = {true, true};
    ActionOf(Str::ActionEditAll)->menu()->actions()[1]->trigger();
    EXPECT_EQ(Stored(u"SELECT COUNT(*) FROM People WHERE Note='one\ntwo'"_s), u"25"_s);
    EXPECT_TRUE(zoom->isVisible());
    EXPECT_EQ(zoom->toPlainText(), u"one\ntwo"_s);
}

TEST_F(ResultCommandsTest, EmptiesTheViewWithDeleteAll)
{
    prompt.answers = {true, true};
    ActionOf(Str::ActionEditAll)->menu()->actions()[0]->trigger();
    EXPECT_EQ(browser.CounterText(), u"0/0"_s);
    for (const Str text : {Str::ActionEditAll, Str::ActionAggregate, Str::ActionFilterExpression,
                           Str::ActionSortExpression, Str::ActionExportCsv})
        EXPECT_FALSE(ActionOf(text)->isEnabled()) << StringText(text).toStdString();
    EXPECT_TRUE(ActionOf(Str::ActionNewRecord)->isEnabled());
}

TEST_F(ResultCommandsTest, ChangesNothingWhereTheResultCannotBeChanged)
{
    EXPECT_TRUE(view.OpenStatement(u"Q"_s, u"SELECT Member,MAX(Age) AS Oldest FROM People GROUP BY Member"_s));
    EXPECT_FALSE(ActionOf(Str::ActionEditAll)->isEnabled());
    EXPECT_TRUE(ActionOf(Str::ActionAggregate)->isEnabled());
    EXPECT_TRUE(ActionOf(Str::ActionExportCsv)->isEnabled());
}

TEST_F(ResultCommandsTest, FiltersByAnExpressionThatBeginsWithTheCell)
{
    Select(Age);
    InDialog<CFilterDialog>([&] { QTest::keyClick(&view, Qt::Key_F, Qt::ControlModifier | Qt::ShiftModifier); },
                            [](CFilterDialog& dialog) {
                                EXPECT_EQ(dialog.Condition(), u"People.Age = 21"_s);
                                QComboBox* operators = dialog.findChild<FilterTerm*>()->findChild<QComboBox*>();
                                operators->setCurrentText(u">="_s);
                                dialog.findChild<FilterTerm*>()->SetValue(u"fourty"_s);
                                Accept(dialog);
                                EXPECT_TRUE(dialog.isVisible());
                                EXPECT_EQ(dialog.findChild<ErrorLine*>()->Text(), u"not a number: fourty"_s);
                                dialog.findChild<FilterTerm*>()->SetValue(u"40"_s);
                                Accept(dialog);
                            });
    EXPECT_EQ(browser.Conditions(), QStringList(u"People.Age >= 40"_s));
    EXPECT_EQ(browser.CounterText(), u"1/4"_s);
    InDialog<CFilterDialog>([&] { ActionOf(Str::ActionFilterExpression)->trigger(); },
                            [](CFilterDialog& dialog) {
                                dialog.findChild<QTabWidget*>()->setCurrentIndex(1);
                                auto* expression = dialog.findChild<QPlainTextEdit*>();
                                expression->setPlainText(u"Age >> 41"_s);
                                Accept(dialog);
                                EXPECT_TRUE(dialog.isVisible()) << "what was typed is not lost";
                                EXPECT_EQ(expression->textCursor().selectionStart(), 5);
                                expression->clear();
                                Accept(dialog);
                            });
    EXPECT_EQ(browser.Conditions().size(), 1) << "no expression, no filter";
}

TEST_F(ResultCommandsTest, SortsByAnExpression)
{
    InDialog<CSortDialog>([&] { ActionOf(Str::ActionSortExpression)->trigger(); },
                          [](CSortDialog& dialog) {
                              const QList<PickBox*> boxes = dialog.findChildren<PickBox*>();
                              boxes[0]->setCurrentIndex(3);
                              Q_EMIT boxes[0]->activated(3); // Member
                              Q_EMIT boxes[0]->activated(3);
                              Q_EMIT boxes[1]->textActivated(u"DESC"_s);
                              EXPECT_EQ(dialog.Terms(), u"People.Member ,People.Member DESC "_s);
                              dialog.findChild<QLineEdit*>()->setText(u"Member, Age DESC"_s);
                              dialog.accept();
                          });
    EXPECT_EQ(browser.Statement(), u"SELECT * FROM People ORDER BY Member, Age DESC"_s);
    EXPECT_EQ(Line(), u"P23"_s);
}

TEST_F(ResultCommandsTest, SavesAndOpensQueries)
{
    EXPECT_FALSE(ActionOf(Str::ActionSaveQuery)->isEnabled()) << "nowhere to save to";
    view.SetStore(store);
    EXPECT_FALSE(ActionOf(Str::ActionOpenQuery)->isEnabled()) << "nothing to open";
    int changes = 0;
    QObject::connect(&view, &CTableView::queriesChanged, &view, [&changes] { ++changes; });
    Select(Born);
    ActionOf(Str::ActionHideColumn)->trigger();
    prompt.texts = {u"No dates"_s};
    ActionOf(Str::ActionSaveQuery)->trigger();
    EXPECT_EQ(prompt.questions, QStringList(u"Save as/Query Name:"_s));
    EXPECT_EQ(changes, 1);
    ASSERT_EQ(store.Queries().size(), 1U);
    EXPECT_EQ(store.Queries()[0].tableName.Text(), u"People"_s);
    EXPECT_EQ(store.Queries()[0].text.Text(), u"SELECT Name,Age,Member,Note FROM People"_s);
    ActionOf(Str::ActionShowAll)->trigger();
    InDialog<QDialog>([&] { ActionOf(Str::ActionOpenQuery)->trigger(); },
                      [](QDialog& dialog) {
                          EXPECT_EQ(dialog.findChild<QListWidget*>()->currentItem()->text(), u"No dates"_s);
                          dialog.accept();
                      });
    EXPECT_EQ(browser.FieldCount(), 4);
    EXPECT_TRUE(view.windowTitle().startsWith(u"No dates"_s));
}

TEST_F(ResultCommandsTest, ShowsTheEditorsOfTheChosenField)
{
    const auto apply = [](const QString&) { return true; };
    CFilterDialog dialog(lists, u"People"_s, u"Born"_s, u"7/4/1501 9:05:00 AM"_s, apply, &view);
    dialog.show();
    const QList<FilterTerm*> terms = dialog.findChildren<FilterTerm*>();
    ASSERT_EQ(terms.size(), 3);
    EXPECT_TRUE(terms[0]->findChild<DateField*>()->findChild<QToolButton*>()->isVisible());
    EXPECT_EQ(dialog.Condition(), u"People.Born = '7/4/1501 9:05:00 AM'"_s) << "its time, and any year";
    EXPECT_FALSE(terms[1]->isEnabled());
    dialog.findChild<QCheckBox*>()->click();
    EXPECT_FALSE(terms[0]->isEnabled());
    EXPECT_EQ(dialog.Condition(),
              u"People.Born >= '7/4/1501 9:05:00 AM' AND People.Born <= '7/4/1501 9:05:00 AM'"_s);

    CFilterDialog ticked(lists, u"People"_s, u"Member"_s, u"Yes"_s, apply, &view);
    EXPECT_EQ(ticked.Condition(), u"People.Member is true"_s);
    EXPECT_FALSE(ticked.findChild<FilterTerm*>()->findChild<QLineEdit*>()->isEnabled());
}

TEST_F(ResultCommandsTest, TakesAWordOnlyWhenItIsChosenFromTheList)
{
    PickBox box;
    box.addItems({u"AND"_s, u"OR"_s});
    box.show();
    QStringList taken;
    QObject::connect(&box, &QComboBox::textActivated, &box, [&taken](const QString& word) { taken += word; });
    QTest::keyClick(&box, Qt::Key_Down);
    EXPECT_TRUE(box.view()->isVisible());
    EXPECT_EQ(taken, QStringList());
    QTest::keyClick(box.view(), Qt::Key_Down);
    QTest::keyClick(box.view(), Qt::Key_Return);
    EXPECT_EQ(taken, QStringList(u"OR"_s));
    QTest::keyClick(&box, Qt::Key_A);
    EXPECT_EQ(taken.size(), 1);
}

TEST_F(ResultCommandsTest, LeadsThroughTheStepsOfAnExport)
{
    ExportDraft draft(connection, path, prompt);
    ASSERT_TRUE(draft.SetSource(u"SELECT Name,Age FROM People"_s));
    CExportWizard wizard(draft, u"People"_s, path, {}, &view);
    wizard.show();
    const auto button = [&wizard](Str text) {
        const QList<QPushButton*> buttons = wizard.findChildren<QPushButton*>();
        return *std::ranges::find(buttons, StringText(text), &QPushButton::text);
    };
    EXPECT_EQ(wizard.findChild<QTreeWidget*>()->topLevelItemCount(), 2);
    EXPECT_FALSE(button(Str::WizardNext)->isEnabled()) << "no file yet";
    EXPECT_FALSE(button(Str::ExportQuery)->isEnabled());
    EXPECT_TRUE(draft.ChoosePath(folder.filePath(u"missing/people.csv"_s)));

    CExportWizard ready(draft, u"People"_s, path, {}, &view);
    ready.show();
    const auto next = [&ready] {
        const QList<QPushButton*> buttons = ready.findChildren<QPushButton*>();
        return *std::ranges::find_if(buttons, [](const QPushButton* each) { return each->isDefault(); });
    };
    next()->click();
    auto* preview = ready.findChild<QListWidget*>();
    EXPECT_EQ(preview->item(0)->text(), u"\"P1\",21"_s);
    EXPECT_EQ(preview->count(), 11);
    ready.findChild<QCheckBox*>()->click();
    EXPECT_EQ(preview->item(0)->text(), u"\"Name\",\"Age\""_s);
    ready.findChildren<QRadioButton*>()[1]->click();
    EXPECT_EQ(preview->item(1)->text(), u"\"P1\";21"_s);
    next()->click();
    EXPECT_TRUE(ready.isVisible()) << "the file cannot be made: the user chooses another";
    EXPECT_TRUE(draft.ChoosePath(folder.filePath(u"people.csv"_s)));
    next()->click();
    EXPECT_FALSE(ready.isVisible());
    EXPECT_EQ(prompt.shown.last(), u"25 record(s) exported."_s);
}

TEST_F(ResultCommandsTest, OffersSeparatorsOnlyForOrdersThatHaveThem)
{
    CCsvOptionsDialog dialog({}, &view);
    const QList<QComboBox*> dates = dialog.findChild<QGroupBox*>()->findChildren<QComboBox*>(); // and separators
    EXPECT_FALSE(dates[1]->isEnabled());
    dates[0]->setCurrentIndex(4);
    Q_EMIT dates[0]->activated(4);
    EXPECT_TRUE(dates[1]->isEnabled());
    EXPECT_EQ(dates[1]->currentText(), u"-"_s);
    EXPECT_EQ(dialog.Chosen().dates, (DateFormat{DateOrder::DayMonthYear, u'-', u':'}));
    const QList<QComboBox*> boxes = dialog.findChildren<QComboBox*>();
    QComboBox* quote = *std::ranges::find(boxes, u"\""_s, &QComboBox::currentText);
    quote->setCurrentIndex(0);
    Q_EMIT quote->activated(0);
    EXPECT_TRUE(dialog.Chosen().quote.isNull());
    EXPECT_FALSE(dialog.findChild<QCheckBox*>()->isEnabled());
}

TEST_F(ResultCommandsTest, FillsAHandheldsWindowAndNoMore)
{
    view.resize(240, 320);
    ExportDraft draft(connection, path, prompt);
    ASSERT_TRUE(draft.SetSource(u"SELECT * FROM People"_s));
    CExportWizard wizard(draft, u"People"_s, path, {}, &view);
    CFilterDialog filter(
        lists, u"People"_s, u"Note"_s, longNote, [](const QString&) { return true; }, &view);
    CSortDialog sort(lists, u"People"_s, u"Age"_s, &view);
    CCsvOptionsDialog options({}, &view);
    for (QDialog* dialog : std::initializer_list<QDialog*>{&wizard, &filter, &sort, &options}) {
        dialog->resize(240, 320);
        dialog->show();
        QCoreApplication::processEvents();
        EXPECT_EQ(dialog->size(), QSize(240, 320)) << dialog->windowTitle().toStdString();
    }
    QMenu* tools = ActionOf(Str::ActionEditAll)->menu();
    EXPECT_LE(tools->sizeHint().width(), 240);
}

} // namespace
} // namespace mirel
