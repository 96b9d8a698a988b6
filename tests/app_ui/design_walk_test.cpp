// From an empty database to two tables with indexes, in the program's window: by mouse and keyboard in a large
// one, by stylus in a small one. Then one of them, with ten thousand records in it, is changed in every way.
#include "app/ui/message_box_prompt.h"
#include "app_ui/program_fixture.h"
#include "data/field_names.h"
#include "support/sqlite_file.h"
#include "support/ui/person.h"
#include "tableeditor/table_design.h"
#include "tableeditor/ui/field_dialog.h"
#include "tableeditor/ui/table_dialog.h"

#include <QAction>
#include <QComboBox>
#include <QLineEdit>
#include <QSpinBox>
#include <QToolButton>
#include <QTreeWidget>

namespace mirel {
namespace {

using namespace Qt::StringLiterals;

struct Tools {
    QSize size;
    QString palette;
    bool byStylus;

    friend void PrintTo(const Tools& tools, std::ostream* out)
    {
        *out << tools.size.width() << " x " << tools.size.height() << ' ' << tools.palette.toStdString();
    }
};

class DesignWalk : public ProgramFixture, public ::testing::WithParamInterface<Tools> {
protected:
    static constexpr int kRecords = 10'000;

    void SetUp() override
    {
        before_ = QApplication::palette();
        ASSERT_TRUE(UsePalette(GetParam().palette));
        QApplication::setDoubleClickInterval(1); // so long a list that drops down is deaf to taps
        Start(boxes_);
        ASSERT_TRUE(Commands().NewDatabase(PathOf(u"new.cdb"_s)));
        Show(GetParam().size);
        const QSize size = GetParam().size;
        person_ = std::make_unique<Person>(
            Frame(), u"design-%1x%2-%3"_s.arg(size.width()).arg(size.height()).arg(GetParam().palette));
    }
    void TearDown() override
    {
        program_.reset();
        QApplication::setDoubleClickInterval(400);
        QApplication::setStyle(u"Fusion"_s);
        QApplication::setPalette(before_);
    }

    Person& Somebody() { return *person_; }
    bool ByStylus() const { return GetParam().byStylus; }
    void Enter(const QString& text) { ByStylus() ? Somebody().Write(text) : Somebody().Type(text); }
    void ReplaceBy(const QString& text)
    {
        Somebody().Key(Qt::Key_A, Qt::ControlModifier); // the panel's "select all"
        Enter(text);
    }

    void OpenDesignerOfNewTable(const std::function<void()>& meet)
    {
        Somebody().MeetDialog([&] { Somebody().Tap(u"New"_s); }, meet);
    }
    void OpenDesignerOf(const QString& table, const std::function<void()>& meet)
    {
        Somebody().TapEntry(table);
        Somebody().MeetDialog(
            [&] {
                if (ByStylus())
                    Somebody().Tap(u"Edit"_s);
                else
                    Somebody().Key(Qt::Key_F2);
            },
            meet);
    }
    QTreeWidget* Fields() { return Somebody().FindPart<QTreeWidget>(u"fields"_s); }
    void TapField(int row) { Somebody().TapItem(*Fields(), Fields()->model()->index(row, 0)); }
    void TapTool(const QString& words) { Somebody().Tap(words); }
    void ChooseIn(QComboBox* box, const QString& text)
    {
        if (!ByStylus()) {
            for (int tries = 0; !box->hasFocus() && tries < 6; ++tries)
                Somebody().Key(Qt::Key_Tab);
            Somebody().Key(Qt::Key_Home);
            for (int tries = 0; box->currentText() != text && tries < 20; ++tries)
                Somebody().Key(Qt::Key_Down);
            return;
        }
        Somebody().Tap(box);
        QAbstractItemView* list = box->view();
        ASSERT_TRUE(QTest::qWaitForWindowExposed(list->window()));
        Somebody().TapItem(*list, list->model()->index(box->findText(text), 0));
        EXPECT_EQ(box->currentText(), text);
    }
    // In the dialog of a field.
    void FillField(const FieldDesign& field)
    {
        auto* dialog = qobject_cast<CFieldDialog*>(Somebody().Front());
        ASSERT_TRUE(dialog);
        const QList<QComboBox*> boxes = dialog->findChildren<QComboBox*>();
        Somebody().Tap(dialog->findChild<QLineEdit*>());
        ReplaceBy(field.name);
        QString type;
        TypeNameOfField(field.type, type);
        ChooseIn(boxes[0], type);
        if (field.type == FieldType::Text) {
            auto* size = dialog->findChild<QSpinBox*>();
            Somebody().Tap(size, {10, size->height() / 2});
            ReplaceBy(QString::number(field.size));
        }
        ChooseIn(boxes[1], WordOfIndexOrder(field.index));
    }
    void AddField(const FieldDesign& field)
    {
        Somebody().MeetDialog([&] { TapTool(u"New Field"_s); },
                              [&] {
                                  FillField(field);
                                  Somebody().See(u"field-"_s + field.name.toLower().remove(u' '));
                                  Somebody().Tap(u"OK"_s);
                              });
    }
    void MakeTable(const QString& name, const std::vector<FieldDesign>& fields)
    {
        OpenDesignerOfNewTable([&] {
            Somebody().See(u"new-table"_s);
            Somebody().Tap(Somebody().FindPart<QLineEdit>(u"tableName"_s));
            Enter(name);
            for (const FieldDesign& field : fields)
                AddField(field);
            Somebody().See(u"fields"_s);
            Somebody().MeetDialogs([&] { Somebody().Tap(u"Create"_s); }, {[&] {
                                                                              Somebody().See(u"create"_s);
                                                                              Somebody().Tap(u"Yes"_s);
                                                                          },
                                                                          [&] {
                                                                              Somebody().See(u"created"_s);
                                                                              Somebody().Tap(u"OK"_s);
                                                                          }});
        });
        EXPECT_EQ(Describe(name), Describe(fields));
    }

