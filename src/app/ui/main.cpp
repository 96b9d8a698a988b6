#include "app/instance.h"
#include "app/main_view_commands.h"
#include "app/ui/look.h"
#include "app/ui/main_frame.h"
#include "app/ui/message_box_prompt.h"
#include "app/ui/window_language.h"
#include "app/window_options.h"
#include "cli/console_prompt.h"
#include "help/ui/help_desk.h"

#include <QApplication>
#include <QDeadlineTimer>
#include <QDir>
#include <QFileInfo>

#include <cstdio>

namespace mirel {
namespace {

using namespace Qt::StringLiterals;

constexpr int kDone = 0;
constexpr int kFailed = 1;
constexpr int kWrongArguments = 2;
constexpr bool kAnswerNo = false;

const QString kSampleSource = u":/samples"_s;

void Say(std::FILE* stream, const QString& text)
{
    std::fputs(text.toUtf8().constData(), stream);
}

// The core of the program, from the ground up; a window stands on it, or none.
struct Core {
    Core(const QString& home, UserPrompt& prompt, Profile::Access access = Profile::Access::ReadWrite)
        : folder{.path = ProgramFolder::Find(home).path, .profileAccess = access}
        , profile(folder.OpenProfile())
        , settings(profile)
        , session(connection, folder, prompt)
        , commands(session, state, settings, SampleDatabase(folder, kSampleSource))
    {
    }

