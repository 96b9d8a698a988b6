#include "cli/console_prompt.h"

#include "cli/output.h"

#include <QElapsedTimer>

#include <csignal>
#include <cstdio>
#include <unistd.h>

namespace mirel::cli {
namespace {

volatile std::sig_atomic_t interrupted = 0;

void RememberInterrupt(int)
{
    interrupted = 1;
}

class ConsoleProgress : public Progress {
public:
    ConsoleProgress(const QString& what, qint64 total)
        : what_(what.toUtf8())
        , total_(total)
        , isShown_(total != 0 && isatty(STDERR_FILENO) != 0)
    {
        sinceShown_.start();
    }
    ~ConsoleProgress() override
    {
        constexpr char kEraseLine[] = "\r\033[K";
        if (wasShown_)
            std::fputs(kEraseLine, stderr);
    }
    Q_DISABLE_COPY_MOVE(ConsoleProgress)

    bool Advance(qint64 done) override
    {
        constexpr int kShowEveryMs = 100;
        if (isShown_ && sinceShown_.elapsed() >= kShowEveryMs) {
            if (total_ > 0)
                std::fprintf(stderr, "\r%s %d %%", what_.constData(), int(double(done) / double(total_) * 100));
            else
                std::fprintf(stderr, "\r%s %lld", what_.constData(), static_cast<long long>(done));
            wasShown_ = true;
            sinceShown_.restart();
        }
        return !WasInterrupted();
    }

private:
    QByteArray what_;
    qint64 total_;
    bool isShown_;
    bool wasShown_ = false;
    QElapsedTimer sinceShown_;
};

} // namespace

bool ConsolePrompt::AskYesNo(const UserMessage& question)
{
    if (!answerYes_)
        WriteMessage(question.Text());
    return answerYes_;
}

void ConsolePrompt::Show(const UserMessage& message)
{
    WriteMessage(message.Text());
}

void ConsolePrompt::ShowError(const QString& text)
{
    WriteMessage(text);
}

std::optional<QString> ConsolePrompt::AskText(const UserMessage&, const UserMessage&, const QString&)
{
    return {};
}

std::unique_ptr<Progress> ConsolePrompt::StartProgress(const UserMessage& what, qint64 total)
{
    return std::make_unique<ConsoleProgress>(what.Text(), total);
}

void CatchInterrupts()
{
    struct sigaction catching = {};
    catching.sa_handler = RememberInterrupt;
    catching.sa_flags = static_cast<int>(SA_RESETHAND);
    for (const int signal : {SIGINT, SIGTERM, SIGHUP}) {
        struct sigaction before = {};
        // A program started with nohup goes on ignoring what it was told to ignore.
        if (sigaction(signal, nullptr, &before) == 0 && before.sa_handler != SIG_IGN)
            sigaction(signal, &catching, nullptr);
    }
    std::signal(SIGPIPE, SIG_IGN);
}

bool WasInterrupted()
{
    return interrupted != 0;
}

} // namespace mirel::cli
