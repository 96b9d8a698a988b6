#include "forms/ui/edit_box.h"

#include "forms/ui/control_look.h"
#include "forms/ui/long_text_dialog.h"
#include "platform/ui/day_chooser.h"
#include "platform/ui/memo_edit.h"
#include "platform/user_locale.h"
#include "resources/string_table.h"

#include <QLineEdit>
#include <QStyleOptionToolButton>
#include <QStylePainter>
#include <QTextOption>
#include <QToolButton>

#include <algorithm>
#include <limits>

namespace mirel {

using namespace Qt::StringLiterals;

namespace {

constexpr int kFrameRoomPx = 2; // what a frame takes of a box's height
// Several lines where the record asks for them and the box has room for two.
bool HasLines(const ControlDef& definition)
{
    if (definition.windowStyle & style::kVerticalScrollBar)
        return true;
    const bool wraps = (definition.windowStyle & style::kAutoHorizontalScroll) == 0;
    const bool high = definition.height >= 2 * LineHeightOf(definition.textStyle);
    return high && (wraps || definition.editKind == EditKind::Extendable);
}

// The strip at the right of an edit box. Lies under the box over the whole width where the form says so; it draws
// and takes taps in the part that the box leaves free.
class StripButton : public QToolButton {
public:
    StripButton(const QWidget& box, QWidget* parent)
        : QToolButton(parent)
        , box_(box)
    {
        setFocusPolicy(Qt::NoFocus); // the box has the focus, and a key for this
    }

protected:
    void paintEvent(QPaintEvent*) override
    {
        QStylePainter painter(this);
        QStyleOptionToolButton option;
        initStyleOption(&option);
        option.rect.setLeft(std::max(box_.geometry().right() + 1 - x(), 0));
        const QStyle::State state = option.state;
        option.state |= QStyle::State_Enabled;
        painter.drawPrimitive(QStyle::PE_PanelButtonTool, option);
        option.state = state;
        const int side = std::min({option.rect.width(), option.rect.height(), 16}) - 2;
        QRect sign(0, 0, side, side);
        sign.moveCenter(option.rect.center());
        option.rect = sign;
        painter.drawPrimitive(QStyle::PE_IndicatorArrowDown, option);
    }

private:
    const QWidget& box_;
};

// What the two editors have in common.
class EditBox : public ControlWidget {
    Q_OBJECT
public:
    EditBox(const ControlRun& control, QWidget& editor, QWidget& surface)
        : ControlWidget(control, editor)
    {
        SetColors(QPalette::Base, QPalette::Text);
        const bool picker = Definition().editKind == EditKind::DatePicker;
        if (!picker && Definition().editKind != EditKind::Extendable)
            return;
        auto* strip = new StripButton(*Main(), &surface);
        strip->setObjectName(Main()->objectName() + u".strip"_s);
        strip->setToolTip(StringText(picker ? Str::CalendarTip : Str::LongTextTip));
        strip->setAccessibleName(strip->toolTip());
        strip->stackUnder(Main());
        connect(strip, &QToolButton::clicked, this, &EditBox::OpenMore);
        TakeStrip(*strip);
    }

    bool OpenMore() override
    {
        const QString before = text_;
        const std::optional<QString> changed = Definition().editKind == EditKind::DatePicker
                                                   ? ChooseDay(text_, BelowBox(), *Main())
                                                   : EditLongText(TextToEdit(), *Main());
        HandOver(changed.value_or(before));
        return true;
    }

