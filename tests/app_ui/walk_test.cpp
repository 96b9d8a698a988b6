// Walks through every window and dialog at a handheld's sizes and at a desktop's: all of it within the window, no
// text cut without a sign and a way to read it, each control named and reached by the keyboard.
//
// With MIREL_PICTURES=<folder> in the environment each of them is painted there, to be looked at.
#include "app/ui/colors_dialog.h"
#include "app/ui/fonts_dialog.h"
#include "app/ui/look.h"
#include "app/ui/message_box_prompt.h"
#include "csvimport/ui/import_options_dialog.h"
#include "csvimport/ui/import_wizard.h"
#include "data/filter_condition.h"
#include "forms/default_form.h"
#include "forms/form_store.h"
#include "forms/ui/expression_desk_dialog.h"
#include "forms/ui/field_list.h"
#include "forms/ui/form_eng_view.h"
#include "forms/ui/form_mak_view.h"
#include "forms/ui/form_options_dialog.h"
#include "forms/ui/property_sheet.h"
#include "help/help_topics.h"
#include "help/ui/help_desk.h"
#include "platform/ui/day_chooser.h"
#include "platform/ui/window_place.h"
#include "querybuilder/ui/query_dialog.h"
#include "resources/string_table.h"
#include "support/ui/screen_checks.h"
#include "support/ui/spoken_in_windows.h"
#include "support/ui/window_sizes.h"
#include "tableeditor/ui/field_dialog.h"
#include "tableview/export_draft.h"
#include "tableview/people_fixture.h"
#include "tableview/ui/csv_options_dialog.h"
#include "tableview/ui/export_wizard.h"
#include "tableview/ui/filter_dialog.h"
#include "tableview/ui/go_to_dialog.h"
#include "tableview/ui/open_query_dialog.h"
#include "tableview/ui/options_dialog.h"
#include "tableview/ui/record_grid.h"
#include "tableview/ui/sort_dialog.h"
#include "tableview/ui/statement_dialog.h"
#include "tableview/ui/table_view.h"

#include <QApplication>
#include <QCheckBox>
#include <QDialogButtonBox>
#include <QPlainTextEdit>
#include <QPushButton>
#include <QTabWidget>
#include <QTest>
#include <QTimer>

namespace mirel {
namespace {

using namespace Qt::StringLiterals;

class Walk : public PeopleFixture {
protected:
    void SetUp() override
    {
        before_ = QApplication::palette();
        ASSERT_TRUE(UsePalette(u"light"));
    }
    void TearDown() override
    {
        QApplication::setStyle(u"Fusion"_s);
        QApplication::setPalette(before_);
    }

    // A dialog over a window of each size, as its command brings it up.
    template <typename Make>
    void ExpectDialogFits(const QString& name, Make make)
    {
        for (const QSize size : sizes_) {
            QWidget window;
            window.resize(size);
            window.show();
            const std::unique_ptr<QDialog> dialog(make(window));
            FillSmallWindow(*dialog, window);
            dialog->show();
            ExpectFits(*dialog, prefix_ + name, size);
            for (const QWidget* part : dialog->findChildren<QWidget*>())
                said_ += HelpDesk::TextOf(*part);
        }
    }
    // Every row on a control of these dialogs has met its control.
    void ExpectSomethingWasSaidOf(const QStringList& dialogs)
    {
        for (const ControlHelp& row : ControlHelps()) {
            if (dialogs.contains(QStringView(row.viewClass))) {
                EXPECT_TRUE(said_.contains(StringText(row.text)))
                    << QStringView(row.viewClass).toUtf8().toStdString() << ": "
                    << StringText(row.label).toStdString();
            }
        }
    }
    void GoThroughTheDialogs();
    void GoThroughTheTableView();
    void GoThroughTheFormMaker();

    void MakeLongNames()
    {
        Run(u"CREATE TABLE [Long names] ([The first of two very long field names, of which the end tells] Float,"
            "[The first of two very long field names, of which the other end tells] Varchar(200),[Photo] Long Varbinary)"_s);
        for (const QString& values :
             {u"1234.5,'%1',NULL"_s.arg(QString(180, u'x')), u"7,NULL,NULL"_s, u"-0.125,'two\nlines',NULL"_s})
            Run(u"INSERT INTO [Long names] VALUES(%1)"_s.arg(values));
    }

    HelpDesk desk_{*qobject_cast<QApplication*>(QCoreApplication::instance())}; // its button is in the dialogs
    QPalette before_;
    QList<QSize> sizes_{kWindowSizes.begin(), kWindowSizes.end()};
    QString prefix_; // of the pictures
    QSet<QString> said_;
};

// In a language whose words are longer.
class WalkInGerman : public Walk {
protected:
    WalkInGerman()
    {
        sizes_ = {kHandheld, kDesktop};
        prefix_ = u"de-"_s;
    }

