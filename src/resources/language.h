#pragma once

#include "resources/plural_rules.h"
#include "resources/string_id.h"

#include <QByteArrayView>
#include <QString>
#include <QStringList>

#include <optional>
#include <vector>

namespace mirel {

// The texts of one language, read from a file of Qt Linguist (.ts): the id of a message is the number of a row of
// the string table, and a text with a number has a form for each of the language's plurals. What the file does not
// translate stays English.
//
// The bytes are foreign: a file that is too large, breaks off or is no .ts file is refused as a whole; a message
// of an unknown number is left out.
class LanguageTexts {
public:
    static constexpr qsizetype kLargestFileBytes = 4'000'000;

    static std::optional<LanguageTexts> Read(QByteArrayView bytes);

    // The text with its placeholders, in the form for `count`; null: it is not translated. Line ends are those of
    // the English text.
    QStringView Pattern(Str id, quint64 count) const;
    const QString& Code() const { return code_; } // "de", as the file has it
    qsizetype Count() const { return qsizetype(entries_.size()); }

private:
    friend class LanguageReader;
    struct Entry {
        Str id;
        QStringList forms;
    };

    QString code_;
    PluralRule plurals_ = PluralRuleOf({});
    std::vector<Entry> entries_; // by rising numbers
};

// What StringText speaks from here on; none: English. A text that a window shows already stays as it is, so this
// comes before the first window.
void Speak(std::optional<LanguageTexts> texts);
const LanguageTexts* SpokenLanguage(); // null: English

} // namespace mirel
