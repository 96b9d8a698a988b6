#pragma once

#include "resources/string_id.h"

#include <QString>
#include <QStringList>

#include <vector>

class QWidget;

namespace mirel {

// What the user wants of a file: it may be new for Create alone.
enum class FileUse { Open, Create, Delete };

// Which files a dialog offers.
struct FileKind {
    Str filter;          // as the desktop's dialog takes it: "Database (*.cdb)", more than one with ";;" between
    QStringList endings; // of the files that the list shows, ".cdb"
    QStringView icon;    // of a file in the list: a name for ThemeIcon
    std::vector<Str> others{}; // further filters; with any, a small screen's list offers all files

    static FileKind Database();
};

// Asks the user for a file; empty when there is none. `title` and `accept` are texts of commands. The dialog
// begins in the folder of `near`, in the user's documents when that is empty. On a screen too small for the
// desktop's dialog, one of our own fills the window. Creating does not ask about an existing file: the
// writer does.
struct FileRequest {
    Str title;
    Str accept;
    FileUse use = FileUse::Open;
    FileKind kind;
    QString near;
    QString name; // of a file to be created, before the user gives another
};
QString ChooseFile(QWidget& parent, const FileRequest& request);

} // namespace mirel
