#include "platform/ui/memo_edit.h"

#include "platform/memo_text.h"

namespace mirel {

MemoEdit::MemoEdit(QWidget* parent)
    : QPlainTextEdit(parent)
{
    setTabChangesFocus(true);
    connect(this, &QPlainTextEdit::textChanged, this, [this] {
        if (setting_)
            return;
        const QString now = WithEdit(text_, document()->toRawText());
        if (now == text_)
            return;
        text_ = now;
        Q_EMIT edited(text_);
    });
}

void MemoEdit::SetText(const QString& text)
{
    if (text == text_)
        return;
    setting_ = true;
    text_ = text;
    setPlainText(text);
    setting_ = false;
}

} // namespace mirel
