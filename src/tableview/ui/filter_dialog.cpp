#include "tableview/ui/filter_dialog.h"

#include "data/catalog.h"
#include "platform/ole_date.h"
#include "platform/ui/scrolled_page.h"
#include "platform/user_locale.h"
#include "resources/string_table.h"
#include "tableview/ui/field_chooser.h"
#include "tableview/ui/pick_box.h"

#include <QCheckBox>
#include <QComboBox>
#include <QDateEdit>
#include <QDialogButtonBox>
#include <QFormLayout>
#include <QHBoxLayout>
#include <QLabel>
#include <QLineEdit>
#include <QPlainTextEdit>
#include <QStackedWidget>
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
    , operators_(new QComboBox(this))
    , values_(new QStackedWidget(this))
    , text_(new QLineEdit(this))
    , date_(new QDateEdit(QDate::currentDate(), this))
{
    date_->setCalendarPopup(true);
    date_->setDisplayFormat(UserLocale::Current().DateFormat());
    values_->addWidget(text_);
    values_->addWidget(date_);
    values_->setSizePolicy(QSizePolicy::Expanding, QSizePolicy::Fixed);
    operators_->setAccessibleName(StringText(Str::OperatorsLabel));
    text_->setAccessibleName(StringText(Str::FilterValueName));
    date_->setAccessibleName(StringText(Str::FilterValueName));
    auto* row = new QHBoxLayout(this);
    row->setContentsMargins({});
    row->addWidget(operators_, 2);
    row->addWidget(values_, 3);
    setFocusProxy(text_);
}

void FilterTerm::SetType(FieldType type, FilterKind kind)
{
    operators_->clear();
    for (const std::u16string_view name : FilterOperators(type, kind))
        operators_->addItem(QStringView(name).toString());
    const bool isDate = type == FieldType::Date;
    values_->setCurrentWidget(isDate ? static_cast<QWidget*>(date_) : text_);
    values_->setEnabled(type != FieldType::YesNo);
    setFocusProxy(isDate ? static_cast<QWidget*>(date_) : text_);
}

void FilterTerm::SetOperator(const QString& operatorText)
{
    operators_->setCurrentText(operatorText);
}

void FilterTerm::SetValue(const QString& displayText)
{
    text_->setText(displayText);
    if (const std::optional<double> date = UserLocale::Current().ParseDateTime(displayText)) {
        if (const std::optional<DateParts> parts = PartsOfOleDate(*date))
            date_->setDate({parts->year, parts->month, parts->day});
    }
}

QString FilterTerm::Operator() const
{
    return operators_->currentText();
}

QString FilterTerm::Value() const
{
    if (values_->currentWidget() == text_)
        return text_->text();
    const std::optional<double> day = OleDate(date_->date().startOfDay());
    return day ? UserLocale::Current().DateText(*day) : QString();
}

void FilterTerm::FocusValue()
{
    QWidget* const value = values_->isEnabled() ? values_->currentWidget() : operators_;
    value->setFocus(Qt::TabFocusReason);
    text_->end(false);
    text_->home(true); // all of it, and its beginning in sight
}

CFilterDialog::CFilterDialog(FieldLists& lists, const QString& table, const QString& field,
                             const QString& displayText, QWidget* parent)
    : QDialog(parent)
    , lists_(lists)
    , tabs_(new QTabWidget(this))
    , field_(new FieldChooser(lists, FieldChooser::Use::ToChoose, this))
    , single_(new FilterTerm(this))
    , fromTo_(new QCheckBox(StringText(Str::FilterFromTo), this))
    , from_(new FilterTerm(this))
    , to_(new FilterTerm(this))
    , expression_(new QPlainTextEdit(this))
{
    setWindowTitle(StringText(Str::FilterTitle));
    field_->Choose(table, field);
    tabs_->addTab(Scrolled(BasicPage()), StringText(Str::FilterBasic));
    tabs_->addTab(Scrolled(AdvancedPage()), StringText(Str::FilterAdvanced));
    tabs_->setUsesScrollButtons(false);

    auto* buttons = new QDialogButtonBox(QDialogButtonBox::Ok | QDialogButtonBox::Cancel, this);
    connect(buttons, &QDialogButtonBox::accepted, this, &QDialog::accept);
    connect(buttons, &QDialogButtonBox::rejected, this, &QDialog::reject);
    auto* column = new QVBoxLayout(this);
    column->addWidget(tabs_, 1);
    column->addWidget(buttons);

    connect(field_, &FieldChooser::fieldChanged, this, &CFilterDialog::TakeField);
    connect(fromTo_, &QCheckBox::toggled, this, &CFilterDialog::ShowRange);
    TakeField();
    ShowRange(false);
    for (FilterTerm* term : {single_, from_, to_})
        term->SetValue(displayText);
    single_->SetOperator(lists_.TypeOf(field_->Table(), field_->Field()) == FieldType::YesNo
                             ? FilterDraft::PresetYesNo(displayText)
                             : single_->Operator());
    resize(sizeHint().expandedTo({60 * fontMetrics().averageCharWidth(), 0}));
    QTimer::singleShot(kFocusDelayMs, single_, &FilterTerm::FocusValue);
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
    expression_->setMinimumHeight(5 * fontMetrics().lineSpacing());
    expression_->setSizePolicy(QSizePolicy::Expanding, QSizePolicy::Ignored); // it takes what is left
    expression_->setAccessibleName(StringText(Str::FilterPrompt));

    auto* form = new QFormLayout(page);
    PrepareForm(form);
    auto* prompt = new QLabel(StringText(Str::FilterPrompt), page);
    prompt->setBuddy(expression_);
    form->addRow(prompt);
    form->addRow(StringText(Str::FilterExpressionLabel), expression_);
    form->addRow(chooser);
    form->addRow(StringText(Str::OperatorsLabel), operators);
    form->addRow(StringText(Str::FilterAndOrNot), words);

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

// As if it were typed at the caret.
void CFilterDialog::Insert(const QString& text)
{
    expression_->setFocus();
    expression_->insertPlainText(WordInsertion(expression_->toPlainText(), text));
}

} // namespace mirel
