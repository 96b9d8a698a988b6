// A form with every kind of control, made from nothing, run, and ten records entered in it: in the window alone,
// by mouse and keyboard on a desktop and by stylus on a handheld.
//
// With MIREL_PICTURES=<folder> in the environment each station is painted there, to be looked at.
#include "app/ui/look.h"
#include "app/ui/main_frame.h"
#include "app/ui/shell_actions.h"
#include "app/ui/view_tabs.h"
#include "data/db_recordset.h"
#include "forms/control_types.h"
#include "forms/ui/design_surface.h"
#include "forms/ui/form_eng_view.h"
#include "forms/ui/form_mak_view.h"
#include "forms/ui/form_surface.h"
#include "forms/ui/property_sheet.h"
#include "querybuilder/ui/query_dialog.h"
#include "querybuilder/ui/statement_edit.h"
#include "resources/string_table.h"
#include "support/printing.h"
#include "support/scripted_prompt.h"
#include "support/ui/window_sizes.h"

#include <gtest/gtest.h>

#include <QApplication>
#include <QCheckBox>
#include <QClipboard>
#include <QComboBox>
#include <QDir>
#include <QLineEdit>
#include <QMenu>
#include <QPlainTextEdit>
#include <QPushButton>
#include <QScrollArea>
#include <QSpinBox>
#include <QTableWidget>
#include <QTemporaryDir>
#include <QTest>
#include <QTimer>
#include <QToolBar>
#include <QToolButton>

namespace mirel {
namespace {

using namespace Qt::StringLiterals;

class FormMakerWindow : public ::testing::TestWithParam<QSize> {
protected:
    static void SetUpTestSuite() { QApplication::setStyle(new TouchTargetStyle(u"Fusion"_s)); }

    void SetUp() override
    {
        before_ = QApplication::palette();
        ASSERT_TRUE(UsePalette(u"light"));
        ASSERT_TRUE(commands_.NewDatabase(PathOf(u"shop.cdb"_s)));
        ASSERT_TRUE(session_.GetCatalog().ExecuteStatement(
            session_.Location(),
            u"CREATE TABLE [Birds] ([Name] Varchar(40),[Seen] Datetime,[Wild] Bit,[Size] Varchar(10),[Wings] SmallInt)"_s));
        commands_.Refill();
        state_.SetTab(MainTab::Table);
        state_.Select({EntryKind::Table, u"Birds"_s, {}, false});
        state_.SetTab(MainTab::Form);
        frame_.setWindowState(Qt::WindowNoState);
        frame_.resize(GetParam());
        frame_.show();
        frame_.ShowState();
        ASSERT_TRUE(QTest::qWaitForWindowActive(&frame_));
    }
    void TearDown() override
    {
        prompt_.answers = {false, false, false, false};
        frame_.close();
        QApplication::setStyle(u"Fusion"_s);
        QApplication::setPalette(before_);
    }

    bool IsSmall() const { return GetParam() == kHandheld; }
    QString PathOf(const QString& name) const { return QDir(folder_.path()).filePath(name); }
    void Paint(QWidget& shown, const QString& station)
    {
        const QString folder = qEnvironmentVariable("MIREL_PICTURES");
        QApplication::processEvents();
        if (folder.isEmpty())
            return;
        const QString name = u"maker-%1-%2-%3.png"_s.arg(QString::number(GetParam().width()),
                                                         QString::number(++pictures_), station);
        EXPECT_TRUE(shown.grab().save(QDir(folder).filePath(name)));
    }

    // --- what the user does -------------------------------------------------------------------------------

    static QString Plain(Str text) { return StringText(text).remove(u'&'); }

