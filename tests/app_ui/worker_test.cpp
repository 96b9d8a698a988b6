// Whole days at the window. A field worker has a stylus and an input panel on a small screen, an office worker a
// keyboard or a mouse before a large one; both touch only what a person can touch.
#include "app/ui/lumo_view.h"
#include "app/ui/message_box_prompt.h"
#include "app/ui/side_tree.h"
#include "app_ui/program_fixture.h"
#include "data/db_recordset.h"
#include "forms/ui/form_eng_view.h"
#include "forms/ui/form_surface.h"
#include "platform/ui/error_line.h"
#include "support/ui/person.h"
#include "tableview/ui/cell_strip.h"
#include "tableview/ui/filter_bar.h"
#include "tableview/ui/navigation_row.h"
#include "tableview/ui/record_grid.h"
#include "tableview/ui/table_view.h"

#include <QClipboard>
#include <QComboBox>
#include <QFile>
#include <QFileInfo>
#include <QHeaderView>
#include <QLabel>
#include <QLineEdit>
#include <QMenuBar>
#include <QScrollBar>
#include <QToolButton>

namespace mirel {
namespace {

using namespace Qt::StringLiterals;

struct Desk {
    QSize size;
    QString palette;

    friend void PrintTo(const Desk& desk, std::ostream* out)
    {
        *out << desk.size.width() << " x " << desk.size.height() << ' ' << desk.palette.toStdString();
    }
};

class Worker : public ProgramFixture, public ::testing::WithParamInterface<Desk> {
protected:
    void SitDown(const QString& who)
    {
        before_ = QApplication::palette();
        ASSERT_TRUE(UsePalette(GetParam().palette));
        Start(boxes_);
        Show(GetParam().size);
        const QSize size = GetParam().size;
        person_ = std::make_unique<Person>(
            Frame(), u"%1-%2x%3-%4"_s.arg(who).arg(size.width()).arg(size.height()).arg(GetParam().palette));
    }
    void TearDown() override
    {
        program_.reset();
        QApplication::setStyle(u"Fusion"_s);
        QApplication::setPalette(before_);
    }

    CTableView& Table() { return *qobject_cast<CTableView*>(Tabs().Front()); }
    const RecordBrowser& Records() { return Table().Browser(); }
    RecordGrid& Grid() { return *Table().findChild<RecordGrid*>(); }
    QLineEdit& Editor() { return *Table().findChild<CellStrip*>()->findChild<QLineEdit*>(); }
    QString Said() { return Tabs().Front()->findChild<ErrorLine*>()->Text(); }

    // What the store holds: the first value of the first record.
    QString Stored(const QString& statement)
    {
        DbConnection other;
        DbRecordset records(other);
        EXPECT_TRUE(records.Open(statement, Session().Location(), CursorType::ForwardOnly, LockType::ReadOnly))
            << statement.toStdString();
        return records.IsEof() ? u"nothing"_s : records.ValueText(0);
    }

    // Where the cell of a field shows in a row, after as many taps on the scroll bar as it takes.
    QPoint CellOf(int row, const QString& field)
    {
        int column = 0;
        while (column < Records().Page().ColumnCount() && Records().Page().columns[size_t(column)].title != field)
            ++column;
        QScrollBar* bar = Grid().horizontalScrollBar();
        const QWidget* port = Grid().viewport();
        for (int tries = 0; tries < 60; ++tries) {
            const QPoint at = Grid().CellRect(row, column).center();
            if (at.x() > 0 && at.x() < port->width())
                return at;
            const bool right = at.x() > 0;
            Person_().Tap(bar, {right ? bar->width() - 4 : 4, bar->height() / 2});
        }
        ADD_FAILURE() << field.toStdString() << " does not come into sight";
        return {1, 1};
    }
    void TapCell(int row, const QString& field) { Person_().Tap(Grid().viewport(), CellOf(row, field)); }
    Person& Person_() { return *person_; }
    QToolButton* Button(const QString& name)
    {
        for (QToolButton* button : Table().findChild<NavigationRow*>()->findChildren<QToolButton*>()) {
            if (button->isVisible() && button->accessibleName() == name)
                return button;
        }
        ADD_FAILURE() << "the row of buttons has no " << name.toStdString();
        return nullptr;
    }

