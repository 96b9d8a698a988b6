#include "forms/ui/long_text_dialog.h"

#include "platform/ui/dialog_buttons.h"
#include "platform/ui/memo_edit.h"
#include "platform/ui/window_place.h"

#include <QDialog>
#include <QDialogButtonBox>
#include <QShortcut>
#include <QVBoxLayout>

#include <algorithm>

namespace mirel {
namespace {

constexpr int kFewestLines = 8;
constexpr int kMostLines = 30;
constexpr int kCharacters = 60; // of a line

} // namespace

std::optional<QString> EditLongText(const LongText& longText, QWidget& parent)
{
    const QWidget& window = *parent.window();
    QDialog dialog(&parent);
    dialog.setWindowTitle(longText.title);
    auto* editor = new MemoEdit(&dialog);
    editor->SetText(longText.text);
    editor->setReadOnly(longText.readOnly);
    editor->setAccessibleName(longText.title);
    if (longText.typed)
        QObject::connect(editor, &MemoEdit::edited, &dialog, longText.typed);
    QDialogButtonBox* buttons = OkAndCancel(dialog);
    // Enter makes a line here, so the text is taken with it and Ctrl.
    for (const Qt::Key key : {Qt::Key_Return, Qt::Key_Enter})
        QObject::connect(new QShortcut(Qt::CTRL | key, &dialog), &QShortcut::activated, &dialog, &QDialog::accept);
    auto* column = new QVBoxLayout(&dialog);
    column->addWidget(editor, 1);
    column->addWidget(buttons);
    const QFontMetrics metrics = editor->fontMetrics();
    const int lines = std::clamp(longText.lines, kFewestLines, kMostLines);
    const QSize wanted(metrics.averageCharWidth() * kCharacters,
                       metrics.lineSpacing() * lines + 3 * metrics.height());
    dialog.resize(IsHandheldSize(window.size()) ? window.size() : wanted);
    editor->moveCursor(QTextCursor::End);
    if (dialog.exec() != QDialog::Accepted || longText.readOnly)
        return std::nullopt;
    return editor->Text();
}

} // namespace mirel
