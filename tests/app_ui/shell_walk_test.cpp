// The dialogs of the shell at a handheld's sizes and at a desktop's, in the light and in the dark palette; see
// walk_test.cpp.
#include "app/ui/drafts_dialog.h"
#include "app/ui/findings_dialog.h"
#include "app/ui/information_dialog.h"
#include "app/ui/look.h"
#include "app_ui/on_dialog.h"
#include "app_ui/program_fixture.h"
#include "platform/ui/file_choice.h"
#include "resources/string_table.h"
#include "support/printing.h"
#include "support/ui/screen_checks.h"
#include "support/ui/window_sizes.h"

#include <QDialog>
#include <QTest>

namespace mirel {
namespace {

using namespace Qt::StringLiterals;

class ShellWalk : public ProgramFixture {
protected:
    void SetUp() override
    {
        before_ = QApplication::palette();
        Start();
        ASSERT_TRUE(Commands().NewDatabase(PathOf(u"A database with a rather long name of its own.cdb"_s)));
        ASSERT_TRUE(Execute(u"CREATE TABLE [Birds] ([Name] Varchar(40))"_s));
        Commands().Refill();
    }
    void TearDown() override
    {
        QApplication::setStyle(u"Fusion"_s);
        QApplication::setPalette(before_);
    }

    template <typename Make>
    void ExpectDialogFits(const QString& name, Make make)
    {
        for (const QString& palette : {u"light"_s, u"dark"_s}) {
            ASSERT_TRUE(UsePalette(palette));
            for (const QSize size : kWindowSizes) {
                QWidget window;
                window.resize(size);
                window.show();
                const std::unique_ptr<QDialog> dialog(make(window));
                dialog->show();
                QCoreApplication::processEvents();
                ExpectFits(*dialog, name + u'-' + palette, size);
            }
        }
    }
    static Draft SomeDraft(const ViewKey& view, std::vector<TypedText> texts)
    {
        return {u"/shop.cdb"_s, {}, view, {u"SELECT * FROM Birds"_s, {}, {}, std::move(texts)}};
    }

    QPalette before_;
};

TEST_F(ShellWalk, GoesThroughTheDialogs)
{
    ExpectDialogFits(u"information"_s, [this](QWidget& window) {
        return new CInformationDialog(Session(),
                                      {.backUp = [] { return QString(); },
                                       .compact = [] { return QString(); },
                                       .check = [] { return StringText(Str::CheckClean); }},
                                      &window);
    });
    ExpectDialogFits(u"findings"_s, [](QWidget& window) {
        return new CFindingsDialog(
            {{u"*** in database main *** Tree 7 page 12 cell 3: Rowid 41 out of order"_s, Str::RemedyDamage},
             {u"form \"Strike entry\", control \"Cost\": there is no field \"Birds.Price of the whole\""_s,
              Str::RemedyForm},
             {u"query \"Costly strikes\": Error: (80040E37) The specified table does not exist"_s,
              Str::RemedyQuery}},
            StringText(Str::CheckFindings, {u"3"_s}), &window);
    });
    const LeftDraft cell{SomeDraft({EntryKind::Table, u"Contacts"_s}, {{0, u"Name"_s, u"O'Brien Jun."_s}}),
                         DraftState::Fits};
    const LeftDraft form{
        SomeDraft({EntryKind::Form, u"Strike entry"_s},
                  {{0, u"Remarks"_s, u"A long remark. "_s.repeated(40)}, {1, u"Seen"_s, u"1"_s, true}}),
        DraftState::Changed};
    const CDraftsDialog::Actions actions{.putBack = [](size_t) { return QString(); },
                                         .discard = [](size_t) { return QString(); }};
    ExpectDialogFits(u"draft-one"_s, [&](QWidget& window) { return new CDraftsDialog({cell}, actions, &window); });
    ExpectDialogFits(u"draft-changed"_s,
                     [&](QWidget& window) { return new CDraftsDialog({form}, actions, &window); });
    ExpectDialogFits(u"draft-many"_s, [&](QWidget& window) {
        return new CDraftsDialog({cell, form, cell, cell, form, cell}, actions, &window);
    });
}

TEST_F(ShellWalk, GoesThroughTheFileDialogOfASmallScreen)
{
    for (const QString& palette : {u"light"_s, u"dark"_s}) {
        ASSERT_TRUE(UsePalette(palette));
        for (const FileUse use : {FileUse::Open, FileUse::Create}) {
            QWidget window;
            window.resize(kHandheld);
            window.show();
            Script script;
            script.On<QDialog>([&](QDialog& dialog) {
                ExpectFits(dialog, (use == FileUse::Open ? u"file-open-"_s : u"file-new-"_s) + palette, kHandheld);
                dialog.reject();
            });
            FileRequest request{.title = Str::CommandOpenDatabase,
                                .accept = Str::CommandOpen,
                                .use = use,
                                .kind = FileKind::Database(),
                                .near = State().DatabasePath(),
                                .name = {}};
            EXPECT_TRUE(ChooseFile(window, request).isEmpty());
            EXPECT_TRUE(script.IsDone());
        }
    }
}

TEST_F(ShellWalk, GoesThroughTheMenuAndTheQuietLine)
{
    for (const QString& palette : {u"light"_s, u"dark"_s}) {
        ASSERT_TRUE(UsePalette(palette));
        for (const QSize size : {kHandheld, kDesktop}) {
            Show(size);
            Frame().Note(StringText(Str::DraftsNotKept, {u"/home/ann/.local/share/Mirel/Drafts"_s}));
            QCoreApplication::processEvents();
            Paint(Frame(), u"quiet-line-%1-%2"_s.arg(palette, QString::number(size.width())));
            EXPECT_EQ(Frame().size(), size);
            for (QMenu* menu : Frame().findChildren<QMenu*>()) {
                if (menu->title() != StringText(Str::MenuDatabase))
                    continue;
                menu->popup({});
                Paint(*menu, u"database-menu-%1-%2"_s.arg(palette, QString::number(size.width())));
                EXPECT_TRUE(size != kHandheld || menu->sizeHint().width() <= kHandheld.width());
                EXPECT_LE(menu->sizeHint().height(), kHandheld.height());
                menu->close();
            }
            program_->frame.reset();
        }
    }
}

} // namespace
} // namespace mirel
