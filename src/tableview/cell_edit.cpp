#include "tableview/cell_edit.h"

#include "platform/user_locale.h"
#include "result/cell_text.h"
#include "tableview/why_not_stored.h"

namespace mirel {

void CellEdit::Load(const Value& value, FieldType type, int size, bool readsLeading)
{
    Unload();
    type_ = type;
    size_ = size;
    readsLeading_ = readsLeading;
    if (type == FieldType::YesNo) {
        kind_ = EditorKind::Check;
        checked_ = loadedChecked_ = value.Number() != 0;
        unset_ = value.IsNull();
        return;
    }
    kind_ = type == FieldType::Date ? EditorKind::Date : EditorKind::Text;
    text_ = loadedText_ = VariantText(value);
}

QString CellEdit::TextToStore() const
{
    return readsLeading_ ? LeadingNumber(text_, type_) : text_;
}

QString CellEdit::WhyNotStored() const
{
    return !pending_ || kind_ == EditorKind::Check ? QString() : mirel::WhyNotStored(TextToStore(), type_, size_);
}

void CellEdit::SetText(const QString& text)
{
    text_ = text;
    pending_ = text_ != loadedText_; // typed back to what it was
}

void CellEdit::SetChecked(bool checked)
{
    checked_ = checked;
    pending_ = true;
}

void CellEdit::Clear()
{
    if (kind_ == EditorKind::Check)
        SetChecked(false);
    else
        SetText(QString());
    pending_ = true; // an empty text becomes NULL
}

void CellEdit::Revert()
{
    text_ = loadedText_;
    checked_ = loadedChecked_;
    pending_ = false;
}

Value CellEdit::Stored() const
{
    return kind_ == EditorKind::Check ? Value::Bool(checked_) : TypedValue(TextToStore(), type_);
}

} // namespace mirel
