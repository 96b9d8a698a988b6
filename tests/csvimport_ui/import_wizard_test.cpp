// The import wizard as a person goes through it, with the stylus alone on a small screen.
#include "csvimport/ui/import_options_dialog.h"
#include "csvimport/ui/import_wizard.h"
#include "data/catalog.h"
#include "platform/ui/error_line.h"
#include "platform/ui/window_place.h"
#include "resources/string_table.h"
#include "support/test_database.h"
#include "support/ui/window_sizes.h"

#include <QApplication>
#include <QCheckBox>
#include <QClipboard>
#include <QComboBox>
#include <QDialogButtonBox>
#include <QDir>
#include <QDropEvent>
#include <QFile>
#include <QLabel>
#include <QLineEdit>
#include <QListWidget>
#include <QMimeData>
#include <QPushButton>
#include <QRadioButton>
#include <QScrollArea>
#include <QSpinBox>
#include <QStackedWidget>
#include <QTableWidget>
#include <QTest>
#include <QTimer>
#include <QTreeWidget>
#include <QUrl>

#include <algorithm>

namespace mirel {
namespace {

using namespace Qt::StringLiterals;

class ImportWizard : public TestDatabase {
protected:
    QString WriteFile(const QString& name, const QByteArray& bytes) const
    {
        QFile file(folder_.filePath(name));
        EXPECT_TRUE(file.open(QIODevice::WriteOnly));
        file.write(bytes);
        return file.fileName();
    }

    // The wizard over a window of that size.
    void Show(QSize size)
    {
        window_.resize(size);
        window_.show();
        draft_ = std::make_unique<ImportDraft>(connection_, path_, prompt_);
        wizard_ = std::make_unique<CImportWizard>(*draft_, prompt_, path_, &window_);
        FillSmallWindow(*wizard_, window_);
        wizard_->show();
        EXPECT_TRUE(QTest::qWaitForWindowExposed(wizard_.get()));
    }

    void Paint(QWidget& shown, const QString& name) const
    {
        const QString folder = qEnvironmentVariable("MIREL_PICTURES");
        QApplication::processEvents();
        if (!folder.isEmpty()) {
            EXPECT_TRUE(shown.grab().save(
                QDir(folder).filePath(u"import-%1-%2.png"_s.arg(name, QString::number(window_.width())))));
        }
    }
    void Paint(const QString& name) const { Paint(*wizard_, name); }

    template <typename Widget>
    Widget* Named(Str text) const
    {
        const QList<Widget*> all = wizard_->findChildren<Widget*>();
        const auto found = std::ranges::find_if(all, [text](const Widget* each) {
            return QString(each->text()).replace(u'\n', u' ') == StringText(text); // captions wrap
        });
        return found == all.end() ? nullptr : *found;
    }
    template <typename Widget>
    Widget* Accessible(Str name) const
    {
        for (Widget* each : wizard_->findChildren<Widget*>()) {
            if (each->accessibleName() == StringText(name))
                return each;
        }
        return nullptr;
    }

    // As the stylus would: what is outside of the screen is scrolled to first.
    static void Tap(QWidget* widget)
    {
        ASSERT_TRUE(widget && widget->isVisible() && widget->isEnabled());
        for (QWidget* over = widget->parentWidget(); over; over = over->parentWidget()) {
            if (auto* area = qobject_cast<QScrollArea*>(over))
                area->ensureWidgetVisible(widget);
        }
        QApplication::processEvents();
        const QPoint at = widget->mapTo(widget->window(), QPoint(8, widget->height() / 2));
        EXPECT_TRUE(widget->window()->rect().contains(at)) << "out of the screen";
        QTest::mouseClick(widget, Qt::LeftButton, {}, QPoint(8, widget->height() / 2));
    }
    static void TapRow(QAbstractItemView* list, int row, int column = 0)
    {
        const QModelIndex index = list->model()->index(row, column);
        list->scrollTo(index);
        QTest::mouseClick(list->viewport(), Qt::LeftButton, {}, list->visualRect(index).center());
    }
    QPushButton* Next() const
    {
        auto* next = Named<QPushButton>(Str::WizardNext);
        return next ? next : Named<QPushButton>(Str::ImportRun);
    }
    void GoOn() { Tap(Next()); }
    int Step() const { return wizard_->findChild<QStackedWidget*>()->currentIndex(); }
    QString Heading() const { return wizard_->findChild<QLabel*>()->text(); }
    // The message that a step on brings, which stays where it is.
    QString Refusal()
    {
        const int before = Step();
        prompt_.shown.clear();
        GoOn();
        EXPECT_EQ(Step(), before);
        return prompt_.shown.join(u'|');
    }
    void TrialEnds(const QString& says)
    {
        auto* line = wizard_->findChild<ErrorLine*>();
        EXPECT_TRUE(QTest::qWaitFor([&] { return line->Text().contains(says); })) << line->Text().toStdString();
    }
    QString Stored(const QString& statement)
    {
        DbRecordset records(connection_);
        EXPECT_TRUE(Open(records, statement));
        QStringList rows;
        for (; !records.IsEof(); (void)records.MoveNext()) {
            QStringList texts;
            for (int i = 0; i < records.FieldCount(); ++i)
                texts += records.ValueText(i);
            rows += texts.join(u'|');
        }
        return rows.join(u'/');
    }