    const SpokenInWindows german_{u"de"_s};
};

TEST_F(Walk, GoesThroughTheDialogs)
{
    GoThroughTheDialogs();
}

TEST_F(WalkInGerman, GoesThroughTheDialogs)
{
    GoThroughTheDialogs();
}

void Walk::GoThroughTheDialogs()
{
    FieldLists lists(connection, path, prompt);
    FormStore store(folder.filePath(u"walk.raf"_s));
    ExportDraft draft(connection, path, prompt);
    ASSERT_TRUE(draft.SetSource(u"SELECT * FROM People"_s));
    const auto apply = [](const QString&) { return true; };
    ExpectDialogFits(u"table-options"_s, [](QWidget& window) { return new COptionsDialog({}, &window); });
    ExpectDialogFits(u"form-options"_s, [](QWidget& window) { return new CFormOptionsDialog({}, &window); });
    ExpectDialogFits(u"go"_s, [](QWidget& window) { return new CGoToDialog(9999999, &window); });
    ExpectDialogFits(u"sort"_s,
                     [&](QWidget& window) { return new CSortDialog(lists, u"People"_s, u"Name"_s, &window); });
    ExpectDialogFits(u"query"_s, [](QWidget& window) {
        return new COpenQueryDialog({QString(200, u'q'), u"Second"_s}, &window);
    });
    for (const int tab : {0, 1, 2}) {
        std::unique_ptr<QueryDraft> query;
        ExpectDialogFits(u"query-builder-%1"_s.arg(tab), [&](QWidget& window) {
            query = std::make_unique<QueryDraft>(
                QueryRequest{.name = u"Q"_s, .statement = u"SELECT People.Name FROM People WHERE Age > 5"_s},
                prompt);
            auto* dialog = new CQueryDialog(*query, {connection, path, store, prompt}, {}, &window);
            auto* tabs = dialog->findChild<QTabWidget*>();
            tabs->setCurrentIndex(tabs->isTabVisible(tab) ? tab : 0);
            return dialog;
        });
    }
    ExpectDialogFits(u"statement"_s, [](QWidget& window) {
        return new CStatementDialog(u"SELECT "_s + QString(5000, u'x'), CStatementDialog::Edit::Offered, &window);
    });
    ExpectDialogFits(u"colors"_s, [](QWidget& window) {
        return new CColorsDialog({}, CColorsDialog::Unset::Offered, &window);
    });
    ExpectDialogFits(u"fonts"_s, [](QWidget& window) { return new CFontsDialog({}, &window); });
    ExpectDialogFits(u"csv-options"_s, [](QWidget& window) { return new CCsvOptionsDialog({}, &window); });
    ExpectDialogFits(u"import-options"_s, [](QWidget& window) { return new CImportOptionsDialog({}, &window); });
    ImportDraft import(connection, path, prompt);
    ASSERT_TRUE(import.Choose(ImportSource::OfText(u"Name\tAge\nAnn Something\t5\n"_s)));
    for (int step = 0; step < 4; ++step) {
        ExpectDialogFits(u"import-%1"_s.arg(step + 1), [&](QWidget& window) {
            auto* wizard = new CImportWizard(import, prompt, path, &window);
            for (int i = 0; i < step; ++i) {
                for (QPushButton* button : wizard->findChildren<QPushButton*>()) {
                    if (button->text() == StringText(Str::WizardNext))
                        button->click();
                }
            }
            return wizard;
        });
    }
    ExpectDialogFits(u"export"_s,
                     [&](QWidget& window) { return new CExportWizard(draft, u"People"_s, path, {}, &window); });
    for (const QString& field : {u"Name"_s, u"Born"_s, u"Member"_s}) {
        ExpectDialogFits(u"filter-"_s + field, [&](QWidget& window) {
            auto* dialog = new CFilterDialog(lists, u"People"_s, field, u"7/4/2001"_s, apply, &window);
            dialog->findChild<QCheckBox*>()->setChecked(field == u"Born");
            return dialog;
        });
    }
    ExpectDialogFits(u"filter-advanced"_s, [&](QWidget& window) {
        auto* dialog = new CFilterDialog(lists, u"People"_s, u"Name"_s, u"x"_s, apply, &window);
        dialog->findChild<QTabWidget*>()->setCurrentIndex(1);
        dialog->findChild<QPlainTextEdit*>()->setPlainText(u"Age >> 5"_s);
        dialog->findChild<QDialogButtonBox*>()->button(QDialogButtonBox::Ok)->click();
        return dialog;
    });
    ExpectDialogFits(u"field"_s, [](QWidget& window) {
        return new CFieldDialog(
            StringText(Str::DesignNewFieldTitle), {}, CFieldDialog::Focus::Name,
            [](const FieldDesign&) { return true; }, &window);
    });
    ExpectSomethingWasSaidOf({u"CFilterDialog"_s, u"CSortDialog"_s, u"COptionsDialog"_s, u"CFormOptionsDialog"_s,
                              u"CCsvOptionsDialog"_s, u"CImportOptionsDialog"_s, u"CQueryDialog"_s,
                              u"CColorsDialog"_s, u"CFieldDialog"_s});
}

TEST_F(Walk, GoesThroughTheTableView)
{
    GoThroughTheTableView();
}

TEST_F(WalkInGerman, GoesThroughTheTableView)
{
    GoThroughTheTableView();
}

void Walk::GoThroughTheTableView()
{
    MakeLongNames();
    for (const QSize size : QList{QSize(200, 200), QSize(4000, 3000)} + sizes_) {
        CTableView view(connection, path, prompt, {});
        view.resize(size);
        ASSERT_TRUE(view.OpenTable(u"Long names"_s));
        view.show();
        auto* grid = view.findChild<RecordGrid*>();
        const auto command = [&](Str text) {
            for (QAction* action : view.actions()) {
                if (action->text() == StringText(text))
                    action->trigger();
            }
        };
        ExpectFits(view, prefix_ + u"table"_s, size);
        grid->setFocus();
        QTest::keyClicks(grid, u"abc"_s);
        QTest::keyClick(QApplication::focusWidget(), Qt::Key_Return);
        ExpectFits(view, prefix_ + u"table-refused"_s, size);
        QTest::keyClick(QApplication::focusWidget(), Qt::Key_Escape);
        command(Str::ActionFind);
        ExpectFits(view, prefix_ + u"table-find"_s, size);
        QTest::keyClick(QApplication::focusWidget(), Qt::Key_Escape);
        command(Str::ActionDetail);
        ExpectFits(view, prefix_ + u"table-detail"_s, size);
        command(Str::ActionList);
        grid->setFocus();
        QTest::keyClick(grid, Qt::Key_Right);
        command(Str::ZoomIn);
        ExpectFits(view, prefix_ + u"table-zoom"_s, size);
        command(Str::ZoomBack);
        command(Str::ActionFilterBy);
        ExpectFits(view, prefix_ + u"table-filtered"_s, size);
    }
}

// Fonts of any size, the other direction of reading, the most columns and the longest names that a table has: all
// of it is drawn, and the selection comes into sight.
TEST_F(Walk, BearsOddFontsDirectionsAndTables)
{
    QStringList columns;
    for (int i = 0; i < 2000; ++i)
        columns += u"[%1 %2] Varchar(9)"_s.arg(QString(240, u'n'), QString::number(i));
    Run(u"CREATE TABLE Wide (%1)"_s.arg(columns.join(u',')));
    Run(u"INSERT INTO Wide ([%1 0]) VALUES('x')"_s.arg(QString(240, u'n')));
    Run(u"UPDATE People SET Note='%1' WHERE Name='P2'"_s.arg(QString(1'000'000, u'm')));
    const QFont usual = QApplication::font();
    for (const int points : {6, 9, 36}) {
        for (const Qt::LayoutDirection direction : {Qt::LeftToRight, Qt::RightToLeft}) {
            QFont font = usual;
            font.setPointSize(points);
            QApplication::setFont(font);
            QApplication::setLayoutDirection(direction);
            for (const QString& table : {u"Wide"_s, u"People"_s}) {
                CTableView view(connection, path, prompt, {.maxColumnChars = TableViewSettings::kNoColumnLimit});
                view.resize(kHandheld);
                ASSERT_TRUE(view.OpenTable(table));
                view.show();
                auto* grid = view.findChild<RecordGrid*>();
                grid->setFocus();
                QTest::keyClick(grid, Qt::Key_End);
                QApplication::processEvents();
                const RecordBrowser& browser = view.Browser();
                const QRect cell = grid->CellRect(0, browser.SelectedColumn());
                EXPECT_TRUE(cell.intersects(grid->viewport()->rect())) << table.toStdString() << " " << points;
                EXPECT_LE(cell.width(), grid->viewport()->width()) << table.toStdString() << " " << points;
                Paint(view, u"odd-%1-%2-%3"_s.arg(table, QString::number(points),
                                                  direction == Qt::LeftToRight ? u"left"_s : u"right"_s));
            }
        }
    }
    QApplication::setFont(usual);
    QApplication::setLayoutDirection(Qt::LeftToRight);
}

TEST_F(Walk, GoesThroughTheMessageBoxes)
{
    MessageBoxPrompt boxes;
    for (const QSize size : kWindowSizes) {
        QWidget window;
        window.resize(size);
        window.show();
        ASSERT_TRUE(QTest::qWaitForWindowActive(&window));
        int met = 0;
        const auto look = [&](const QString& name) {
            QTimer::singleShot(0, &window, [&met, name, size] {
                QWidget* box = QApplication::activeModalWidget();
                ASSERT_TRUE(box);
                ++met;
                ExpectFits(*box, name, size);
                box->close();
            });
        };
        look(u"box-error"_s);
        boxes.ShowErrorWithReason(u"Error: (80040E07)the field \"Flight Date\""_s,
                                  u"Flight Date: not a date: 31.31.99"_s);
        look(u"box-long"_s);
        boxes.ShowError(QString(u"A path without a blank: "_s) + QString(3000, u'p'));
        look(u"box-question"_s);
        (void)boxes.AskYesNoWith({Str::DeleteAllReally, {u"10000"_s}}, {.note = u"Undo takes this back."_s});
        look(u"box-three-answers"_s);
        (void)boxes.AskYesNoOr({Str::RenameMendQuestion, {u"Name"_s, u"Form \"Entry\" (7)"_s, u"Full Name"_s}},
                               {Str::RenameAlone, {}});
        look(u"box-text"_s);
        (void)boxes.AskText({Str::SaveQueryTitle, {}}, {Str::SaveQueryPrompt, {}}, QString(200, u'q'));
        EXPECT_EQ(met, 5);
    }
}

TEST_F(Walk, SeesTheWholeCalendarOnAHandheld)
{
    QWidget window;
    window.resize(kHandheld);
    window.show();
    QTimer::singleShot(0, &window, [] {
        QWidget* popup = QApplication::activePopupWidget();
        ASSERT_TRUE(popup);
        Paint(*popup, u"calendar"_s);
        EXPECT_LE(popup->sizeHint().width(), kHandheld.width());
        EXPECT_LE(popup->sizeHint().height(), kHandheld.height());
        popup->close();
    });
    EXPECT_FALSE(ChooseDay(u"2/3/1499"_s, window.pos(), window));
}

TEST_F(Walk, GoesThroughTheFormMaker)
{
    GoThroughTheFormMaker();
}

TEST_F(WalkInGerman, GoesThroughTheFormMaker)
{
    GoThroughTheFormMaker();
}

void Walk::GoThroughTheFormMaker()
{
    FormStore store(folder.filePath(u"walk.raf"_s));
    std::optional<FormDef> form = DefaultFormOf(connection, path, u"People"_s, prompt);
    ASSERT_TRUE(form);
    ControlDef list;
    list.type = ControlType::List;
    list.SetSource(JoinListColumns({{u"Name"_s, u"People.Name"_s}}));
    form->AddControl(list);
    ControlDef items;
    items.type = ControlType::DropDownBox;
    items.SetSource(JoinDropDown({u"SELECT Name FROM People"_s, u"a"_s}));
    form->AddControl(items);
    ControlDef call;
    call.type = ControlType::Button;
    call.buttonFunction = ButtonFunction::CallForm;
    form->AddControl(call);
    FormMaker maker(*form, FormMaker::Start::New, {connection, path, store, prompt});
    ExpressionDesk desk(connection, path, {});
    const MakerDialogs dialogs;
    for (int control = -1; control < maker.Design().Count(); ++control) {
        if (control < 0)
            maker.Design().SelectNone();
        else
            maker.Design().SelectOnly(control);
        ExpectDialogFits(u"maker-sheet-%1"_s.arg(control),
                         [&](QWidget& window) { return new CPropertySheet(maker, desk, dialogs, &window); });
    }
    ExpectDialogFits(u"maker-fields"_s,
                     [&](QWidget& window) { return new CFieldsDialog(maker.Fields(), &window); });
    int number = 0;
    for (const QString& text : {u"UPPER(Name)+' '+TO_CHAR(Age)"_s, u"[Nmae]+SUM(Age) Name"_s, QString()}) {
        ExpectDialogFits(u"maker-desk-%1"_s.arg(++number), [&](QWidget& window) {
            auto* dialog = new CExpressionDesk(desk, maker, {.text = text}, &window);
            dialog->findChild<QTabWidget*>()->setCurrentIndex(number);
            return dialog;
        });
    }
    ExpectSomethingWasSaidOf({u"CPropertySheet"_s, u"CExpressionDesk"_s});
    for (const QSize size : sizes_) {
        CFormMakView view(*form, FormMaker::Start::New,
                          {.maker = {connection, path, store, prompt}, .dialogs = {}, .words = {}});
        view.resize(size);
        view.show();
        ExpectFits(view, prefix_ + u"maker"_s, size);
        view.GiveUpEdits();
    }
}

} // namespace
} // namespace mirel