    static QString Describe(const std::vector<FieldDesign>& fields)
    {
        QStringList texts;
        for (const FieldDesign& field : fields) {
            QString type;
            TypeNameOfField(field.type, type);
            const int size = field.type == FieldType::Text ? field.size : 0;
            texts += u"%1 %2 %3 %4"_s.arg(field.name, type).arg(size).arg(WordOfIndexOrder(field.index));
        }
        return texts.join(u", "_s);
    }
    QString Describe(const QString& table)
    {
        const std::optional<TableDesign> design =
            ReadTableDesign(program_->connection, Session().Location(), table, prompt_);
        return design ? Describe(design->fields) : u"gone"_s;
    }
    // Row id and values of every record, as another program reads them.
    QStringList Records(const QByteArray& table, const QByteArrayList& fields)
    {
        QByteArray texts = "_rowid_";
        for (const QByteArray& field : fields)
            texts += "||'|'||ifnull([" + field + "],'NULL')";
        return SqliteFile(Session().Location().FilePath())
            .Column("SELECT " + texts + " FROM [" + table + "] ORDER BY 1");
    }
    void FillTable()
    {
        SqliteFile(Session().Location().FilePath())
            .Run("WITH RECURSIVE n(i) AS (VALUES(0) UNION ALL SELECT i+1 FROM n WHERE i<" +
                 QByteArray::number(kRecords - 1) +
                 ") INSERT INTO Birds (Species,Seen,[Count]) SELECT 'Bird '||i,'2001-02-03 00:00:00',i%7 FROM n");
    }
    // A question that is answered with Yes.
    void Confirm(const std::function<void()>& cause, const QString& station)
    {
        Somebody().MeetDialog(cause, [&] {
            Somebody().See(station);
            Somebody().Tap(u"Yes"_s);
        });
    }

