#pragma once

#include <QByteArray>
#include <QString>

#include <optional>
#include <vector>

namespace mirel {

// The text of a profile: "[Section]" lines, and under each "key=value" lines, UTF-8. People edit it by hand, so
// the case of sections and keys does not matter, the first line of a key counts, and every other line
// (comments, foreign sections and keys, damaged lines) is kept byte for byte.
//
// A value is written unchanged, or in double quotes with backslash escapes if it begins or ends with a blank or a
// quote or contains a control character.
class ProfileText {
public:
    explicit ProfileText(const QByteArray& bytes);

    // Empty when the line is missing or damaged (bad UTF-8, an unclosed quote).
    std::optional<QString> Find(const QString& section, const QString& key) const;
    // False, and nothing changed, for a section or key that cannot be written as a line.
    bool Set(const QString& section, const QString& key, const QString& value);
    QByteArray Bytes() const;

private:
    struct Place {
        qsizetype line = -1;      // of the key; -1: missing
        qsizetype insertion = -1; // where a new key of the section goes; -1: no such section
    };
    Place Locate(const QString& section, const QString& key) const;

    std::vector<QByteArray> lines_; // without their ends
    QByteArray lineEnd_;
};

} // namespace mirel