    void Show(const ControlRun& control) override
    {
        text_ = control.text;
        if (EditorText() != text_) // not while it is typed: the cursor would jump
            SetEditorText(text_);
    }

protected:
    virtual QString EditorText() const = 0;
    virtual void SetEditorText(const QString& text) = 0;
    int TextRoomPx(int heightPx) const override
    {
        return std::max(heightPx - (Definition().windowStyle & style::kBorder ? kFrameRoomPx : 0), 1);
    }
    const QString& Text() const { return text_; }
    // On the ground of the form, where the form gives it no other.
    void DrawComputed()
    {
        Main()->setFocusPolicy(Qt::ClickFocus);
        if (Definition().backgroundColor != kDefaultColor)
            return;
        QPalette palette = Main()->palette();
        palette.setColor(QPalette::Base, Qt::transparent);
        Main()->setPalette(palette);
    }

private:
    QPoint BelowBox() const { return Main()->mapToGlobal(Main()->rect().bottomLeft()); }
    // What is typed in the large box is the control's at once: it is kept like everything that is typed.
    LongText TextToEdit()
    {
        return {.title = Main()->accessibleName(),
                .text = text_,
                .lines = Definition().lines,
                .typed = [this](const QString& text) { HandOver(text); }};
    }
    void HandOver(const QString& text)
    {
        if (text != text_)
            Q_EMIT textEdited(text);
    }

    QString text_;
};

class LineBox : public EditBox {
public:
    LineBox(const ControlRun& control, QWidget& surface)
        : EditBox(control, *new QLineEdit(&surface), surface)
        , line_(static_cast<QLineEdit*>(Main()))
    {
        line_->setMaxLength(std::numeric_limits<int>::max()); // the longest memo passes through whole
        line_->setFrame(Definition().windowStyle & style::kBorder);
        line_->setAlignment(AlignmentOf(Definition().windowStyle) | Qt::AlignVCenter);
        if (Definition().editKind == EditKind::DatePicker)
            line_->setPlaceholderText(UserLocale::Current().DateFormat());
        connect(line_, &QLineEdit::textEdited, this, &ControlWidget::textEdited);
    }

    void SetComputed() override
    {
        line_->setReadOnly(true);
        line_->setFrame(false);
        DrawComputed();
    }

    void Place(const SurfaceScale& scale) override
    {
        ControlWidget::Place(scale);
        font_ = line_->font();
        FitComputed();
    }

protected:
    QString EditorText() const override { return line_->text(); }
    void SetEditorText(const QString& text) override
    {
        line_->setText(text);
        if (line_->hasFocus())
            line_->selectAll();
        else
            line_->setCursorPosition(0);
        FitComputed();
    }

private:
    // A counter or a total that nobody can scroll to its end is drawn in smaller letters.
    void FitComputed()
    {
        constexpr int kAroundTextPx = 6;
        constexpr qreal kLeast = 0.6;
        if (!line_->isReadOnly())
            return;
        line_->setFont(font_);
        NarrowToFit(*line_, line_->text(), line_->width() - kAroundTextPx, kLeast);
    }

    QLineEdit* line_;
    QFont font_; // as the form has it
};

class TextBox : public EditBox {
public:
    TextBox(const ControlRun& control, QWidget& surface)
        : EditBox(control, *new MemoEdit(&surface), surface)
        , text_(static_cast<MemoEdit*>(Main()))
    {
        const quint32 windowStyle = Definition().windowStyle;
        text_->setFrameShape(windowStyle & style::kBorder ? QFrame::StyledPanel : QFrame::NoFrame);
        const bool wraps = (windowStyle & style::kAutoHorizontalScroll) == 0;
        QTextOption option(AlignmentOf(windowStyle));
        option.setWrapMode(wraps ? QTextOption::WrapAtWordBoundaryOrAnywhere : QTextOption::NoWrap);
        text_->setLineWrapMode(wraps ? QPlainTextEdit::WidgetWidth : QPlainTextEdit::NoWrap);
        text_->document()->setDefaultTextOption(option);
        text_->document()->setDocumentMargin(2);
        connect(text_, &MemoEdit::edited, this, &ControlWidget::textEdited);
    }

    void SetComputed() override
    {
        text_->setReadOnly(true);
        DrawComputed();
    }

protected:
    QString EditorText() const override { return text_->Text(); }
    void SetEditorText(const QString& text) override { text_->SetText(text); }
    int TextRoomPx(int) const override { return 0; }

private:
    MemoEdit* text_;
};

} // namespace

std::unique_ptr<ControlWidget> MakeEditBox(const ControlRun& control, QWidget& surface)
{
    if (HasLines(*control.definition))
        return std::make_unique<TextBox>(control, surface);
    return std::make_unique<LineBox>(control, surface);
}

} // namespace mirel

#include "edit_box.moc"
