#include "tableview/ui/filter_dialog.h"

#include "data/catalog.h"
#include "data/condition_fault.h"
#include "platform/ui/date_field.h"
#include "platform/ui/error_line.h"
#include "platform/ui/look_roles.h"
#include "platform/ui/scrolled_page.h"
#include "platform/user_locale.h"
#include "resources/string_table.h"
#include "result/cell_text.h"
#include "tableview/ui/field_chooser.h"
#include "tableview/ui/pick_box.h"
#include "tableview/why_not_stored.h"

#include <QCheckBox>
#include <QComboBox>
#include <QDialogButtonBox>
#include <QFormLayout>
#include <QLabel>
#include <QLineEdit>
#include <QPlainTextEdit>
#include <QPushButton>
#include <QRegularExpression>
#include <QScreen>
#include <QTabWidget>
#include <QTimer>
#include <QVBoxLayout>

namespace mirel {
namespace {

using namespace Qt::StringLiterals;

constexpr int kFocusDelayMs = 50; // until the dialog stands on the screen

const QStringList kExpressionOperators = {u"="_s,  u"<>"_s,      u">"_s,       u">="_s,
                                          u"<"_s,  u"<="_s,      u"LIKE"_s,    u"IS NULL"_s,
                                          u"IN"_s, u"BETWEEN"_s, u"IS TRUE"_s, u"IS FALSE"_s};
const QStringList kExpressionWords = {u"AND"_s, u"OR"_s, u"NOT"_s};

// As wide a form as a handheld's screen holds.
void PrepareForm(QFormLayout* form)
{
    form->setFieldGrowthPolicy(QFormLayout::AllNonFixedFieldsGrow);
    form->setRowWrapPolicy(QFormLayout::WrapLongRows);
    form->setContentsMargins(form->contentsMargins() / 2);
}

QComboBox* WordBox(const QStringList& words, QWidget* parent)
{
    auto* box = new PickBox(parent);
    box->addItems(words);
    return box;
}

} // namespace

FilterTerm::FilterTerm(QWidget* parent)
    : QWidget(parent)
    , row_(new QBoxLayout(QBoxLayout::LeftToRight, this))
    , operators_(new QComboBox(this))
    , value_(new DateField(this))
{
    operators_->setAccessibleName(StringText(Str::OperatorsLabel).remove(u'&'));
    operators_->setSizeAdjustPolicy(QComboBox::AdjustToMinimumContentsLengthWithIcon);
    operators_->setMinimumContentsLength(6);
    value_->Line()->setAccessibleName(StringText(Str::FilterValueName));
    row_->setContentsMargins({});
    row_->setSpacing(spacing::kTight);
    row_->addWidget(operators_, 2);
    row_->addWidget(value_, 3);
    setFocusProxy(value_);
}

// The longest operator and a value take two lines of a handheld.
void FilterTerm::resizeEvent(QResizeEvent*)
{
    constexpr int kNarrowChars = 34;
    const bool narrow = width() < kNarrowChars * fontMetrics().averageCharWidth();
    row_->setDirection(narrow ? QBoxLayout::TopToBottom : QBoxLayout::LeftToRight);
}

void FilterTerm::SetType(FieldType type, FilterKind kind)
{
    type_ = type;
    operators_->clear();
    for (const std::u16string_view name : FilterOperators(type, kind))
        operators_->addItem(FilterOperatorText(name), QStringView(name).toString());
    value_->SetTakesDates(type == FieldType::Date);
    value_->setEnabled(type != FieldType::YesNo);
}

void FilterTerm::SetOperator(const QString& operatorText)
{
    if (const int row = operators_->findData(operatorText); row >= 0)
        operators_->setCurrentIndex(row);
}

void FilterTerm::SetValue(const QString& displayText)
{
    value_->SetText(displayText);
    value_->Line()->setCursorPosition(0); // its beginning shows
}

QString FilterTerm::Operator() const
{
    return operators_->currentData().toString();
}

QString FilterTerm::Value() const
{
    static const QRegularExpression plain(u"^[+-]?\\d+(\\.\\d+)?$"_s);
    const QString text = value_->Text();
    if (!IsNumber(type_) || plain.match(text.trimmed()).hasMatch())
        return text;
    const auto number = TypedValue(text, FieldType::Double); // as the user writes numbers
    return number.IsNull() ? text : VariantText(number);
}

QString FilterTerm::Fault(bool mayBeMissing) const
{
    const bool needsValue = IsNumber(type_) || type_ == FieldType::Date;
    const QString text = value_->Text().trimmed();
    if (needsValue && text.isEmpty())
        return mayBeMissing ? QString() : StringText(Str::WhyMissing);
    return needsValue ? WhyNotStored(text, type_ == FieldType::Date ? type_ : FieldType::Double, -1) : QString();
}

void FilterTerm::FocusValue()
{
    if (!value_->isEnabled())
        return operators_->setFocus(Qt::TabFocusReason);
    value_->setFocus(Qt::TabFocusReason);
    value_->Line()->end(false);
    value_->Line()->home(true); // all of it, and its beginning in sight
}

CFilterDialog::CFilterDialog(FieldLists& lists, const QString& table, const QString& field,
                             const QString& displayText, Apply apply, QWidget* parent)
    : QDialog(parent)
    , lists_(lists)
    , apply_(std::move(apply))
    , tabs_(new QTabWidget(this))
    , field_(new FieldChooser(lists, FieldChooser::Use::ToChoose, this))
    , single_(new FilterTerm(this))
    , fromTo_(new QCheckBox(StringText(Str::FilterFromTo), this))
    , from_(new FilterTerm(this))
    , to_(new FilterTerm(this))
    , expression_(new QPlainTextEdit(this))
    , error_(new ErrorLine(this))
{
    setWindowTitle(StringText(Str::FilterTitle));
    field_->Choose(table, field);
    tabs_->addTab(Scrolled(BasicPage()), StringText(Str::FilterBasic));
    tabs_->addTab(Scrolled(AdvancedPage()), StringText(Str::FilterAdvanced));
    tabs_->setUsesScrollButtons(false);

    auto* buttons = new QDialogButtonBox(QDialogButtonBox::Ok | QDialogButtonBox::Cancel, this);
    connect(buttons, &QDialogButtonBox::accepted, this, &CFilterDialog::TakeCondition);
    connect(buttons, &QDialogButtonBox::rejected, this, &QDialog::reject);
    auto* column = new QVBoxLayout(this);
    column->addWidget(tabs_, 1);
    column->addWidget(error_);
    column->addWidget(buttons);

    for (QComboBox* box : findChildren<QComboBox*>())
        box->setMaxVisibleItems(8);
    connect(field_, &FieldChooser::fieldChanged, this, &CFilterDialog::TakeField);
    connect(fromTo_, &QCheckBox::toggled, this, &CFilterDialog::ShowRange);
    TakeField();
    ShowRange(false);
    for (FilterTerm* term : {single_, from_, to_})
        term->SetValue(displayText);
    single_->SetOperator(lists_.TypeOf(field_->Table(), field_->Field()) == FieldType::YesNo
                             ? FilterDraft::PresetYesNo(displayText)
                             : single_->Operator());
    // All of it shows where the screen has the room.
    ensurePolished();
    QSize whole;
    for (int tab = 0; tab < tabs_->count(); ++tab)
        whole = whole.expandedTo(tabs_->widget(tab)->sizeHint());
    resize(sizeHint()
               .expandedTo(whole + QSize(0, sizeHint().height() - tabs_->currentWidget()->sizeHint().height()))
               .expandedTo({60 * fontMetrics().averageCharWidth(), 0})
               .boundedTo(screen()->availableSize()));
    QTimer::singleShot(kFocusDelayMs, single_, [this] {
        if (tabs_->currentIndex() == 0)
            single_->FocusValue();
    });
}

void CFilterDialog::ShowExpression(const QString& condition)
{
    tabs_->setCurrentIndex(1);
    expression_->setPlainText(condition);
    expression_->moveCursor(QTextCursor::End);
    QTimer::singleShot(kFocusDelayMs, this, [this] { expression_->setFocus(Qt::TabFocusReason); });
}

QWidget* CFilterDialog::BasicPage()
{
    auto* page = new QWidget(this);
    auto* form = new QFormLayout(page);
    PrepareForm(form);
    form->addRow(field_);
    form->addRow(StringText(Str::OperatorsLabel), single_);
    form->addRow(fromTo_);
    form->addRow(StringText(Str::FilterFrom), from_);
    form->addRow(StringText(Str::FilterTo), to_);
    return page;
}

QWidget* CFilterDialog::AdvancedPage()
{
    auto* page = new QWidget(this);
    auto* chooser = new FieldChooser(lists_, FieldChooser::Use::ToPick, page);
    chooser->Choose(field_->Table(), field_->Field());
    QComboBox* const operators = WordBox(kExpressionOperators, page);
    QComboBox* const words = WordBox(kExpressionWords, page);
    expression_->setTabChangesFocus(true);
    expression_->setMinimumHeight(4 * fontMetrics().lineSpacing());
    expression_->setSizePolicy(QSizePolicy::Expanding, QSizePolicy::Ignored);
    expression_->setAccessibleName(StringText(Str::FilterPrompt));

    auto* prompt = new QLabel(StringText(Str::FilterPrompt), page);
    prompt->setWordWrap(true);
    auto* label = new QLabel(StringText(Str::FilterExpressionLabel), page);
    label->setBuddy(expression_);
    auto* form = new QFormLayout;
    PrepareForm(form);
    form->setContentsMargins({});
    form->addRow(StringText(Str::OperatorsLabel), operators);
    form->addRow(StringText(Str::FilterAndOrNot), words);
    auto* column = new QVBoxLayout(page);
    column->setSpacing(spacing::kTight);
    column->addWidget(prompt);
    column->addWidget(label);
    column->addWidget(expression_, 1); // it takes what is left
    column->addWidget(chooser);
    column->addLayout(form);

    connect(chooser, &FieldChooser::fieldPicked, this, [this, chooser] {
        Insert(FieldReference(chooser->Table()) + u'.' + FieldReference(chooser->Field()));
    });
    for (QComboBox* box : {operators, words})
        connect(box, &QComboBox::textActivated, this, &CFilterDialog::Insert);
    return page;
}

void CFilterDialog::TakeField()
{
    const FieldType type = lists_.TypeOf(field_->Table(), field_->Field());
    single_->SetType(type, FilterKind::Single);
    from_->SetType(type, FilterKind::Range);
    to_->SetType(type, FilterKind::Range);
}

void CFilterDialog::ShowRange(bool fromTo)
{
    single_->setEnabled(!fromTo);
    from_->setEnabled(fromTo);
    to_->setEnabled(fromTo);
    if (!fromTo)
        return;
    // From "=" to "=" is what nobody means.
    if (from_->Operator() == u"=" && to_->Operator() == u"=") {
        from_->SetOperator(u">="_s);
        to_->SetOperator(u"<="_s);
    }
    from_->FocusValue();
}

FilterDraft CFilterDialog::Draft() const
{
    const bool fromTo = fromTo_->isChecked();
    const FilterTerm& term = fromTo ? *from_ : *single_;
    return {.table = field_->Table(),
            .field = field_->Field(),
            .type = lists_.TypeOf(field_->Table(), field_->Field()),
            .fromTo = fromTo,
            .operatorText = term.Operator(),
            .valueText = term.Value(),
            .toOperatorText = to_->Operator(),
            .toValueText = to_->Value()};
}

QString CFilterDialog::Condition() const
{
    return tabs_->currentIndex() == 0 ? Draft().Condition() : expression_->toPlainText();
}

QString CFilterDialog::FaultInBasic() const
{
    const auto fault = [](const FilterTerm* term, bool mayBeMissing) { return term->Fault(mayBeMissing); };
    if (fromTo_->isChecked()) {
        const QString from = fault(from_, false);
        return from.isEmpty() ? fault(to_, false) : from;
    }
    const QString operatorText = single_->Operator();
    return fault(single_, operatorText == u"=" || operatorText == u"not =");
}

QString CFilterDialog::MarkFaultInExpression()
{
    constexpr qsizetype kShown = 20;
    const QString text = expression_->toPlainText();
    const std::optional<qsizetype> at = text.trimmed().isEmpty() ? std::nullopt : FaultInCondition(text);
    if (!at)
        return {};
    QTextCursor place = expression_->textCursor();
    place.setPosition(int(*at));
    place.movePosition(QTextCursor::EndOfWord, QTextCursor::KeepAnchor);
    expression_->setTextCursor(place);
    expression_->setFocus();
    if (*at >= text.size())
        return StringText(Str::WhyBreaksOff);
    return StringText(Str::WhyNoPlace, {QString::number(*at + 1), text.mid(*at, kShown).simplified()});
}

void CFilterDialog::TakeCondition()
{
    const QString fault = tabs_->currentIndex() == 0 ? FaultInBasic() : MarkFaultInExpression();
    if (!fault.isEmpty())
        return error_->ShowError(fault, {});
    error_->Clear();
    const QString condition = Condition();
    if (condition.trimmed().isEmpty())
        return reject();
    if (apply_(condition))
        accept();
}

// As if it were typed at the caret.
void CFilterDialog::Insert(const QString& text)
{
    expression_->setFocus();
    expression_->insertPlainText(WordInsertion(expression_->toPlainText(), text));
}

} // namespace mirel
