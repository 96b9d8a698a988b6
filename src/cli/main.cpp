#include "cli/console_prompt.h"
#include "cli/run.h"
#include "provider/stop_check.h"
#include "resources/string_table.h"

#include <QCoreApplication>

#include <clocale>
#include <unistd.h>

namespace {

// Standard error is for the program's own words: under a locale without UTF-8, for one, Qt explains itself there.
void DropLibraryMessages(QtMsgType, const QMessageLogContext&, const QString&)
{
}

int RefuseArgument(int number)
{
    mirel::cli::WriteMessage(mirel::StringText(mirel::Str::CliNotUtf8Argument, {QString::number(number)}));
    return int(mirel::cli::ExitStatus::BadArguments);
}

} // namespace

int main(int argc, char** argv)
{
    qInstallMessageHandler(DropLibraryMessages);
    const QCoreApplication application(argc, argv);
    std::setlocale(LC_MESSAGES, "C"); // the reasons of the system, too, are told in English
    QStringList words;
    for (int i = 1; i < argc; ++i) {
        if (!QByteArrayView(argv[i]).isValidUtf8())
            return RefuseArgument(i);
        words += QString::fromUtf8(argv[i]);
    }
    mirel::cli::CatchInterrupts();
    mirel::SetStopCheck(mirel::cli::WasInterrupted);
    mirel::cli::Output output(STDOUT_FILENO);
    return int(mirel::cli::RunProgram(words, output));
}
