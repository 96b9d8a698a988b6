#pragma once

#include <QByteArray>
#include <QIODevice>
#include <QString>

#include <memory>

namespace mirel {

// What is imported: a file, or a text that was pasted. Each pass over it opens it again.
class ImportSource {
public:
    ImportSource() = default; // nothing yet
    static ImportSource OfFile(const QString& path);
    static ImportSource OfText(const QString& text);

    bool IsNone() const { return path_.isEmpty() && bytes_.isEmpty(); }
    bool IsFile() const { return !path_.isEmpty(); }
    const QString& Path() const { return path_; } // empty for a text
    qint64 SizeBytes() const;

    // Null, with the reason in `fault`, when it cannot be opened.
    std::unique_ptr<QIODevice> Open(QString& fault) const;

private:
    QString path_;
    QByteArray bytes_;
};

} // namespace mirel