    void New()
    {
        prompt_.answers = {true};
        for (QAction* action : frame_.findChildren<QAction*>()) {
            if (action->text() == StringText(Str::CommandNew))
                return action->trigger();
        }
        FAIL() << "no New";
    }
    CFormMakView* Maker() const
    {
        const QList<CFormMakView*> makers = frame_.findChildren<CFormMakView*>();
        return makers.isEmpty() ? nullptr : makers.last();
    }
    CFormEngView* Running() const
    {
        const QList<CFormEngView*> running = frame_.findChildren<CFormEngView*>();
        return running.isEmpty() ? nullptr : running.last();
    }
    // An entry of one of the view's menus that are there now.
    static QAction* Entry(HostedView& view, Str text)
    {
        for (const QMenu* menu : view.Menus()) {
            if (!menu->menuAction()->isVisible())
                continue;
            for (QAction* action : menu->actions()) {
                if (action->text() == StringText(text))
                    return action;
            }
        }
        return nullptr;
    }
    void Give(Str text)
    {
        QAction* entry = Entry(*Maker(), text);
        ASSERT_TRUE(entry) << StringText(text).toStdString();
        ASSERT_TRUE(entry->isEnabled()) << StringText(text).toStdString();
        entry->trigger();
    }
    QPoint OnSurface(QPoint form) const { return (QPointF(form) * Maker()->Surface().Zoom()).toPoint(); }
    void Place(Str command, QPoint at)
    {
        Maker()->Maker().Design().SelectNone();
        Maker()->Surface().ShowState();
        for (QToolButton* button : Maker()->findChildren<QToolButton*>()) {
            if (button->defaultAction() && button->defaultAction()->text() == StringText(command))
                button->defaultAction()->trigger();
        }
        const int before = Maker()->Maker().Design().Count();
        QTest::mouseClick(&Maker()->Surface(), Qt::LeftButton, {}, OnSurface(at));
        ASSERT_EQ(Maker()->Maker().Design().Count(), before + 1) << StringText(command).toStdString();
    }
    void Drag(QPoint from, QPoint to)
    {
        DesignSurface& surface = Maker()->Surface();
        QTest::mousePress(&surface, Qt::LeftButton, {}, OnSurface(from));
        QTest::mouseMove(&surface, OnSurface((from + to) / 2));
        QMouseEvent half(QEvent::MouseMove, OnSurface((from + to) / 2),
                         surface.mapToGlobal(OnSurface((from + to) / 2)), Qt::NoButton, Qt::LeftButton, {});
        QApplication::sendEvent(&surface, &half);
        QMouseEvent last(QEvent::MouseMove, OnSurface(to), surface.mapToGlobal(OnSurface(to)), Qt::NoButton,
                         Qt::LeftButton, {});
        QApplication::sendEvent(&surface, &last);
        QTest::mouseRelease(&surface, Qt::LeftButton, {}, OnSurface(to));
    }
    // The property sheet of what is selected: beside the surface, or over it.
    void InSheet(const std::function<void(QWidget& sheet)>& edit)
    {
        if (!IsSmall()) {
            QApplication::processEvents();
            edit(*Maker()->findChild<PropertySheet*>());
            QApplication::processEvents();
            return;
        }
        bool met = false;
        QTimer::singleShot(0, &frame_, [&] {
            auto* sheet = qobject_cast<CPropertySheet*>(QApplication::activeModalWidget());
            ASSERT_TRUE(sheet);
            met = true;
            edit(*sheet);
            QApplication::processEvents();
            Paint(*sheet, u"sheet"_s);
            sheet->accept();
        });
        QTest::keyClick(&Maker()->Surface(), Qt::Key_Return);
        EXPECT_TRUE(met);
    }
    template <typename Widget>
    static Widget* Named(QWidget& sheet, Str caption)
    {
        QApplication::processEvents(); // a line that came with the one before
        for (Widget* widget : sheet.findChildren<Widget*>()) {
            if (widget->accessibleName() == StringText(caption) && widget->isVisibleTo(&sheet))
                return widget;
        }
        ADD_FAILURE() << "no " << StringText(caption).toStdString();
        return nullptr;
    }
    static void TypeInto(QWidget* widget, const QString& text)
    {
        ASSERT_TRUE(widget);
        widget->setFocus();
        QTest::keyClick(widget, Qt::Key_A, Qt::ControlModifier);
        QTest::keyClicks(widget, text);
    }
    // With the arrow keys, as far as it takes; the sheet may put other lines around the one they are in.
    static void Pick(QWidget& sheet, Str caption, const QString& text)
    {
        QComboBox* box = Named<QComboBox>(sheet, caption);
        ASSERT_TRUE(box);
        box->setFocus();
        const int index = box->findText(text);
        ASSERT_GE(index, 0) << text.toStdString();
        for (int step = 0; step < 40 && box && box->currentIndex() != index; ++step) {
            QTest::keyClick(box, box->currentIndex() < index ? Qt::Key_Down : Qt::Key_Up);
            box = Named<QComboBox>(sheet, caption);
            ASSERT_TRUE(box && box->hasFocus());
        }
    }
    static void Press(QWidget& sheet, Str text)
    {
        QApplication::processEvents();
        for (auto* button : sheet.findChildren<QPushButton*>()) {
            if (button->text() == StringText(text) && button->isVisibleTo(&sheet))
                return button->click();
        }
        ADD_FAILURE() << "no button " << StringText(text).toStdString();
    }

