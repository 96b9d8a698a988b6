// A window in which somebody types, until the process is killed: typist HOME DATABASE VIEW PLACE TEXT
//   VIEW   as a favorite names it: "table:Birds", "form:Bird form"
//   PLACE  keys that lead there: d down, r right, t Tab, z zoom, n new record
// Says "typed" once the keys are through.
#include "app/main_view_commands.h"
#include "app/ui/main_frame.h"
#include "app/ui/view_tabs.h"
#include "forms/ui/form_eng_view.h"
#include "resources/string_table.h"
#include "support/scripted_prompt.h"
#include "tableview/ui/table_view.h"

#include <QApplication>
#include <QTest>

#include <cstdio>

namespace mirel {
namespace {

using namespace Qt::StringLiterals;

void Press(QWidget& view, QChar key)
{
    QWidget* focused = QApplication::focusWidget() ? QApplication::focusWidget() : &view;
    if (key == u'd')
        QTest::keyClick(focused, Qt::Key_Down);
    else if (key == u'r')
        QTest::keyClick(focused, Qt::Key_Right);
    else if (key == u't')
        QTest::keyClick(focused, Qt::Key_Tab);
    const auto trigger = [&view](Str text) {
        for (QAction* action : view.actions()) {
            if (action->text() == StringText(text))
                action->trigger();
        }
    };
    if (key == u'z')
        trigger(Str::ZoomIn);
    if (key == u'n')
        trigger(Str::ActionNewRecord);
}

int Type(const QStringList& arguments)
{
    ScriptedPrompt prompt;
    const ProgramFolder folder{arguments[1]};
    Profile profile(folder.ProfileFile());
    Settings settings{profile};
    DbConnection connection;
    DatabaseSession session(connection, folder, prompt);
    MainViewState state;
    MainViewCommands commands(session, state, settings, SampleDatabase(folder, {}));
    CMainFrame frame(session, state, commands, settings, profile);
    frame.show();
    commands.RestoreLastRun(arguments[2]);
    frame.ShowState();
    const std::optional<MainEntry> entry = FavoriteOfText(arguments[3]);
    HostedView* view = entry ? frame.OpenView({entry->kind, entry->name}) : nullptr;
    if (!view || !QTest::qWaitForWindowActive(&frame))
        return 1;
    if (entry->kind != EntryKind::Form) // which has put it into its first control
        FocusView(*view);
    for (const QChar key : arguments[4])
        Press(*view, key);
    for (const QChar each : arguments[5]) // the first one may move the focus into an editor
        QTest::keyClicks(QApplication::focusWidget(), QString(each));
    std::puts("typed");
    std::fflush(stdout);
    return QApplication::exec();
}

} // namespace
} // namespace mirel

int main(int argc, char** argv)
{
    constexpr int kArguments = 6;
    const QApplication application(argc, argv);
    return argc == kArguments ? mirel::Type(QApplication::arguments()) : 2;
}