    MessageBoxPrompt boxes_;
    QPalette before_;
    std::unique_ptr<Person> person_;
};

TEST_P(DesignWalk, FromAnEmptyDatabaseToTwoTablesThatChange)
{
    Person& person = Somebody();
    if (ByStylus())
        person.Tap(u"Table"_s);
    else
        person.TapEntry(u"Tables"_s);
    person.See(u"empty"_s);
    MakeTable(u"Places"_s,
              {{.name = u"Place"_s, .type = FieldType::Text, .size = 40, .index = IndexOrder::Ascending}});
    MakeTable(u"Birds"_s,
              {{.name = u"Species"_s, .type = FieldType::Text, .size = 60, .index = IndexOrder::Ascending},
               {.name = u"Seen"_s, .type = FieldType::Date, .index = IndexOrder::Descending},
               {.name = u"Count"_s, .type = FieldType::Integer, .index = IndexOrder::None}});
    FillTable();
    const QStringList before = Records("Birds", {"Species", "Seen", "Count"});
    ASSERT_EQ(before.size(), kRecords);

    OpenDesignerOf(u"Birds"_s, [&] {
        person.See(u"existing"_s);
        AddField({.name = u"Note"_s, .type = FieldType::Memo});
        EXPECT_EQ(Records("Birds", {"Species", "Seen", "Count"}), before);

        TapField(2); // Count
        TapTool(u"Move Up"_s);
        EXPECT_EQ(Describe(u"Birds"_s),
                  u"Species Text 60 ASC, Count Integer 0 NO, Seen DateTime 0 DESC, Note Memo 0 NO"_s);
        EXPECT_EQ(Records("Birds", {"Species", "Seen", "Count"}), before);

        // A new name and an index.
        person.MeetDialog(
            [&] { TapTool(u"Edit Field"_s); },
            [&] {
                FillField({.name = u"Number"_s, .type = FieldType::Integer, .index = IndexOrder::Ascending});
                person.Tap(u"OK"_s);
            });
        EXPECT_EQ(Records("Birds", {"Species", "Seen", "Number"}), before);

        // Another type, after the question how many values are at stake.
        person.MeetDialog([&] { TapTool(u"Change Type"_s); },
                          [&] {
                              person.See(u"change-type"_s);
                              auto* dialog = qobject_cast<CFieldDialog*>(person.Front());
                              ASSERT_TRUE(dialog);
                              ChooseIn(dialog->findChildren<QComboBox*>()[0], u"Text"_s);
                              Confirm([&] { person.Tap(u"OK"_s); }, u"at-stake"_s);
                          });
        EXPECT_EQ(Records("Birds", {"Species", "Seen", "Number"}), before);
        EXPECT_TRUE(Describe(u"Birds"_s).contains(u"Number Text"_s)) << Describe(u"Birds"_s).toStdString();

        // Refused, told, and as it was.
        TapField(0);
        person.MeetDialog([&] { TapTool(u"Edit Field"_s); },
                          [&] {
                              auto* dialog = qobject_cast<CFieldDialog*>(person.Front());
                              ASSERT_TRUE(dialog);
                              person.Tap(dialog->findChild<QLineEdit*>());
                              ReplaceBy(u"Seen"_s);
                              person.MeetDialog([&] { person.Tap(u"OK"_s); },
                                                [&] {
                                                    person.See(u"taken"_s);
                                                    person.Tap(u"OK"_s);
                                                });
                              person.Tap(u"Cancel"_s);
                          });
        TapField(3); // Note
        Confirm([&] { TapTool(u"Drop Field"_s); }, u"drop-field"_s);
        EXPECT_EQ(Records("Birds", {"Species", "Seen", "Number"}), before);

        // The table's own name.
        person.Tap(person.FindPart<QLineEdit>(u"tableName"_s));
        ReplaceBy(u"Sightings"_s);
        person.See(u"renaming"_s);
        person.MeetDialog([&] { person.Tap(u"Rename"_s); },
                          [&] {
                              person.See(u"renamed"_s);
                              person.Tap(u"OK"_s);
                          });
        person.Tap(u"Close"_s);
    });
    person.See(u"lists"_s);
    EXPECT_EQ(Records("Sightings", {"Species", "Seen", "Number"}), before);
    OpenDesignerOf(u"Places"_s, [&] { Confirm([&] { person.Tap(u"Drop Table"_s); }, u"drop-table"_s); });
    EXPECT_EQ(Describe(u"Places"_s), u"gone"_s);
}

INSTANTIATE_TEST_SUITE_P(
    Tools, DesignWalk,
    ::testing::Values(Tools{{1100, 700}, u"light"_s, false}, Tools{{240, 320}, u"light"_s, true},
                      Tools{{240, 320}, u"dark"_s, true}),
    [](const auto& tools) {
        return (u"At%1%2"_s.arg(tools.param.size.width()).arg(tools.param.palette)).toStdString();
    });

} // namespace
} // namespace mirel
