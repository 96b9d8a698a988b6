#include "forms/ui/expression_desk_dialog.h"

#include "data/catalog.h"
#include "expr/function_library.h"
#include "forms/control_types.h"
#include "forms/design/new_controls.h"
#include "forms/ui/expression_field.h"
#include "forms/ui/expression_highlighter.h"
#include "platform/ui/dialog_buttons.h"
#include "platform/ui/look_roles.h"
#include "platform/ui/window_place.h"
#include "resources/string_table.h"
#include "resources/ui/theme_icon.h"

#include <QDialogButtonBox>
#include <QLabel>
#include <QListWidget>
#include <QPlainTextEdit>
#include <QPushButton>
#include <QTabWidget>
#include <QToolButton>
#include <QVBoxLayout>

namespace mirel {
namespace {

using namespace Qt::StringLiterals;

constexpr int kRestMs = 150;
constexpr int kHelpFromHeight = 280;
constexpr int kInsertRole = Qt::UserRole;
constexpr int kHelpRole = Qt::UserRole + 1;

QPlainTextEdit* ReadOnlyText(Str name, QWidget* parent)
{
    auto* text = new QPlainTextEdit(parent);
    text->setReadOnly(true);
    text->setTabChangesFocus(true);
    text->setFrameShape(QFrame::NoFrame);
    text->setTextInteractionFlags(Qt::TextSelectableByMouse | Qt::TextSelectableByKeyboard);
    text->setAccessibleName(StringText(name));
    return text;
}

} // namespace

CExpressionDesk::CExpressionDesk(ExpressionDesk& desk, FormMaker& maker, const DeskQuestion& question,
                                 QWidget* parent)
    : QDialog(parent)
    , desk_(desk)
    , maker_(maker)
    , question_(question)
    , text_(new QPlainTextEdit(question.text, this))
    , value_(new QLabel(this))
    , neighbors_(new QLabel(this))
    , previous_(new QToolButton(this))
    , next_(new QToolButton(this))
    , tabs_(new QTabWidget(this))
    , meaning_(ReadOnlyText(Str::DeskMeaning, this))
    , notes_(ReadOnlyText(Str::DeskNotes, this))
    , help_(new QLabel(this))
{
    setWindowTitle(StringText(Str::DeskTitle));
    desk_.Open(maker.Design().Form().tableName.Text());
    text_->setAccessibleName(StringText(Str::DeskText));
    text_->setTabChangesFocus(true);
    text_->moveCursor(QTextCursor::End);
    new ExpressionHighlighter(*text_);
    wait_.setSingleShot(true);
    connect(&wait_, &QTimer::timeout, this, &CExpressionDesk::ShowAnswer);
    connect(text_, &QPlainTextEdit::textChanged, this, [this] { wait_.start(kRestMs); });
    connect(previous_, &QToolButton::clicked, this, [this] { Step(-1); });
    connect(next_, &QToolButton::clicked, this, [this] { Step(1); });
    FillLists();
    LayOut();
    ShowAnswer();
    text_->setFocus();
}

QListWidget* CExpressionDesk::AddList(Str title)
{
    auto* list = new QListWidget(tabs_);
    list->setFrameShape(QFrame::NoFrame);
    list->setAccessibleName(StringText(title));
    tabs_->addTab(list, StringText(title));
    connect(list, &QListWidget::itemActivated, this,
            [this](const QListWidgetItem* item) { Insert(item->data(kInsertRole).toString()); });
    connect(list, &QListWidget::currentItemChanged, this, [this](const QListWidgetItem* item) {
        help_->setText(item ? item->data(kHelpRole).toString() : QString());
    });
    return list;
}

void CExpressionDesk::FillLists()
{
    const auto add = [](QListWidget* list, const QString& text, const QString& insert, const QString& help) {
        auto* item = new QListWidgetItem(text, list);
        item->setData(kInsertRole, insert);
        item->setData(kHelpRole, help);
        item->setToolTip(help.toHtmlEscaped());
    };
    QListWidget* fields = AddList(Str::DeskFields);
    for (const ResultField& field : maker_.Fields())
        add(fields, field.name, FieldSource(maker_.Design().Form().tableName.Text(), field.name),
            StringText(Str::WordField, {field.name}));
    QListWidget* functions = AddList(Str::DeskFunctions);
    for (const FunctionDef& function : Functions()) {
        const QString name = QStringView(function.name).toString();
        add(functions, name, function.allowed > 0 ? name + u'(' : name + u"()"_s, StringText(function.help));
    }
    QListWidget* controls = AddList(Str::DeskControls);
    for (const ControlDef& control : maker_.Design().Form().controls) {
        const QString name = control.name.Text();
        if (Has(control.type, HoldsValue) && !name.isEmpty())
            add(controls, name, u'&' + BracketedName(name), StringText(Str::WordControl, {name}));
    }
    tabs_->addTab(meaning_, StringText(Str::DeskMeaning));
    tabs_->addTab(notes_, StringText(Str::DeskNotes));
    tabs_->setDocumentMode(true);
    tabs_->setUsesScrollButtons(true);
}

void CExpressionDesk::LayOut()
{
    const int line = fontMetrics().lineSpacing();
    const bool small = IsHandheldSize(parentWidget()->window()->size());
    text_->setFixedHeight((small ? 2 : 3) * line + 10);
    for (QLabel* label : {value_, neighbors_, help_}) {
        label->setTextFormat(Qt::PlainText);
        label->setWordWrap(true);
        label->setMinimumWidth(1);
    }
    QFont bold = value_->font();
    bold.setBold(true);
    value_->setFont(bold);
    QPalette dim = neighbors_->palette();
    dim.setColor(QPalette::WindowText, ColorOfRole(LookRole::Dim, dim));
    neighbors_->setPalette(dim);
    help_->setPalette(dim);
    help_->setText(StringText(Str::DeskHelpHint));
    previous_->setIcon(ThemeIcon(u"go-previous"));
    next_->setIcon(ThemeIcon(u"go-next"));
    previous_->setToolTip(StringText(Str::DeskPrevious));
    next_->setToolTip(StringText(Str::DeskNext));
    for (QToolButton* button : {previous_, next_}) {
        button->setAutoRaise(true);
        button->setAccessibleName(button->toolTip());
        button->setFocusPolicy(Qt::TabFocus);
    }
    auto* values = new QHBoxLayout;
    values->addWidget(previous_);
    auto* texts = new QVBoxLayout;
    texts->setSpacing(0);
    texts->addWidget(value_);
    texts->addWidget(neighbors_);
    values->addLayout(texts, 1);
    values->addWidget(next_);
    QDialogButtonBox* buttons = OkAndCancel(*this);
    auto* column = new QVBoxLayout(this);
    const int margin = small ? spacing::kTight : spacing::kRoom;
    column->setContentsMargins(margin, margin, margin, margin);
    column->setSpacing(spacing::kTight);
    column->addWidget(text_);
    column->addLayout(values);
    column->addWidget(tabs_, 1);
    column->addWidget(help_);
    column->addWidget(buttons);
    resize(line * 32, line * 26);
    FillSmallWindow(*this, *parentWidget()->window());
    help_->setVisible(height() >= kHelpFromHeight);
}

QString CExpressionDesk::Text() const
{
    return text_->toPlainText();
}

DeskQuestion CExpressionDesk::Question() const
{
    DeskQuestion question = question_;
    question.text = Text();
    return question;
}

void CExpressionDesk::Insert(const QString& text)
{
    text_->insertPlainText(text);
    text_->setFocus();
}

void CExpressionDesk::Step(int by)
{
    desk_.GoTo(desk_.Record() + by);
    ShowAnswer();
}

void CExpressionDesk::ShowAnswer()
{
    wait_.stop();
    const FormDef& form = maker_.Design().Form();
    const DeskQuestion question = Question();
    const DeskAnswer answer = desk_.Read(question, form);
    const qint64 record = desk_.Record();
    const qint64 count = desk_.RecordCount();
    const QString text = AnswerText(answer, question.ticks);
    const bool hasValue = answer.state == DeskAnswer::State::Value || answer.state == DeskAnswer::State::Null;
    value_->setText(!hasValue          ? text
                    : question.overAll ? StringText(Str::DeskWhole, {QString::number(count), text})
                                       : StringText(Str::DeskValue, {QString::number(record + 1), text}));
    QStringList near;
    if (!question.overAll) {
        for (const qint64 other : {record - 1, record + 1}) {
            const QString value = hasValue ? desk_.ValueOn(other, question, form) : QString();
            if (!value.isEmpty())
                near += StringText(Str::DeskValue, {QString::number(other + 1), value});
        }
    }
    neighbors_->setText(near.join(u"   "_s));
    previous_->setEnabled(!question.overAll && record > 0);
    next_->setEnabled(!question.overAll && record + 1 < count);
    meaning_->setPlainText(answer.meaning.join(u'\n'));
    losses_ = answer.losses;
    const QStringList notes = answer.losses + answer.reasons + CirclesOf(form);
    notes_->setPlainText(notes.isEmpty() ? StringText(Str::DeskNoNotes) : notes.join(u'\n'));
    const int tab = tabs_->indexOf(notes_);
    const QString title = StringText(Str::DeskNotes);
    tabs_->setTabText(tab, notes.isEmpty() ? title : title + u" (%1)"_s.arg(notes.size()));
    // All of them are among the notes.
    help_->setText(notes.isEmpty() ? StringText(Str::DeskHelpHint) : notes.first());
}

void CExpressionDesk::accept()
{
    ShowAnswer();
    UserPrompt& prompt = maker_.Surroundings().prompt;
    if (!losses_.isEmpty() && !prompt.AskYesNo({Str::DeskUseAnyway, {losses_.join(u'\n')}}))
        return;
    QDialog::accept();
}

} // namespace mirel