    QWidget window_;
    std::unique_ptr<ImportDraft> draft_;
    std::unique_ptr<CImportWizard> wizard_;
};

TEST_F(ImportWizard, LeadsAFileIntoANewTableByTheStylus)
{
    for (const QSize size : {kHandheld, kDesktop}) {
        const QString table = u"birds %1"_s.arg(size.width());
        Show(size);
        Paint(u"1-empty"_s);
        EXPECT_FALSE(Next()->isEnabled()) << "there is no file yet";
        const QString file =
            WriteFile(table + u".csv"_s, "Art;Preis;Am;Nr\nElster;1,50;24.12.2001;007\n\"a;b\";;1.2.2002;8\n");
        wizard_->Begin(ImportSource::OfFile(file));
        EXPECT_EQ(Step(), 1);
        EXPECT_EQ(Heading(), u"Field separator (step 2 of 4)"_s);
        auto* preview = wizard_->findChild<QTableWidget*>();
        EXPECT_EQ(preview->columnCount(), 4);
        EXPECT_EQ(preview->horizontalHeaderItem(1)->text(), u"Preis"_s);
        EXPECT_TRUE(Named<QRadioButton>(Str::CsvSeparatorSemicolon)->isChecked());
        Paint(u"2-separator"_s);
        // The preview follows at once; Detect takes it back.
        Tap(Named<QRadioButton>(Str::CsvSeparatorComma));
        EXPECT_EQ(preview->columnCount(), 2);
        Tap(Named<QPushButton>(Str::ImportDetect));
        EXPECT_EQ(preview->columnCount(), 4);
        Tap(Named<QPushButton>(Str::WizardBack));
        Paint(u"1-source"_s);
        GoOn();
        GoOn();
        EXPECT_EQ(Accessible<QLineEdit>(Str::ImportNewTableName)->text(), table);
        Paint(u"3-destination"_s);
        GoOn();
        EXPECT_EQ(Heading(), u"Define Fields (step 4 of 4)"_s);
        EXPECT_EQ(Next()->text(), StringText(Str::ImportRun));
        TrialEnds(u"All 2 lines fit."_s);
        auto* list = wizard_->findChild<QTreeWidget*>();
        EXPECT_EQ(list->topLevelItem(3)->text(2), u"Text"_s) << "a code with zeros in front";
        EXPECT_EQ(list->topLevelItem(0)->text(4), u"Elster"_s);
        Paint(u"4-fields"_s);
        // A tap on the mark ignores a column.
        TapRow(list, 3, 0);
        EXPECT_EQ(list->topLevelItem(3)->text(0), u"-"_s);
        Paint(u"4-ignored"_s);
        prompt_.shown.clear();
        GoOn();
        EXPECT_EQ(wizard_->result(), QDialog::Accepted);
        EXPECT_EQ(prompt_.shown, QStringList{u"2 record(s) imported."_s});
        EXPECT_EQ(Stored(u"SELECT * FROM ["_s + table + u']'), u"Elster|1.5|12/24/2001/a;b||2/1/2002"_s);
    }
}

TEST_F(ImportWizard, SaysWhatIsMissing)
{
    Run(u"CREATE TABLE [Old] ([A] Integer,[B] Varchar(9))"_s);
    for (const QSize size : {kHandheld, kDesktop}) {
        Show(size);
        wizard_->Begin(ImportSource::OfFile(WriteFile(u"x.csv"_s, "a,b\n1,x\n2,y\n")));
        Tap(Named<QRadioButton>(Str::ImportSeparatorEtc));
        EXPECT_EQ(Refusal(), u"Please enter field separator."_s);
        QTest::keyClicks(Accessible<QLineEdit>(Str::ImportSeparatorEtcName), u","_s);
        GoOn();
        auto* name = Accessible<QLineEdit>(Str::ImportNewTableName);
        name->clear();
        QTest::keyClick(name, Qt::Key_A);
        QTest::keyClick(name, Qt::Key_Backspace);
        EXPECT_EQ(Refusal(), u"Please enter new table name."_s);
        Tap(Named<QRadioButton>(Str::ImportExistingTable));
        EXPECT_EQ(Refusal(), u"Please choose a table."_s);
        Tap(Named<QRadioButton>(Str::ImportNewTable));
        QTest::keyClicks(name, u"New one"_s);
        GoOn();
        // A text's size, and names.
        auto* list = wizard_->findChild<QTreeWidget*>();
        TapRow(list, 1, 1);
        auto* boxSize = wizard_->findChild<QSpinBox*>();
        boxSize->setValue(256);
        EXPECT_EQ(Refusal(),
                  u"Text field can contain\r\n1 - 255 characters.\r\nFor more than 255, choose Memo field."_s);
        Paint(u"4-size"_s);
        boxSize->setValue(5);
        auto* field = Accessible<QLineEdit>(Str::ImportColumnName);
        field->clear();
        QTest::keyClicks(field, u"A"_s);
        EXPECT_EQ(Refusal(), u"The name \"A\" stands twice."_s);
        // Back to an existing table: one of its fields for two columns.
        Tap(Named<QPushButton>(Str::WizardBack));
        Tap(Named<QRadioButton>(Str::ImportExistingTable));
        auto* tables = wizard_->findChild<QListWidget*>();
        TapRow(tables, 0);
        Paint(u"3-existing"_s);
        GoOn();
        auto* fields = wizard_->findChildren<QComboBox*>().first();
        TapRow(list, 1, 1);
        fields->setCurrentText(u"A"_s);
        Q_EMIT fields->activated(fields->currentIndex());
        EXPECT_EQ(Refusal(), u"Field \"A\" is already assigned"_s);
        Paint(u"4-existing"_s);
        for (int row = 0; row < 2; ++row) {
            TapRow(list, row, 1);
            fields->setCurrentText(StringText(Str::ImportIgnoreField));
            Q_EMIT fields->activated(0);
        }
        EXPECT_EQ(Refusal(), u"There is no column to import."_s);
    }
}

TEST_F(ImportWizard, MarksLinesThatWillFailAndPassesThemOver)
{
    Show(kHandheld);
    wizard_->Begin(ImportSource::OfFile(WriteFile(u"x.csv"_s, "k,v\n1,x\n2,yyyyyyyyyyyy\n3,z\n")));
    GoOn();
    GoOn();
    auto* list = wizard_->findChild<QTreeWidget*>();
    TapRow(list, 1, 1);
    wizard_->findChild<QSpinBox*>()->setValue(5);
    TrialEnds(u"1 line will fail. Line 3, column 2"_s);
    EXPECT_TRUE(list->topLevelItem(1)->toolTip(4).contains(u"line 3"_s));
    Paint(u"4-failing"_s);
    // Without the option the run ends there; with it the line goes to a file.
    Tap(Named<QCheckBox>(Str::ImportSkipFailing));
    prompt_.shown.clear();
    GoOn();
    ASSERT_EQ(prompt_.shown.size(), 2);
    EXPECT_EQ(prompt_.shown[0], u"2 record(s) imported, 1 line(s) skipped."_s);
    QFile skipped(folder_.filePath(u"x.skipped.csv"_s));
    ASSERT_TRUE(skipped.open(QIODevice::ReadOnly));
    EXPECT_EQ(skipped.readAll(), QByteArray("2,yyyyyyyyyyyy\n"));
    EXPECT_EQ(Stored(u"SELECT * FROM x"_s), u"1|x/3|z"_s);
}

TEST_F(ImportWizard, AsksAboutBothCountsOfAKey)
{
    Run(u"CREATE TABLE [T] ([K] Integer,[V] Varchar(9))"_s);
    Run(u"INSERT INTO T (K,V) VALUES (1,'old')"_s);
    const auto fill = [this](bool yes) {
        Show(kDesktop);
        wizard_->Begin(ImportSource::OfFile(WriteFile(u"x.csv"_s, "k,v\n1,new\n2,more\n")));
        GoOn();
        Tap(Named<QRadioButton>(Str::ImportExistingTable));
        auto* tables = wizard_->findChild<QListWidget*>();
        TapRow(tables, 0);
        GoOn();
        Tap(Named<QCheckBox>(Str::ImportFieldKey));
        Paint(u"4-key"_s);
        prompt_.answers = {yes};
        prompt_.shown.clear();
        GoOn();
    };
    fill(false);
    EXPECT_EQ(prompt_.questions, QStringList{u"1 record(s) will be added to \"T\" and 1 changed. Import them?"_s});
    EXPECT_EQ(Stored(u"SELECT * FROM T"_s), u"1|old"_s);
    fill(true);
    EXPECT_EQ(prompt_.shown, QStringList{u"1 record(s) imported, 1 updated."_s});
    EXPECT_EQ(Stored(u"SELECT * FROM T"_s), u"1|new/2|more"_s);
}

TEST_F(ImportWizard, TakesTheClipboardAndDrops)
{
    Show(kDesktop);
    QGuiApplication::clipboard()->setText(u"City\tNote\nOslo\t\"two\nlines\"\nCork\tsays \"hi\"\n"_s);
    Tap(Named<QPushButton>(Str::ImportPaste));
    GoOn();
    EXPECT_TRUE(Named<QRadioButton>(Str::CsvSeparatorTab)->isChecked());
    GoOn();
    GoOn();
    GoOn();
    EXPECT_EQ(Stored(u"SELECT * FROM Imported"_s), u"Oslo|two\nlines/Cork|says \"hi\""_s);

    Show(kDesktop);
    QMimeData dragged;
    dragged.setUrls({QUrl::fromLocalFile(WriteFile(u"drop.tsv"_s, "a\tb\n1\t2\n"))});
    QDragEnterEvent enter(QPoint(50, 50), Qt::CopyAction, &dragged, Qt::LeftButton, {});
    QApplication::sendEvent(wizard_.get(), &enter);
    EXPECT_TRUE(enter.isAccepted());
    QDropEvent drop(QPointF(50, 50), Qt::CopyAction, &dragged, Qt::LeftButton, {});
    QApplication::sendEvent(wizard_.get(), &drop);
    EXPECT_EQ(draft_->Source().Path(), folder_.filePath(u"drop.tsv"_s));
    EXPECT_EQ(Step(), 1);
    prompt_.shown.clear();
    wizard_->Begin(ImportSource::OfFile(folder_.filePath(u"nowhere.csv"_s)));
    EXPECT_EQ(prompt_.shown.size(), 1) << "the file before stays";
    EXPECT_EQ(draft_->Source().Path(), folder_.filePath(u"drop.tsv"_s));
}

TEST_F(ImportWizard, ChoosesOptionsOfTheFormat)
{
    Show(kHandheld);
    wizard_->Begin(ImportSource::OfFile(WriteFile(u"x.csv"_s, "a,b\n1,2/1/2001\n")));
    QTimer waiting;
    QObject::connect(&waiting, &QTimer::timeout, [this, &waiting] {
        auto* dialog = qobject_cast<CImportOptionsDialog*>(QApplication::activeModalWidget());
        if (!dialog)
            return;
        waiting.stop();
        Paint(*dialog, u"options"_s);
        const QList<QComboBox*> boxes = dialog->findChildren<QComboBox*>();
        for (QComboBox* box : boxes) {
            if (box->count() == 7 && !box->isEditable()) {
                box->setCurrentIndex(4);
                Q_EMIT box->activated(4);
            }
        }
        dialog->findChild<QCheckBox*>()->setChecked(true);
        dialog->findChild<QDialogButtonBox*>()->button(QDialogButtonBox::Ok)->click();
    });
    waiting.start(10);
    Tap(Named<QPushButton>(Str::CsvAdvanced));
    EXPECT_EQ(draft_->Format().dates.order, DateOrder::DayMonthYear);
    EXPECT_TRUE(draft_->Format().doubledQuotes);
}

} // namespace
} // namespace mirel
