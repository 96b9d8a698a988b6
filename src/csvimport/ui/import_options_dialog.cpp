#include "csvimport/ui/import_options_dialog.h"

#include "platform/ui/dialog_buttons.h"
#include "platform/ui/scrolled_page.h"
#include "resources/string_table.h"

#include <QCheckBox>
#include <QComboBox>
#include <QDialogButtonBox>
#include <QFormLayout>
#include <QGroupBox>
#include <QVBoxLayout>

#include <array>

namespace mirel {
namespace {

using namespace Qt::StringLiterals;

// By their numbers.
constexpr std::array kDateOrders = {Str::CsvDateMonthDayYear, Str::CsvDateMonthYearDay, Str::CsvDateYearDayMonth,
                                    Str::CsvDateYearMonthDay, Str::CsvDateDayMonthYear, Str::CsvDateDayYearMonth,
                                    Str::CsvDateLocale};
const QStringList kEncodings = {u"UTF-8"_s, u"UTF-16LE"_s, u"UTF-16BE"_s, u"ISO-8859-1"_s, u"windows-1252"_s};

QComboBox* CharacterBox(QStringView characters, QWidget* parent)
{
    auto* box = new QComboBox(parent);
    for (const QChar character : characters)
        box->addItem(character, character);
    return box;
}

// A character that is not among those offered joins them.
void ShowCharacter(QComboBox* box, QChar character)
{
    if (box->findData(character) < 0)
        box->addItem(character.isNull() ? StringText(Str::CsvNone) : QString(character), character);
    box->setCurrentIndex(box->findData(character));
}

char16_t CharacterOf(const QComboBox* box)
{
    return box->currentData().toChar().unicode();
}

} // namespace

CImportOptionsDialog::CImportOptionsDialog(const CsvFormat& format, QWidget* parent)
    : QDialog(parent)
    , format_(format)
    , quote_(CharacterBox(u"\"'", this))
    , quotedLines_(new QCheckBox(StringText(Str::ImportQuotedLines), this))
    , dateOrder_(new QComboBox(this))
    , dateSeparator_(CharacterBox(u"-/. ", this))
    , timeSeparator_(CharacterBox(u":.-", this))
    , decimal_(new QComboBox(this))
    , encoding_(new QComboBox(this))
{
    setWindowTitle(StringText(Str::CsvAdvancedTitle));
    quote_->addItem(StringText(Str::CsvNone), QChar());
    quotedLines_->setToolTip(StringText(Str::ImportQuotedLinesTip));
    for (const Str order : kDateOrders)
        dateOrder_->addItem(StringText(order));
    decimal_->addItem(StringText(Str::ImportDecimalPoint), QChar(u'.'));
    decimal_->addItem(StringText(Str::ImportDecimalComma), QChar(u','));
    encoding_->addItems(kEncodings);
    encoding_->setEditable(true); // others by their names
    for (QComboBox* box : {quote_, dateOrder_, dateSeparator_, timeSeparator_, decimal_, encoding_}) {
        box->setSizeAdjustPolicy(QComboBox::AdjustToMinimumContentsLengthWithIcon);
        box->setMinimumContentsLength(8);
    }
    LayOut();
    ShowFormat();
    Connect();
}

void CImportOptionsDialog::LayOut()
{
    auto* page = new QWidget(this);
    auto* dates = new QGroupBox(StringText(Str::CsvDateGroup), page);
    auto* dateForm = new QFormLayout(dates);
    dateForm->addRow(StringText(Str::CsvDateFormat), dateOrder_);
    dateForm->addRow(StringText(Str::CsvDateSeparator), dateSeparator_);
    dateForm->addRow(StringText(Str::CsvTimeSeparator), timeSeparator_);
    auto* form = new QFormLayout(page);
    form->addRow(StringText(Str::CsvQuote), quote_);
    form->addRow(quotedLines_);
    form->addRow(dates);
    form->addRow(StringText(Str::ImportDecimal), decimal_);
    form->addRow(StringText(Str::CsvEncoding), encoding_);
    for (QFormLayout* each : {form, dateForm}) {
        each->setFieldGrowthPolicy(QFormLayout::AllNonFixedFieldsGrow);
        each->setRowWrapPolicy(QFormLayout::WrapLongRows);
    }
    QDialogButtonBox* buttons = OkAndCancel(*this);
    auto* column = new QVBoxLayout(this);
    column->addWidget(Scrolled(page), 1);
    column->addWidget(buttons);
    quote_->setFocus();
}

void CImportOptionsDialog::ShowFormat()
{
    ShowCharacter(quote_, format_.quote);
    quotedLines_->setChecked(format_.doubledQuotes);
    quotedLines_->setEnabled(format_.quote != 0);
    dateOrder_->setCurrentIndex(int(format_.dates.order));
    ShowCharacter(dateSeparator_, format_.dates.dateSeparator);
    ShowCharacter(timeSeparator_, format_.dates.timeSeparator);
    for (QComboBox* box : {dateSeparator_, timeSeparator_})
        box->setEnabled(format_.dates.order != DateOrder::Locale);
    ShowCharacter(decimal_, format_.decimal);
    encoding_->setCurrentText(format_.encoding);
}

void CImportOptionsDialog::Connect()
{
    connect(quote_, &QComboBox::activated, this, [this] {
        format_.quote = CharacterOf(quote_);
        ShowFormat();
    });
    connect(quotedLines_, &QCheckBox::toggled, this, [this](bool on) { format_.doubledQuotes = on; });
    connect(dateOrder_, &QComboBox::activated, this, [this](int order) {
        format_.dates.order = DateOrder(order);
        ShowFormat();
    });
    connect(dateSeparator_, &QComboBox::activated, this,
            [this] { format_.dates.dateSeparator = CharacterOf(dateSeparator_); });
    connect(timeSeparator_, &QComboBox::activated, this,
            [this] { format_.dates.timeSeparator = CharacterOf(timeSeparator_); });
    connect(decimal_, &QComboBox::activated, this, [this] { format_.decimal = CharacterOf(decimal_); });
    connect(encoding_, &QComboBox::currentTextChanged, this,
            [this](const QString& name) { format_.encoding = name.trimmed(); });
}

} // namespace mirel