    ProgramFolder folder;
    Profile profile;
    Settings settings;
    DbConnection connection;
    DatabaseSession session;
    MainViewState state;
    MainViewCommands commands;
};

int PrintSamplePath(const WindowOptions& options)
{
    cli::ConsolePrompt prompt(kAnswerNo);
    Core core(options.home, prompt);
    const SampleDatabase sample(core.folder, kSampleSource);
    if (!sample.Open(core.session))
        return kFailed;
    Say(stdout, sample.Path() + u'\n');
    return kDone;
}

// False when what was asked for does not open. That the last run's database is gone is no failure.
bool Open(Core& core, const WindowOptions& options)
{
    if (options.sample)
        return core.commands.OpenSample();
    core.commands.RestoreLastRun(options.database);
    return options.database.isEmpty() || core.session.IsOpen();
}

std::optional<ViewKey> ViewToShow(const WindowOptions& options)
{
    for (const auto& [kind, name] :
         {std::pair(EntryKind::Table, options.table), std::pair(EntryKind::Form, options.form),
          std::pair(EntryKind::Query, options.query)}) {
        if (!name.isEmpty())
            return ViewKey{kind, name};
    }
    return std::nullopt;
}

QString KindName(EntryKind kind)
{
    switch (kind) {
    case EntryKind::Table:
        return u"table"_s;
    case EntryKind::Form:
        return u"form"_s;
    case EntryKind::Query:
        break;
    }
    return u"query"_s;
}

// The view alone in the window. False when there is no such view; why was told then.
bool ShowAlone(CMainFrame& frame, const std::optional<ViewKey>& view)
{
    if (!view)
        return true;
    frame.BeAlone(*view);
    if (frame.OpenView(*view))
        return true;
    Say(stderr, u"mirel: it has no %1 \"%2\"\n"_s.arg(KindName(view->kind), view->name));
    return false;
}

// What is counted and sorted in steps, as long as it takes a moment.
void WaitUntilAllShows(const CMainFrame& frame)
{
    constexpr int kPatienceMs = 2000;
    constexpr int kTurnMs = 50;
    const QDeadlineTimer patience(kPatienceMs);
    do {
        QCoreApplication::processEvents(QEventLoop::AllEvents, kTurnMs);
    } while (!frame.IsSettled() && !patience.hasExpired());
}

int TakePicture(const WindowOptions& options)
{
    cli::ConsolePrompt prompt(kAnswerNo); // nobody is there to press a button
    // A script's picture must not become the database that the user's next window opens.
    Core core(options.home, prompt, Profile::Access::ReadOnly);
    if (!Open(core, options))
        return kFailed;
    CMainFrame frame(core.session, core.state, core.commands, core.settings, core.profile);
    if (!ShowAlone(frame, ViewToShow(options)))
        return kFailed;
    frame.setWindowState(Qt::WindowNoState);
    frame.resize(options.size);
    frame.show();
    if (!frame.IsAlone())
        frame.RestoreViews();
    WaitUntilAllShows(frame);
    if (frame.grab().save(options.picture, "PNG"))
        return kDone;
    Say(stderr, u"mirel: cannot write %1\n"_s.arg(options.picture));
    return kFailed;
}

// Nothing was kept yet, and nothing to look at was asked for. Once, even where it is left at its first step.
bool IsFirstStart(const WindowOptions& options, Settings& settings)
{
    const bool asks = options.sample || !options.database.isEmpty() || !options.table.isEmpty() ||
                      !options.form.isEmpty() || !options.query.isEmpty();
    return !asks && !QFileInfo::exists(ProgramFolder::Find(options.home).ProfileFile()) &&
           settings.SetInt(Setting::MainViewTourSeen, 1);
}

// Of an ordinary start: the one that it names, or the last run's.
QString DatabaseToOpen(const WindowOptions& options, const ProgramFolder& folder)
{
    if (options.sample)
        return SampleDatabase(folder, kSampleSource).Path();
    if (!options.database.isEmpty())
        return QDir::cleanPath(QFileInfo(options.database).absoluteFilePath());
    return Settings(folder.OpenProfile()).Text(Setting::ActiveDb);
}

// True when a window that has the database open shows what is wanted. Otherwise this one has the name under which
// the next start finds it; a window that is stuck keeps its name, and this one goes without.
bool IsShownByOther(const WindowOptions& options, Instance& instance)
{
    constexpr int kTimeoutMs = 1500; // a window that has only begun to open answers within that
    const ProgramFolder folder = ProgramFolder::Find(options.home);
    const QString database = DatabaseToOpen(options, folder);
    if (database.isEmpty())
        return false;
    using Answer = Instance::Answer;
    const InstanceRequest request{ViewToShow(options), qgetenv("XDG_ACTIVATION_TOKEN")};
    const InstanceRequest forward{{}, request.activation};
    const QByteArray whole = InstanceName(folder.path, database, {});
    const QByteArray own = InstanceName(folder.path, database, request.view);
    if (request.view && Instance::HandOver(own, forward, kTimeoutMs) == Answer::Taken)
        return true;
    const Answer answer = Instance::HandOver(whole, request, kTimeoutMs);
    if (answer != Answer::Nobody)
        return answer == Answer::Taken;
    // Another start may have been a moment faster.
    return !instance.Take(own) && Instance::HandOver(own, forward, kTimeoutMs) == Answer::Taken;
}

int ShowWindow(const WindowOptions& options, Instance& instance)
{
    MessageBoxPrompt prompt;
    Core core(options.home, prompt);
    const bool isFirst = IsFirstStart(options, core.settings);
    CMainFrame frame(core.session, core.state, core.commands, core.settings, core.profile);
    frame.show();
    (void)Open(core, options); // after show: what it has to say stands over the window
    frame.ShowState();
    if (!ShowAlone(frame, ViewToShow(options)))
        return kFailed;
    if (!frame.IsAlone())
        frame.RestoreViews();
    if (isFirst)
        frame.ShowTour();
    frame.AnswerOtherStarts(instance);
    const int result = QApplication::exec();
    (void)core.commands.KeepForNextRun(); // the window has told already that it cannot be kept
    return result;
}

QString PaletteToUse(const WindowOptions& options)
{
    if (!options.palette.isEmpty())
        return options.palette;
    return Settings(Profile(ProgramFolder::Find(options.home).ProfileFile())).Text(Setting::MainViewPalette);
}

std::optional<int> AnswerWithoutWindow(const WindowOptions& options)
{
    if (options.help) {
        Say(stdout, WindowOptionsHelp());
        return kDone;
    }
    if (options.version) {
        Say(stdout, u"mirel %1\n"_s.arg(QStringLiteral(MIREL_VERSION)));
        return kDone;
    }
    if (options.printSamplePath)
        return PrintSamplePath(options);
    return std::nullopt;
}

} // namespace
} // namespace mirel

int main(int argc, char** argv)
{
    using namespace mirel;
    QStringList arguments;
    for (int i = 1; i < argc; ++i)
        arguments += QString::fromLocal8Bit(argv[i]);
    QString complaint;
    const std::optional<WindowOptions> options = ParseWindowOptions(arguments, complaint);
    if (!options) {
        Say(stderr, QStringLiteral("mirel: %1\nTry mirel --help.\n").arg(complaint));
        return kWrongArguments;
    }
    QCoreApplication::setApplicationName(QStringLiteral("Mirel"));
    if (const std::optional<int> result = AnswerWithoutWindow(*options))
        return *result;

    const bool picture = !options->picture.isEmpty();
    Instance instance;
    if (!picture && IsShownByOther(*options, instance))
        return kDone;
    if (picture)
        qputenv("QT_QPA_PLATFORM", "offscreen");
    QApplication application(argc, argv);
    const ProgramFolder folder = ProgramFolder::Find(options->home);
    UseLanguage(options->language, folder, Settings(Profile(folder.ProfileFile())));
    new HelpDesk(application);
    // Without a display name of its own: that would be put behind every window's title.
    if (!UsePalette(PaletteToUse(*options)))
        QApplication::setStyle(new TouchTargetStyle({}));
    return picture ? TakePicture(*options) : ShowWindow(*options, instance);
}