    MessageBoxPrompt boxes_;
    QPalette before_;
    std::unique_ptr<Person> person_;
};

class FieldWorker : public Worker {};

TEST_P(FieldWorker, WorksThroughADayWithAStylus)
{
    SitDown(u"field"_s);
    Person& person = Person_();

    // Opens the sample, and a table of it.
    person.See(u"start"_s);
    person.Tap(u"Open the Sample"_s);
    person.Tap(u"Table"_s);
    person.TapEntry(u"Bird Strikes"_s);
    person.See(u"lists"_s);
    person.TapEntryTwice(u"Bird Strikes"_s);
    ASSERT_TRUE(Tabs().Front());
    person.See(u"table"_s);

    // Filters by what is tapped, twice, and takes the filters off one by one.
    TapCell(3, u"Airport Name"_s);
    const QString airport = Records().SelectedText();
    person.Choose({u"Tools"_s, u"Filter By Selection"_s});
    EXPECT_EQ(QString::number(*Records().KnownCount()),
              Stored(u"SELECT COUNT(*) FROM [Bird Strikes] WHERE [Airport Name]='%1'"_s.arg(airport)));
    TapCell(0, u"Wildlife Size"_s);
    const QString size = Records().SelectedText();
    person.Choose({u"Tools"_s, u"Filter Excluding Selection"_s});
    const auto* bar = Table().findChild<FilterBar*>();
    ASSERT_EQ(bar->findChildren<FilterChip*>().size(), 2);
    person.See(u"filtered"_s);
    person.MeetMenu([&] { person.Tap(bar->findChildren<FilterChip*>()[1]->Words()); },
                    [&] {
                        person.See(u"chip-menu"_s);
                        person.ChooseHere(u"Switch Off"_s);
                    });
    EXPECT_EQ(Records().Conditions().size(), 1);
    person.See(u"chip-off"_s);
    person.Tap(bar->findChildren<FilterChip*>()[1]->Cross());
    EXPECT_EQ(Records().Filters().size(), 1U);

    // Sorts, and sums up.
    TapCell(0, u"Cost Total $"_s);
    person.Choose({u"Tools"_s, u"Sort Descending"_s});
    person.See(u"sorted"_s);
    person.Choose({u"Tools"_s, u"Aggregate"_s, u"SUM"_s});
    EXPECT_EQ(Records().ShownResult(),
              Stored(u"SELECT SUM([Cost Total $]) FROM [Bird Strikes] WHERE [Airport Name]='%1'"_s.arg(airport)));
    person.See(u"sum"_s);

    // Detail, and back.
    person.Tap(Button(u"Detail"_s));
    person.See(u"detail"_s);
    person.Tap(Button(u"List"_s));

    // Back to the lists, to another table; changes a value.
    const auto lists = [&] {
        person.MeetMenu([&] { person.Tap(Frame().menuBar()->cornerWidget()); },
                        [&] {
                            person.See(u"views-menu"_s);
                            person.ChooseHere(u"Lists of the Database"_s);
                        });
    };
    lists();
    person.TapEntryTwice(u"Orders"_s);
    TapCell(0, u"Quantity"_s);
    person.Tap(&Editor());
    person.Key(Qt::Key_A, Qt::ControlModifier); // the panel's "select all"
    person.Write(u"7"_s);
    TapCell(1, u"Quantity"_s);
    EXPECT_EQ(Stored(u"SELECT Quantity FROM Orders WHERE Number=1001"_s), u"7"_s);

    // A wrong date, told beside the editor; nothing else can be done, and the old value comes back.
    TapCell(1, u"Ordered"_s);
    const QString ordered = Records().SelectedText();
    person.Tap(&Editor());
    person.Key(Qt::Key_A, Qt::ControlModifier);
    person.Write(u"31.31.99"_s);
    person.MeetDialog([&] { person.Tap(Button(u"Next record"_s)); },
                      [&] {
                          person.See(u"refused-box"_s);
                          person.Tap(u"OK"_s);
                      });
    EXPECT_EQ(Said(), u"not a date: 31.31.99"_s);
    person.See(u"refused"_s);
    for (QToolButton* restore : Table().findChild<ErrorLine*>()->findChildren<QToolButton*>())
        person.Tap(restore);
    EXPECT_EQ(Records().SelectedText(), ordered);
    EXPECT_EQ(Said(), QString());
    // A text for a number.
    TapCell(1, u"Quantity"_s);
    person.Tap(&Editor());
    person.Write(u"abc"_s);
    person.MeetDialog([&] { person.Tap(Button(u"Next record"_s)); }, [&] { person.Tap(u"OK"_s); });
    EXPECT_TRUE(Said().startsWith(u"not a number"_s)) << Said().toStdString();
    for (QToolButton* restore : Table().findChild<ErrorLine*>()->findChildren<QToolButton*>())
        person.Tap(restore);

    // Adds a record, and takes that back.
    const qint64 orders = *Records().KnownCount();
    person.Tap(Button(u"New"_s));
    EXPECT_EQ(Records().KnownCount(), orders + 1);
    person.See(u"added"_s);
    person.Choose({u"Edit"_s, u"Undo"_s});
    EXPECT_EQ(Records().KnownCount(), orders);

    // The hold menu of a cell; the calendar; a question.
    person.MeetMenu([&] { person.Hold(Grid().viewport(), CellOf(0, u"Number"_s)); },
                    [&] {
                        person.See(u"hold-menu"_s);
                        person.ChooseHere(u"Sort Ascending"_s);
                    });
    person.MeetDialog([&] { person.Tap(Button(u"Delete"_s)); },
                      [&] {
                          person.See(u"delete-question"_s);
                          person.Tap(u"No"_s);
                      });
    EXPECT_EQ(Records().KnownCount(), orders);

    // Find, filter expression, options.
    person.Choose({u"Edit"_s, u"Find"_s});
    person.Write(u"clock"_s);
    person.See(u"find"_s);
    person.Key(Qt::Key_Escape); // the panel has it
    for (const QString& command : {u"Filter Expression"_s, u"Sort Expression"_s, u"Go To Record"_s})
        person.MeetDialog(
            [&] {
                person.Choose({u"Tools"_s, command});
            },
            [&] {
                person.See(QString(command).remove(u' ').toLower());
                person.Tap(u"Cancel"_s);
            });
    person.MeetDialog(
        [&] {
            person.Choose({u"File"_s, u"Options"_s});
        },
        [&] {
            person.See(u"options"_s);
            person.Tap(u"Cancel"_s);
        });

    // Writes a file of it.
    person.MeetDialog(
        [&] {
            person.Choose({u"File"_s, u"Export to CSV"_s});
        },
        [&] {
            person.See(u"export-source"_s);
            person.MeetDialog([&] { person.Tap(u"Save As"_s); },
                              [&] {
                                  person.See(u"export-file"_s);
                                  person.Tap(u"Save As"_s);
                              });
            person.Tap(u"Next"_s);
            person.See(u"export-separator"_s);
            person.MeetDialog([&] { person.Tap(u"Export"_s); },
                              [&] {
                                  person.See(u"exported"_s);
                                  person.Tap(u"OK"_s);
                              });
        });
    QFile file(QFileInfo(Session().Location().FilePath()).dir().filePath(u"Orders.csv"_s));
    ASSERT_TRUE(file.open(QIODevice::ReadOnly));
    EXPECT_EQ(file.readAll().count('\n'), orders);

    // A form: the next record, a value, saved.
    lists();
    person.Tap(u"Form"_s);
    person.See(u"forms"_s);
    person.TapEntryTwice(u"Strike entry"_s);
    auto* form = qobject_cast<CFormEngView*>(Tabs().Front());
    ASSERT_TRUE(form);
    person.See(u"form"_s);
    person.Tap(u"Next Record"_s);
    EXPECT_EQ(form->Form().CurrentRecord(), 1);
    QWidget* box = form->Surface().WidgetOf(form->Form().FindControl(u"Airport Name"));
    person.Tap(box);
    person.Write(u"x"_s);
    EXPECT_TRUE(form->isWindowModified());
    person.See(u"form-changed"_s);
    person.MeetDialog([&] { person.Tap(u"Next Record"_s); },
                      [&] {
                          person.See(u"form-question"_s);
                          person.Tap(u"No"_s);
                      });
    EXPECT_TRUE(form->isWindowModified()) << "what is typed stays";
    person.Choose({u"File"_s, u"Save"_s});
    EXPECT_FALSE(form->isWindowModified());
    person.Choose({u"Record"_s, u"Undo Change"_s});
}

INSTANTIATE_TEST_SUITE_P(
    Desks, FieldWorker,
    ::testing::Values(Desk{{240, 320}, u"light"_s}, Desk{{240, 320}, u"dark"_s}, Desk{{360, 640}, u"light"_s}),
    [](const auto& desk) {
        return (u"At%1%2"_s.arg(desk.param.size.width()).arg(desk.param.palette)).toStdString();
    });

class OfficeWorker : public Worker {
protected:
    void OpenSample()
    {
        Person& person = Person_();
        person.See(u"start"_s);
        person.Choose({u"Database"_s, u"Open the Sample"_s});
    }
};

TEST_P(OfficeWorker, WorksThroughADayByKeyboard)
{
    SitDown(u"keyboard"_s);
    Person& person = Person_();
    person.See(u"start"_s);
    person.Key(Qt::Key_D, Qt::AltModifier); // the Database menu
    person.Key(Qt::Key_S);                  // Open the Sample
    ASSERT_TRUE(State().HasDatabase());

    // The side bar: to a table by its first letters.
    person.Key(Qt::Key_Home, Qt::AltModifier);
    auto* tree = Frame().findChild<SideTree*>();
    ASSERT_TRUE(tree->hasFocus());
    for (int steps = 0; steps < 40 && !(State().Selected() && State().Selected()->name == u"Orders" &&
                                        State().Tab() == MainTab::Table);
         ++steps)
        person.Key(Qt::Key_Down);
    person.See(u"side-bar"_s);
    person.Key(Qt::Key_Return);
    ASSERT_TRUE(Tabs().Front());
    ASSERT_TRUE(Grid().hasFocus()) << QApplication::focusWidget()->metaObject()->className();

    // A value, typed over; the wrong one; the old one back.
    person.Key(Qt::Key_Right);
    person.Key(Qt::Key_Right);
    person.Key(Qt::Key_Right);
    person.Type(u"9"_s);
    person.Key(Qt::Key_Return);
    EXPECT_EQ(Stored(u"SELECT Quantity FROM Orders WHERE Number=1001"_s), u"9"_s);
    person.Type(u"many"_s);
    person.See(u"wrong"_s);
    person.MeetDialog([&] { person.Key(Qt::Key_Return); },
                      [&] {
                          person.See(u"refused-box"_s);
                          person.Key(Qt::Key_Return);
                      });
    person.See(u"refused"_s);
    person.Key(Qt::Key_Escape);
    EXPECT_EQ(Said(), QString());

    // Found, filtered, sorted, summed, undone.
    person.Key(Qt::Key_Home, Qt::ControlModifier);
    person.Key(Qt::Key_F, Qt::ControlModifier);
    person.Type(u"clock"_s);
    person.Key(Qt::Key_Return);
    person.See(u"find"_s);
    person.Key(Qt::Key_Escape);
    person.MeetMenu([&] { person.Key(Qt::Key_F10, Qt::ShiftModifier); },
                    [&] {
                        person.See(u"popup"_s);
                        person.Key(Qt::Key_Escape);
                    });
    const qint64 orders = *Records().KnownCount();
    person.Key(Qt::Key_N, Qt::ControlModifier);
    EXPECT_EQ(Records().KnownCount(), orders + 1);
    person.Key(Qt::Key_Z, Qt::ControlModifier);
    EXPECT_EQ(Records().KnownCount(), orders);
    person.MeetDialog([&] { person.Key(Qt::Key_F, Qt::ControlModifier | Qt::ShiftModifier); },
                      [&] {
                          person.See(u"filter"_s);
                          person.Key(Qt::Key_Escape);
                      });
    person.MeetDialog([&] { person.Key(Qt::Key_G, Qt::ControlModifier); },
                      [&] {
                          person.Type(u"3"_s);
                          person.See(u"go"_s);
                          person.Key(Qt::Key_Return);
                      });
    EXPECT_EQ(Records().SelectedRecord(), 2);
    person.Key(Qt::Key_D, Qt::ControlModifier);
    person.See(u"detail"_s);
    person.Key(Qt::Key_D, Qt::ControlModifier);

    // A second view, its tab, and back; both closed.
    person.Key(Qt::Key_Home, Qt::AltModifier);
    person.Key(Qt::Key_Up);
    person.Key(Qt::Key_Return);
    EXPECT_EQ(Tabs().Count(), 2);
    person.See(u"two-tabs"_s);
    person.Key(Qt::Key_Tab, Qt::ControlModifier);
    EXPECT_EQ(Tabs().KeyAt(Tabs().Current()).name, u"Orders"_s);
    person.MeetDialog([&] { person.Key(Qt::Key_Slash, Qt::ControlModifier); },
                      [&] {
                          person.See(u"keys"_s);
                          person.Key(Qt::Key_Escape);
                      });
    person.Key(Qt::Key_W, Qt::ControlModifier);
    person.Key(Qt::Key_W, Qt::ControlModifier);
    EXPECT_EQ(Tabs().Count(), 0);
}

TEST_P(OfficeWorker, WorksThroughADayByMouse)
{
    SitDown(u"mouse"_s);
    Person& person = Person_();
    OpenSample();
    person.TapEntry(u"Bird Strikes"_s);
    QTest::qWait(300);
    person.See(u"glance"_s);
    person.TapEntryTwice(u"Bird Strikes"_s);
    person.TapEntryTwice(u"Orders"_s);
    person.TapEntryTwice(u"Strikes"_s);
    EXPECT_EQ(Tabs().Count(), 3);
    person.See(u"form"_s);
    person.Tap(u"Bird Strikes"_s);
    person.See(u"table"_s);

    person.MeetMenu([&] { person.RightClick(Grid().viewport(), CellOf(4, u"Wildlife Size"_s)); },
                    [&] { person.Key(Qt::Key_Escape); });
    TapCell(4, u"Wildlife Size"_s);
    person.Choose({u"Tools"_s, u"Filter By Selection"_s});
    TapCell(0, u"Phase of flight"_s);
    person.Choose({u"Tools"_s, u"Filter Excluding Selection"_s});
    person.See(u"filtered"_s);
    const auto* bar = Table().findChild<FilterBar*>();
    person.MeetDialog(
        [&] {
            person.MeetMenu([&] { person.Tap(bar->findChildren<FilterChip*>()[0]->Words()); },
                            [&] { person.ChooseHere(u"Change"_s); });
        },
        [&] {
            person.See(u"change-filter"_s);
            person.Tap(u"Cancel"_s);
        });
    person.Tap(bar->findChildren<FilterChip*>()[0]->Cross());
    EXPECT_EQ(Records().Filters().size(), 1U);
    TapCell(0, u"Cost Total $"_s);
    person.Choose({u"Tools"_s, u"Sort Descending"_s});
    person.Choose({u"Tools"_s, u"Aggregate"_s, u"AVG"_s});
    person.See(u"average"_s);

    // Cells that were copied become a table.
    QGuiApplication::clipboard()->setText(u"City\tVisits\nOslo\t3\nCork\t12\n"_s);
    person.MeetDialog(
        [&] {
            person.Choose({u"File"_s, u"Paste as New Table"_s});
        },
        [&] {
            person.See(u"pasted"_s);
            for (int step = 0; step < 2; ++step)
                person.Tap(u"Next"_s);
            person.See(u"pasted-fields"_s);
            person.MeetDialog([&] { person.Tap(u"Import"_s); },
                              [&] {
                                  person.See(u"imported"_s);
                                  person.Tap(u"OK"_s);
                              });
        });
    EXPECT_EQ(Stored(u"SELECT SUM(Visits) FROM Imported"_s), u"15"_s);

    // A window of its own, and back.
    person.Choose({u"Window"_s, u"Open in New Window"_s});
    EXPECT_EQ(Tabs().Count(), 2);
    person.See(u"own-window"_s);
    person.Choose({u"File"_s, u"Show as Tab"_s});
    EXPECT_EQ(Tabs().Count(), 3);
    for (const QString& command : {u"About Mirel"_s, u"Keys"_s})
        person.MeetDialog(
            [&] {
                person.Choose({u"Help"_s, command});
            },
            [&] {
                person.See(command.left(5).toLower());
                person.Key(Qt::Key_Escape);
            });
}

INSTANTIATE_TEST_SUITE_P(
    Desks, OfficeWorker, ::testing::Values(Desk{{1100, 700}, u"light"_s}, Desk{{1100, 700}, u"dark"_s}),
    [](const auto& desk) {
        return (u"At%1%2"_s.arg(desk.param.size.width()).arg(desk.param.palette)).toStdString();
    });

} // namespace
} // namespace mirel