    // --- stations -----------------------------------------------------------------------------------------

    void MakeForm();
    void EnterRecords();

    QString Value(const QString& statement)
    {
        DbRecordset rows(connection_);
        EXPECT_TRUE(rows.Open(statement, session_.Location(), CursorType::ForwardOnly, LockType::ReadOnly));
        return rows.IsEof() ? u"none"_s : rows.ValueText(0);
    }

    QTemporaryDir folder_;
    ProgramFolder programFolder_{folder_.path()};
    ScriptedPrompt prompt_;
    Profile profile_{programFolder_.ProfileFile()};
    Settings settings_{profile_};
    DbConnection connection_;
    DatabaseSession session_{connection_, programFolder_, prompt_};
    MainViewState state_;
    MainViewCommands commands_{session_, state_, settings_, SampleDatabase(programFolder_, {})};
    CMainFrame frame_{session_, state_, commands_, settings_, profile_};
    QPalette before_;
    int pictures_ = 0;
};

void FormMakerWindow::MakeForm()
{
    New();
    ASSERT_TRUE(Maker());
    EXPECT_EQ(prompt_.questions.last(), u"Create a form based on the table \"Birds\" ?"_s);
    Paint(frame_, u"default form"_s);
    prompt_.answers = {true};
    Give(Str::MakerDeleteAll);
    Paint(frame_, u"empty"_s);

    Place(Str::MakerNewLabel, {8, 8});
    InSheet([](QWidget& sheet) { TypeInto(Named<QLineEdit>(sheet, Str::PropCaption), u"Bird:"_s); });
    Place(Str::MakerNewEditBox, {90, 6});
    InSheet([](QWidget& sheet) {
        Pick(sheet, Str::PropField, u"Name"_s);
        TypeInto(Named<QLineEdit>(sheet, Str::PropName), u"Name"_s);
    });
    Place(Str::MakerNewEditBox, {90, 32});
    InSheet([](QWidget& sheet) {
        Pick(sheet, Str::PropField, u"Seen"_s);
        TypeInto(Named<QLineEdit>(sheet, Str::PropName), u"Seen"_s);
        Pick(sheet, Str::PropEditKind, u"+Date Picker"_s);
    });
    Place(Str::MakerNewCheckBox, {90, 58});
    InSheet([](QWidget& sheet) {
        Pick(sheet, Str::PropField, u"Wild"_s);
        TypeInto(Named<QLineEdit>(sheet, Str::PropName), u"Wild"_s);
    });
    Place(Str::MakerNewDropDown, {90, 80});
    InSheet([](QWidget& sheet) {
        TypeInto(Named<QLineEdit>(sheet, Str::PropName), u"Size"_s);
        TypeInto(Named<QPlainTextEdit>(sheet, Str::PropItems), u"small;large"_s);
        for (auto* box : sheet.findChildren<QCheckBox*>()) {
            if (box->text() == StringText(Str::PropFieldBound) && box->isVisibleTo(&sheet))
                box->click();
        }
    });
    Place(Str::MakerNewList, {10, 110});
    InSheet([](QWidget& sheet) { Press(sheet, Str::PropAllFields); });
    Paint(frame_, u"list"_s);
    Place(Str::MakerNewButton, {10, 206});
    InSheet([](QWidget& sheet) {
        TypeInto(Named<QLineEdit>(sheet, Str::PropCaption), u"Save"_s);
        Pick(sheet, Str::PropFunction, u"UPDATE"_s);
        Press(sheet, Str::PropAllFields);
    });
    Paint(frame_, u"button"_s);
    Maker()->Maker().Design().SelectNone();
    Maker()->Surface().ShowState();
    Q_EMIT Maker()->Surface().acted();
    Give(Str::MakerInsertCounter);
    // The counter stands over the edit box: it is moved down, beside the button.
    const ControlDef counter = Maker()->Maker().Design().Control(7);
    const QPoint middle(counter.left + counter.width / 2, counter.top + counter.height / 2);
    Drag(middle, middle + QPoint(0, 206));
    EXPECT_EQ(Maker()->Maker().Design().Control(7).top, counter.top + 206);
    Paint(frame_, u"whole"_s);
    prompt_.texts = {u"My birds"_s};
    Give(Str::MakerSave);
    EXPECT_EQ(prompt_.questions.last(), u"Save as/Form Name:"_s);
    EXPECT_FALSE(Maker()->isWindowModified());
}

void FormMakerWindow::EnterRecords()
{
    Give(Str::MakerRun);
    ASSERT_TRUE(Running());
    frame_.activateWindow(); // as a window system does when a sheet over it closes
    ASSERT_TRUE(QTest::qWaitForWindowActive(&frame_));
    Paint(frame_, u"running"_s);
    CFormEngView& running = *Running();
    const auto widget = [&running](const QString& name) {
        return running.Surface().WidgetOf(running.Form().FindControl(name));
    };
    for (int number = 1; number <= 10; ++number) {
        QAction* add = Entry(running, Str::FormAdd);
        ASSERT_TRUE(add && add->isEnabled());
        add->trigger();
        TypeInto(widget(u"Name"_s), u"Bird %1"_s.arg(number));
        TypeInto(widget(u"Seen"_s), u"2001-07-%1"_s.arg(number, 2, 10, QLatin1Char('0')));
        if (number % 2 == 0)
            QTest::mouseClick(widget(u"Wild"_s), Qt::LeftButton);
        auto* size = qobject_cast<QComboBox*>(widget(u"Size"_s));
        ASSERT_TRUE(size);
        TypeInto(size->lineEdit(), number < 6 ? u"small"_s : u"large"_s);
        QTest::mouseClick(widget(u"Save"_s), Qt::LeftButton);
        EXPECT_FALSE(running.Form().IsDirty()) << number;
    }
    Paint(frame_, u"ten records"_s);
}

TEST_P(FormMakerWindow, AFormIsMadeFromNothingAndTenRecordsAreEnteredInIt)
{
    MakeForm();
    if (HasFatalFailure())
        return;
    EnterRecords();
    EXPECT_EQ(Value(u"SELECT COUNT(*) FROM Birds"_s), u"10"_s);
    EXPECT_EQ(Value(u"SELECT COUNT(*) FROM Birds WHERE Wild=1"_s), u"5"_s);
    EXPECT_EQ(Value(u"SELECT Size FROM Birds WHERE Name='Bird 7'"_s), u"large"_s);
    EXPECT_EQ(Value(u"SELECT COUNT(*) FROM Birds WHERE Seen>='2001-07-03' AND Seen<='2001-07-05'"_s), u"3"_s);
    EXPECT_TRUE(prompt_.shown.isEmpty()) << prompt_.shown.join(u'|').toStdString();

    FormStore onDisk(session_.SideFile());
    ASSERT_TRUE(onDisk.Load());
    const FormDef* form = onDisk.FindForm(u"My birds");
    ASSERT_TRUE(form);
    EXPECT_EQ(form->controls.size(), 8U);
    EXPECT_EQ(SplitAssignments(form->controls[6].source.Text()),
              (std::vector<SourceAssignment>{{u"Birds.Name"_s, u"&[Name]"_s},
                                             {u"Birds.Seen"_s, u"&[Seen]"_s},
                                             {u"Birds.Wild"_s, u"&[Wild]"_s},
                                             {u"Birds.Size"_s, u"&[Size]"_s}}));
    EXPECT_EQ(SplitListColumns(form->controls[5].source.Text()).size(), 5U);
    EXPECT_EQ(form->controls[2].editKind, EditKind::DatePicker);

    // And back: Edit Form leads to the maker that runs it.
    QAction* edit = Entry(*Running(), Str::FormEdit);
    ASSERT_TRUE(edit && edit->isEnabled());
    edit->trigger();
    EXPECT_TRUE(Maker()->isVisible());
    EXPECT_EQ(frame_.findChildren<CFormMakView*>().size(), 1);
}

TEST_P(FormMakerWindow, ItsMenusFollowTheSelection)
{
    New();
    CFormMakView& maker = *Maker();
    const auto shown = [&maker] {
        QStringList titles;
        for (const QMenu* menu : maker.Menus()) {
            if (menu->menuAction()->isVisible())
                titles += menu->title().remove(u'&');
        }
        return titles;
    };
    EXPECT_EQ(shown(), QStringList({u"File"_s, u"Form"_s, u"Control"_s}));
    QTest::mouseClick(&maker.Surface(), Qt::LeftButton, {}, maker.Surface().RectOf(1).center());
    EXPECT_EQ(shown(), QStringList({u"File"_s, u"Properties"_s, u"Edit"_s}));
    EXPECT_TRUE(Entry(maker, Str::MakerControlProperties));
    QTest::mouseClick(&maker.Surface(), Qt::LeftButton, Qt::ShiftModifier, maker.Surface().RectOf(3).center());
    EXPECT_FALSE(Entry(maker, Str::MakerControlProperties));
    EXPECT_TRUE(Entry(maker, Str::MakerSameWidth));
    const QRect first = maker.Surface().RectOf(1);
    Give(Str::MakerAlignTop);
    EXPECT_EQ(maker.Surface().RectOf(3).top(), first.top());
    QTest::keyClick(&maker.Surface(), Qt::Key_Z, Qt::ControlModifier);
    EXPECT_NE(maker.Surface().RectOf(3).top(), first.top());
    prompt_.answers = {true};
    QTest::keyClick(&maker.Surface(), Qt::Key_Delete);
    EXPECT_EQ(maker.Maker().Design().Count(), 10);
    QTest::keyClick(&maker.Surface(), Qt::Key_Escape);
    EXPECT_EQ(shown().last(), u"Control"_s);
    // Tab goes from control to control, the arrow keys move, with Shift resize.
    QTest::keyClick(&maker.Surface(), Qt::Key_Tab);
    ASSERT_EQ(maker.Maker().Design().TheSelected(), 0);
    const ControlDef before = maker.Maker().Design().Control(0);
    QTest::keyClick(&maker.Surface(), Qt::Key_Left);
    QTest::keyClick(&maker.Surface(), Qt::Key_Down, Qt::ShiftModifier);
    EXPECT_EQ(maker.Maker().Design().Control(0).left, before.left - 1);
    EXPECT_EQ(maker.Maker().Design().Control(0).height, before.height + 1);
    // Copy here, paste there.
    Give(Str::MakerCopy);
    const int count = maker.Maker().Design().Count();
    QTest::keyClick(&maker.Surface(), Qt::Key_V, Qt::ControlModifier);
    EXPECT_EQ(maker.Maker().Design().Count(), count + 1);
}

TEST_P(FormMakerWindow, TheQueryOfAButtonIsWrittenInTheQueryBuilder)
{
    New();
    Place(Str::MakerNewButton, {10, 206});
    InSheet([this](QWidget& sheet) {
        Pick(sheet, Str::PropFunction, u"SELECT"_s);
        TypeInto(Named<QPlainTextEdit>(sheet, Str::PropSelectText), u"WHERE Wings=2"_s);
        bool met = false;
        QTimer::singleShot(100, &frame_, [&met] { // once the builder stands over the sheet
            auto* dialog = qobject_cast<CQueryDialog*>(QApplication::activeModalWidget());
            ASSERT_TRUE(dialog);
            met = true;
            auto* sql = dialog->findChild<StatementEdit*>(u"sql"_s);
            EXPECT_EQ(sql->toPlainText(), u"WHERE Wings=2"_s) << "the select clause is fixed";
            sql->setPlainText(u"WHERE Wings>2"_s);
            dialog->findChild<QPushButton*>(u"save"_s)->click();
        });
        Press(sheet, Str::PropBuilder);
        EXPECT_TRUE(met);
        EXPECT_EQ(Named<QPlainTextEdit>(sheet, Str::PropSelectText)->toPlainText(), u"WHERE Wings>2"_s);
    });
    const FormDesign& design = Maker()->Maker().Design();
    EXPECT_TRUE(design.Control(design.Count() - 1).source.Text().endsWith(u"WHERE Wings>2"_s))
        << design.Control(design.Count() - 1).source.Text().toStdString();
}

TEST_P(FormMakerWindow, ClosesOnlyAsTheUserSays)
{
    New();
    const auto close = [this] { return Maker()->close(); };
    prompt_.cancels = true;
    EXPECT_FALSE(close());
    prompt_.cancels = false;
    prompt_.answers = {true};
    prompt_.texts = {std::nullopt};
    EXPECT_FALSE(close()) << "the save was stopped";
    prompt_.answers = {false};
    EXPECT_TRUE(close());
    QApplication::sendPostedEvents(nullptr, QEvent::DeferredDelete);
    EXPECT_FALSE(Maker());
    EXPECT_TRUE(session_.Store().Forms().empty());

    New();
    prompt_.questions.clear();
    prompt_.answers = {false};
    EXPECT_TRUE(frame_.close());
    EXPECT_EQ(prompt_.questions, QStringList{u"Save changes?"_s}) << "asked once";
    frame_.show();
}

INSTANTIATE_TEST_SUITE_P(BothSizes, FormMakerWindow, ::testing::Values(kHandheld, kDesktop),
                         [](const auto& size) { return size.param == kHandheld ? "Handheld" : "Desktop"; });

} // namespace
} // namespace mirel
