#pragma once

#include <QString>
#include <QStringList>

#include <vector>

namespace mirel {

// Walks through folders to choose a file: the model of the file dialog for small screens.
class FolderChoice {
public:
    struct Entry {
        QString name;
        bool folder = false;

        friend bool operator==(const Entry&, const Entry&) = default;
    };

    // Lists the files whose names end in one of `endings` (".cdb"; an empty one: all files), in any case. If the
    // folder does not exist, the nearest existing one above it is used.
    FolderChoice(const QString& folder, QStringList endings);

    QString Folder() const { return folder_; }
    std::vector<Entry> Entries() const; // folders first, each by name, without hidden ones
    bool CanGoUp() const;
    void GoUp();
    // Enters the folder of that name; false when it does not exist or may not be read.
    bool Enter(const QString& name);
    // The full path of a file in this folder, or of one given with its own path.
    QString PathOf(const QString& name) const;

private:
    QString folder_;
    QStringList endings_;
};

} // namespace mirel
