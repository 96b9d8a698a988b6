#pragma once

#include <QString>
#include <QStringList>

#include <vector>

namespace mirel {

// A walk through folders in search of a file: what the file dialog of a small screen shows.
class FolderChoice {
public:
    struct Entry {
        QString name;
        bool folder = false;

        friend bool operator==(const Entry&, const Entry&) = default;
    };

    // Files are listed whose name ends in one of `endings` (".cdb"), in any case. A folder that is not there gives
    // the nearest one above it.
    FolderChoice(const QString& folder, QStringList endings);

    QString Folder() const { return folder_; }
    std::vector<Entry> Entries() const; // folders first, each by name; hidden ones are left out
    bool CanGoUp() const;
    void GoUp();
    // Enters the folder of that name; false when there is none, or it may not be read.
    bool Enter(const QString& name);
    // The full path of a file in this folder, or of one that is written with its folder.
    QString PathOf(const QString& name) const;

private:
    QString folder_;
    QStringList endings_;
};

} // namespace mirel
