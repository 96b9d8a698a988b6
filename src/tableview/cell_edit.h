#pragma once

#include "platform/field_type.h"
#include "platform/value.h"

#include <QString>

namespace mirel {

enum class EditorKind { None, Text, Date, Check };

// The editor of one cell as a plain object: what it was given, what the user made of it, and what that stores.
// A date is edited as text, in the form the user writes dates; a Yes/No is ticked or not.
class CellEdit {
public:
    // `readsLeading`: a number is what its text begins with, and not the whole of it.
    void Load(const Value& value, FieldType type, int size, bool readsLeading = false);
    void Unload() { *this = CellEdit(); }

    EditorKind Kind() const { return kind_; }
    const QString& Text() const { return text_; }
    bool IsChecked() const { return checked_; }
    bool IsUnset() const { return unset_ && !pending_; } // a Yes/No that is neither
    bool IsPending() const { return pending_; }
    // Why what is stored would not be all of the text; empty: it would.
    QString WhyNotStored() const;
    const QString& LoadedText() const { return loadedText_; } // what Revert gives back

    void SetText(const QString& text);
    void SetChecked(bool checked);
    void Clear(); // to NULL; an unticked box for a Yes/No
    void Revert();

    Value Stored() const;

private:
    QString TextToStore() const;

    EditorKind kind_ = EditorKind::None;
    FieldType type_ = FieldType::None;
    int size_ = -1;
    bool readsLeading_ = false;
    QString loadedText_;
    QString text_;
    bool loadedChecked_ = false;
    bool unset_ = false;
    bool checked_ = false;
    bool pending_ = false;
};

} // namespace mirel
