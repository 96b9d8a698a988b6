#include "querybuilder/ui/statement_edit.h"

#include "platform/ui/look_roles.h"

#include <QAbstractItemView>
#include <QCompleter>
#include <QKeyEvent>
#include <QScrollBar>
#include <QStringListModel>
#include <QSyntaxHighlighter>
#include <QTextBlock>

#include <algorithm>
#include <array>

namespace mirel {
namespace {

constexpr float kFaultTint = 0.18F;
constexpr int kMostWords = 10;                 // of the list that completes
constexpr qsizetype kLongestColoured = 20'000; // characters of a line: colours of more are not worth the wait

struct KindLook {
    MarkKind kind;
    LookRole role;
};
constexpr std::array kLooks = {
    KindLook{MarkKind::Keyword, LookRole::Accent}, KindLook{MarkKind::Function, LookRole::Accent},
    KindLook{MarkKind::Text, LookRole::Warning},   KindLook{MarkKind::Number, LookRole::Warning},
    KindLook{MarkKind::Fault, LookRole::Error},
};

class WordColors : public QSyntaxHighlighter {
public:
    explicit WordColors(QPlainTextEdit& editor)
        : QSyntaxHighlighter(editor.document())
        , editor_(editor)
    {
    }

protected:
    void highlightBlock(const QString& line) override
    {
        if (line.size() > kLongestColoured)
            return;
        QChar open = previousBlockState() > 0 ? QChar(char16_t(previousBlockState())) : QChar();
        for (const StatementMark& mark : MarksOfLine(line, open)) {
            const auto* look = std::ranges::find(kLooks, mark.kind, &KindLook::kind);
            setFormat(int(mark.begin), int(mark.length), ColorOfRole(look->role, editor_.palette()));
        }
        setCurrentBlockState(open.isNull() ? 0 : int(open.unicode()));
    }

private:
    QPlainTextEdit& editor_;
};

} // namespace

StatementEdit::StatementEdit(Complete complete, QWidget* parent)
    : QPlainTextEdit(parent)
    , complete_(std::move(complete))
    , completer_(new QCompleter(this))
    , words_(new QStringListModel(completer_))
{
    new WordColors(*this);
    setTabChangesFocus(true);
    completer_->setModel(words_);
    completer_->setWidget(this);
    completer_->setCompletionMode(QCompleter::UnfilteredPopupCompletion);
    completer_->setMaxVisibleItems(kMostWords);
    connect(completer_, qOverload<const QString&>(&QCompleter::activated), this, &StatementEdit::TakeWord);
    connect(this, &QPlainTextEdit::textChanged, this, [this] { setExtraSelections({}); });
}

void StatementEdit::SetText(const QString& text)
{
    if (toPlainText() != text)
        setPlainText(text);
}

QString StatementEdit::TextBeforeCaret() const
{
    return toPlainText().left(textCursor().position());
}

void StatementEdit::Insert(ClauseKind kind, const QString& word)
{
    QTextCursor caret = textCursor();
    const QString before = toPlainText().left(caret.selectionStart());
    caret.insertText(ClauseInsertion(kind, before, word));
    setTextCursor(caret);
    setFocus();
}

void StatementEdit::MarkFault(const StatementPlace& place)
{
    QTextCursor at(document());
    const int last = document()->characterCount() - 1;
    at.setPosition(std::min(int(place.begin), last));
    QTextCursor caret = at;
    at.setPosition(std::min(int(place.begin + place.length), last), QTextCursor::KeepAnchor);
    if (!at.hasSelection()) // at the end: what stands in front of it
        at.movePosition(QTextCursor::PreviousWord, QTextCursor::KeepAnchor);
    QTextEdit::ExtraSelection fault;
    fault.cursor = at;
    const QColor error = ColorOfRole(LookRole::Error, palette());
    fault.format.setUnderlineStyle(QTextCharFormat::WaveUnderline);
    fault.format.setUnderlineColor(error);
    fault.format.setBackground(Blend(error, palette().color(QPalette::Base), kFaultTint));
    setTextCursor(caret);
    setExtraSelections({fault});
    ensureCursorVisible();
    setFocus();
}

// --- completion ---------------------------------------------------------------------------------------------

void StatementEdit::keyPressEvent(QKeyEvent* event)
{
    if (completer_->popup()->isVisible()) {
        switch (event->key()) {
        case Qt::Key_Return:
        case Qt::Key_Enter:
        case Qt::Key_Tab:
        case Qt::Key_Escape:
        case Qt::Key_Backtab:
            event->ignore(); // the list's
            return;
        default:
            break;
        }
    }
    const bool breaks = event->key() == Qt::Key_Return || event->key() == Qt::Key_Enter;
    if (breaks && singleLine_) {
        event->ignore();
        return;
    }
    const bool asks = event->key() == Qt::Key_Space && event->modifiers() == Qt::ControlModifier;
    if (!asks)
        QPlainTextEdit::keyPressEvent(event);
    const bool types = !event->text().isEmpty() && event->text().front().isPrint() && event->text() != u" ";
    if (asks || types || (event->key() == Qt::Key_Backspace && completer_->popup()->isVisible()))
        OfferWords(asks);
    else if (completer_->popup()->isVisible())
        completer_->popup()->hide();
}

void StatementEdit::OfferWords(bool asked)
{
    constexpr qsizetype kLeastTyped = 2;
    completion_ = isReadOnly() ? Completion() : complete_(TextBeforeCaret());
    const bool isShort = completion_.typed.size() < kLeastTyped &&
                         completion_.begin == textCursor().position() - completion_.typed.size();
    const bool behindPoint = completion_.begin > 0 && toPlainText()[completion_.begin - 1] == u'.';
    if (completion_.IsEmpty() || (isShort && !behindPoint && !asked)) {
        completer_->popup()->hide();
        return;
    }
    words_->setStringList(completion_.words);
    QTextCursor word = textCursor();
    word.setPosition(int(completion_.begin));
    QRect place = cursorRect(word);
    QAbstractItemView* popup = completer_->popup();
    place.setWidth(
        std::min(popup->sizeHintForColumn(0) + popup->verticalScrollBar()->sizeHint().width() + 2 * spacing::kGap,
                 window()->width() - spacing::kGap));
    popup->setTextElideMode(Qt::ElideMiddle);
    completer_->complete(place.translated(viewport()->pos()));
    popup->setCurrentIndex(completer_->completionModel()->index(0, 0));
}

void StatementEdit::TakeWord(const QString& word)
{
    QTextCursor caret = textCursor();
    caret.setPosition(int(completion_.begin), QTextCursor::KeepAnchor);
    caret.insertText(word);
    setTextCursor(caret);
}

// --- look ---------------------------------------------------------------------------------------------------

void StatementEdit::changeEvent(QEvent* event)
{
    QPlainTextEdit::changeEvent(event);
    if (event->type() == QEvent::PaletteChange) {
        if (auto* colors = document()->findChild<QSyntaxHighlighter*>())
            colors->rehighlight();
    }
}

int StatementEdit::HeightOf(int lines) const
{
    return lines * fontMetrics().lineSpacing() + 2 * int(document()->documentMargin()) + 2 * frameWidth();
}

void StatementEdit::SetLines(int least, int most)
{
    leastLines_ = least;
    setMinimumHeight(HeightOf(least));
    setMaximumHeight(most > 0 ? HeightOf(most) : QWIDGETSIZE_MAX);
    singleLine_ = most == 1;
    const auto bars = singleLine_ ? Qt::ScrollBarAlwaysOff : Qt::ScrollBarAsNeeded;
    setVerticalScrollBarPolicy(bars);
    setHorizontalScrollBarPolicy(bars);
    setLineWrapMode(singleLine_ ? NoWrap : WidgetWidth);
    updateGeometry();
}

QSize StatementEdit::sizeHint() const
{
    return {24 * fontMetrics().averageCharWidth(), HeightOf(leastLines_)};
}

QSize StatementEdit::minimumSizeHint() const
{
    return {8 * fontMetrics().averageCharWidth(), HeightOf(1)};
}

} // namespace mirel
