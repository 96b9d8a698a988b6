#include "cli/console_prompt.h"
#include "cli/run.h"
#include "provider/stop_check.h"

#include <QCoreApplication>

#include <unistd.h>

namespace {

// Standard error is for the program's own words: under a locale without UTF-8, for one, Qt explains itself there.
void DropLibraryMessages(QtMsgType, const QMessageLogContext&, const QString&)
{
}

} // namespace

int main(int argc, char** argv)
{
    qInstallMessageHandler(DropLibraryMessages);
    const QCoreApplication application(argc, argv);
    QStringList words;
    for (int i = 1; i < argc; ++i)
        words += QString::fromUtf8(argv[i]);
    mirel::cli::CatchInterrupts();
    mirel::SetStopCheck(mirel::cli::WasInterrupted);
    mirel::cli::Output output(STDOUT_FILENO);
    return int(mirel::cli::RunProgram(words, output));
}
