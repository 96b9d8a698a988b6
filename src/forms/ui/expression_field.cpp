#include "forms/ui/expression_field.h"

#include "forms/control_types.h"
#include "forms/ui/expression_desk_dialog.h"
#include "forms/ui/expression_highlighter.h"
#include "platform/ui/look_roles.h"
#include "platform/ui/wrapped_text.h"
#include "resources/string_table.h"

#include <QLabel>
#include <QPlainTextEdit>
#include <QPushButton>
#include <QResizeEvent>
#include <QVBoxLayout>

namespace mirel {
namespace {

constexpr int kLinesShown = 2;
constexpr int kRestMs = 200;

void Tint(QLabel& label, LookRole role)
{
    QPalette palette = label.palette();
    palette.setColor(QPalette::WindowText, ColorOfRole(role, label.palette()));
    label.setPalette(palette);
}

} // namespace

QString AnswerText(const DeskAnswer& answer, bool ticks)
{
    switch (answer.state) {
    case DeskAnswer::State::Nothing:
        return StringText(Str::DeskNothing);
    case DeskAnswer::State::NoResult:
        return StringText(Str::DeskNoResult);
    case DeskAnswer::State::NoRecord:
        return StringText(Str::DeskNoRecord);
    case DeskAnswer::State::Null:
        return StringText(Str::DeskNull);
    case DeskAnswer::State::Value:
        break;
    }
    if (ticks)
        return StringText(answer.value == QLatin1StringView("1") ? Str::DeskTicked : Str::DeskNotTicked);
    return answer.value.isEmpty() ? StringText(Str::DeskEmptyText) : answer.value;
}

ExpressionField::ExpressionField(const PropertyDef& def, const SheetContext& context, QWidget* parent)
    : PropertyEditor(parent)
    , context_(context)
    , text_(new QPlainTextEdit(this))
    , answer_(new QLabel(this))
    , losses_(new QLabel(this))
{
    text_->setAccessibleName(StringText(def.caption));
    text_->setTabChangesFocus(true);
    text_->setFixedHeight(kLinesShown * fontMetrics().lineSpacing() + 10);
    new ExpressionHighlighter(*text_);
    for (QLabel* label : {answer_, losses_}) {
        label->setTextFormat(Qt::PlainText);
        label->setMinimumWidth(1);
        label->hide();
    }
    Tint(*answer_, LookRole::Dim);
    Tint(*losses_, LookRole::Warning);
    auto* desk = new QPushButton(StringText(Str::PropDesk), this);
    desk->setToolTip(StringText(Str::PropDeskTip));
    auto* column = new QVBoxLayout(this);
    column->setContentsMargins({});
    column->setSpacing(spacing::kTight);
    column->addWidget(text_);
    column->addWidget(answer_);
    column->addWidget(losses_);
    column->addWidget(desk, 0, Qt::AlignLeft);
    setFocusProxy(text_);
    wait_.setSingleShot(true);
    connect(&wait_, &QTimer::timeout, this, &ExpressionField::ShowAnswer);
    connect(desk, &QPushButton::clicked, this, &ExpressionField::OpenDesk);
    connect(text_, &QPlainTextEdit::textChanged, this, [this] {
        if (showing_)
            return;
        wait_.start(kRestMs);
        Q_EMIT changed(text_->toPlainText());
    });
}

void ExpressionField::Show(const QString& value)
{
    if (text_->toPlainText() != value) {
        showing_ = true;
        text_->setPlainText(value);
        showing_ = false;
    }
    if (shown_ != context_.maker.Design().Revision() && !wait_.isActive() && !context_.maker.Design().IsDragging())
        wait_.start(kRestMs);
    shown_ = context_.maker.Design().Revision();
}

DeskQuestion ExpressionField::Question() const
{
    const ControlDef& control = context_.maker.Design().Control(context_.control);
    return {.text = text_->toPlainText(),
            .mode = ExprMode::Condition,
            .overAll = control.sourceScope == SourceScope::WholeResult,
            .ticks = Has(control.type, IsTicked)};
}

void ExpressionField::ShowAnswer()
{
    const FormDesign& design = context_.maker.Design();
    if (context_.control >= design.Count())
        return;
    context_.desk.Open(design.Form().tableName.Text());
    const DeskQuestion question = Question();
    const DeskAnswer answer = context_.desk.Read(question, design.Form());
    const bool isEmpty = answer.state == DeskAnswer::State::Nothing;
    QString text = AnswerText(answer, question.ticks);
    if (answer.state == DeskAnswer::State::Value || answer.state == DeskAnswer::State::Null) {
        const qint64 count = context_.desk.RecordCount();
        text = question.overAll ? StringText(Str::DeskWhole, {QString::number(count), text})
                                : StringText(Str::DeskValue, {QString::number(context_.desk.Record() + 1), text});
    }
    answerText_ = isEmpty && question.text.isEmpty() ? QString() : text;
    lossText_ = (answer.losses + answer.reasons).join(QLatin1Char('\n'));
    ShowLines();
}

// Broken by hand: a scrolled page makes no room for labels that break their lines themselves.
void ExpressionField::ShowLines()
{
    for (const auto& [label, text] : {std::pair(answer_, answerText_), std::pair(losses_, lossText_)}) {
        label->setText(WrappedText(text, label->font(), width()));
        label->setVisible(!text.isEmpty());
    }
}

void ExpressionField::resizeEvent(QResizeEvent* event)
{
    PropertyEditor::resizeEvent(event);
    if (event->oldSize().width() != event->size().width())
        ShowLines();
}

void ExpressionField::OpenDesk()
{
    CExpressionDesk desk(context_.desk, context_.maker, Question(), this);
    if (desk.exec() != QDialog::Accepted)
        return;
    text_->setPlainText(desk.Text());
    ShowAnswer();
}

} // namespace mirel
