#include "tableview/ui/csv_options_dialog.h"

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
const QStringList kEncodings = {u"UTF-8"_s, u"ISO-8859-1"_s, u"UTF-16LE"_s};

// A box of characters, the first entry of which is none at all.
QComboBox* CharacterBox(QStringView characters, QWidget* parent)
{
    auto* box = new QComboBox(parent);
    box->addItem(StringText(Str::CsvNone), QChar());
    for (const QChar character : characters)
        box->addItem(character, character);
    return box;
}

void ShowCharacter(QComboBox* box, QChar character)
{
    box->setCurrentIndex(std::max(box->findData(character), 0));
}

QChar CharacterOf(const QComboBox* box)
{
    return box->currentData().toChar();
}

} // namespace

CCsvOptionsDialog::CCsvOptionsDialog(const CsvExportOptions& options, QWidget* parent)
    : QDialog(parent)
    , options_(options)
    , quote_(CharacterBox(u"\"'", this))
    , doubledQuotes_(new QCheckBox(StringText(Str::CsvDoubledQuotes), this))
    , dateOrder_(new QComboBox(this))
    , dateSeparator_(CharacterBox(u"-/. ", this))
    , timeSeparator_(CharacterBox(u":.-", this))
    , encoding_(new QComboBox(this))
    , byteOrderMark_(new QCheckBox(StringText(Str::CsvByteOrderMark), this))
{
    setWindowTitle(StringText(Str::CsvAdvancedTitle));
    for (const Str order : kDateOrders)
        dateOrder_->addItem(StringText(order));
    encoding_->addItems(kEncodings);
    for (QComboBox* box : {quote_, dateOrder_, dateSeparator_, timeSeparator_, encoding_}) {
        box->setSizeAdjustPolicy(QComboBox::AdjustToMinimumContentsLengthWithIcon);
        box->setMinimumContentsLength(8);
    }
    byteOrderMark_->setToolTip(StringText(Str::CsvByteOrderMarkTip));
    LayOut();
    ShowOptions();
    Connect();
}

void CCsvOptionsDialog::LayOut()
{
    auto* page = new QWidget(this);
    auto* dates = new QGroupBox(StringText(Str::CsvDateGroup), page);
    auto* dateForm = new QFormLayout(dates);
    dateForm->addRow(StringText(Str::CsvDateFormat), dateOrder_);
    dateForm->addRow(StringText(Str::CsvDateSeparator), dateSeparator_);
    dateForm->addRow(StringText(Str::CsvTimeSeparator), timeSeparator_);
    auto* form = new QFormLayout(page);
    form->addRow(StringText(Str::CsvQuote), quote_);
    form->addRow(doubledQuotes_);
    form->addRow(dates);
    form->addRow(StringText(Str::CsvEncoding), encoding_);
    form->addRow(byteOrderMark_);
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

void CCsvOptionsDialog::ShowOptions()
{
    ShowCharacter(quote_, options_.quote);
    doubledQuotes_->setChecked(options_.doubledQuotes);
    doubledQuotes_->setEnabled(!options_.quote.isNull());
    dateOrder_->setCurrentIndex(int(options_.dates.order));
    ShowCharacter(dateSeparator_, options_.dates.dateSeparator);
    ShowCharacter(timeSeparator_, options_.dates.timeSeparator);
    dateSeparator_->setEnabled(options_.dates.order != DateOrder::Locale);
    timeSeparator_->setEnabled(options_.dates.order != DateOrder::Locale);
    encoding_->setCurrentText(QString::fromLatin1(options_.encoding));
    byteOrderMark_->setChecked(options_.byteOrderMark);
    byteOrderMark_->setEnabled(options_.encoding.startsWith("UTF"));
}

void CCsvOptionsDialog::Connect()
{
    connect(quote_, &QComboBox::activated, this, [this] {
        options_.quote = CharacterOf(quote_);
        ShowOptions();
    });
    connect(doubledQuotes_, &QCheckBox::toggled, this, [this](bool on) { options_.doubledQuotes = on; });
    connect(dateOrder_, &QComboBox::activated, this, [this](int order) {
        options_.SetDateOrder(DateOrder(order));
        ShowOptions();
    });
    connect(dateSeparator_, &QComboBox::activated, this,
            [this] { options_.dates.dateSeparator = CharacterOf(dateSeparator_).unicode(); });
    connect(timeSeparator_, &QComboBox::activated, this,
            [this] { options_.dates.timeSeparator = CharacterOf(timeSeparator_).unicode(); });
    connect(encoding_, &QComboBox::textActivated, this, [this](const QString& name) {
        options_.encoding = name.toLatin1();
        ShowOptions();
    });
    connect(byteOrderMark_, &QCheckBox::toggled, this, [this](bool on) { options_.byteOrderMark = on; });
}

} // namespace mirel
