#pragma once

#include <QByteArray>
#include <QString>

#include <optional>
#include <vector>

namespace mirel {

// The text of a profile: "[Section]" lines, and under each "key=value" lines, UTF-8. People edit it by hand, so
// sections and keys count in any case, the first line of a key is the one, and every other line (comments,
// sections and keys of others, damaged ones) comes back byte for byte.
//
// A value stands as it is, or between double quotes with backslash escapes where it begins or ends with a blank
// or a quote or holds a control character.
class ProfileText {
public:
    explicit ProfileText(const QByteArray& bytes);

    // Empty when there is no such line, or it is damaged (bad UTF-8, a quote that is not closed).
    std::optional<QString> Find(const QString& section, const QString& key) const;
    // False, and nothing changed, for a section or key that no line could name.
    bool Set(const QString& section, const QString& key, const QString& value);
    QByteArray Bytes() const;

private:
    struct Place {
        qsizetype line = -1;      // of the key; -1: none
        qsizetype insertion = -1; // where a new key of the section goes; -1: there is no such section
    };
    Place Locate(const QString& section, const QString& key) const;

    std::vector<QByteArray> lines_; // without their ends
    QByteArray lineEnd_;
};

} // namespace mirel
