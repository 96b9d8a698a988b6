#pragma once

#include <QString>

namespace mirel {

// Where a database is: a file of this machine, or the address ("scheme://host/name") of one that a server keeps.
// Whichever it is, the profile keeps it as one text. The provider decides what it can open.
class DatabaseLocation {
public:
    DatabaseLocation() = default; // no database
    // Implicit: what a person typed or the profile kept is a location.
    DatabaseLocation(const QString& text) // NOLINT(google-explicit-constructor)
        : text_(text)
    {
    }

    bool IsEmpty() const { return text_.isEmpty(); }
    bool IsFile() const { return !IsEmpty() && !IsAddress(); }
    bool IsAddress() const;
    // The file's path as it was given; empty for an address.
    QString FilePath() const { return IsAddress() ? QString() : text_; }
    // What people read and the profile keeps.
    const QString& Text() const { return text_; }

    // As they are written: two paths of one file differ.
    friend bool operator==(const DatabaseLocation&, const DatabaseLocation&) = default;

private:
    QString text_;
};

} // namespace mirel
