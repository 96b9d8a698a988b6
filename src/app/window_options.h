#pragma once

#include <QSize>
#include <QString>
#include <QStringList>

#include <optional>

namespace mirel {

// What the command line of the window's program asks for.
struct WindowOptions {
    QString database;    // to open; empty: the one of the last time
    QString home;        // the program folder; empty: as ProgramFolder::Find says
    QString palette;     // "own", "light", "dark", "desktop"; empty: as the settings have it
    QString language;    // of the texts, such as "de"; empty: as the settings have it
    bool sample = false; // opens the sample, and makes it when it is not there

    // A picture of the window instead of the window.
    QString picture;       // the file to write; empty: none
    QSize size{1100, 700}; // of the picture

    // One view alone, by its name; at most one of them.
    QString table;
    QString form;
    QString query;

    bool printSamplePath = false;
    bool help = false;
    bool version = false;
};

// Empty when the arguments (without the program's name) are wrong; `complaint` then says in one line what is.
std::optional<WindowOptions> ParseWindowOptions(const QStringList& arguments, QString& complaint);

QString WindowOptionsHelp();

} // namespace mirel
