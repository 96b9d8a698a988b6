#include "tableview/ui/options_dialog.h"

#include "platform/ui/dialog_buttons.h"
#include "platform/ui/look_roles.h"
#include "platform/ui/scrolled_page.h"
#include "platform/ui/window_place.h"
#include "resources/string_table.h"

#include <QCheckBox>
#include <QComboBox>
#include <QDialogButtonBox>
#include <QGridLayout>
#include <QGroupBox>
#include <QHBoxLayout>
#include <QLabel>
#include <QScreen>
#include <QSpinBox>
#include <QStyle>
#include <QVBoxLayout>

namespace mirel {
namespace {

constexpr int kMostCharacters = 9999;
constexpr int kLongestHoldMs = 5000;

} // namespace

COptionsDialog::COptionsDialog(const TableViewSettings& settings, QWidget* parent)
    : QDialog(parent)
    , settings_(settings)
    , confirmDelete_(new QCheckBox(StringText(Str::OptionConfirmDelete), this))
    , limit_(new QCheckBox(StringText(Str::OptionMaximum), this))
    , characters_(new QSpinBox(this))
    , words_(new QComboBox(this))
    , popup_(new QCheckBox(StringText(Str::OptionHoldPopup), this))
    , holdMs_(new QSpinBox(this))
    , sortByHeader_(new QCheckBox(StringText(Str::OptionSortByHeader), this))
{
    setWindowTitle(StringText(Str::OptionsTitle));
    const TableViewSettings defaults;
    const bool limited = settings.maxColumnChars >= 0;
    confirmDelete_->setChecked(settings.confirmDelete);
    limit_->setChecked(limited);
    characters_->setRange(1, kMostCharacters);
    characters_->setValue(limited ? settings.maxColumnChars : defaults.maxColumnChars);
    characters_->setEnabled(limited);
    words_->setEditable(true);
    words_->addItems({defaults.words.Setting(), QStringLiteral("True/False"), QStringLiteral("On/Off")});
    words_->setEditText(settings.words.Setting());
    popup_->setChecked(settings.holdTimeMs > 0);
    holdMs_->setRange(1, kLongestHoldMs);
    holdMs_->setValue(settings.holdTimeMs > 0 ? settings.holdTimeMs : defaults.holdTimeMs);
    holdMs_->setEnabled(settings.holdTimeMs > 0);
    sortByHeader_->setChecked(settings.sortByHeader);
    connect(limit_, &QCheckBox::toggled, characters_, &QWidget::setEnabled);
    connect(popup_, &QCheckBox::toggled, holdMs_, &QWidget::setEnabled);
    LayOut();
}

void COptionsDialog::LayOut()
{
    auto* page = new QWidget(this);
    auto* column = new QVBoxLayout(page);
    constexpr int margin = spacing::kTight;
    column->setContentsMargins(margin, margin, margin, margin);
    column->addWidget(confirmDelete_);

    auto* limitBox = new QGroupBox(StringText(Str::OptionColumnGroup), this);
    auto* limitRow = new QGridLayout(limitBox);
    limitRow->setContentsMargins(margin, margin, margin, margin);
    limitRow->setSpacing(margin);
    limitRow->addWidget(limit_, 0, 0, 1, 2);
    limitRow->addWidget(characters_, 1, 0);
    limitRow->addWidget(new QLabel(StringText(Str::OptionCharacters), limitBox), 1, 1);
    limitRow->setColumnStretch(1, 1);
    limitBox->setMinimumWidth(1); // its title may be cut before the page is
    column->addWidget(limitBox);

    auto* wordsLabel = new QLabel(StringText(Str::OptionYesNoWords), this);
    wordsLabel->setBuddy(words_);
    wordsLabel->setWordWrap(true);
    column->addWidget(wordsLabel);
    column->addWidget(words_);

    column->addWidget(popup_);
    auto* holdRow = new QHBoxLayout; // in line with the words above it
    holdRow->addSpacing(style()->pixelMetric(QStyle::PM_IndicatorWidth, nullptr, this) +
                        style()->pixelMetric(QStyle::PM_CheckBoxLabelSpacing, nullptr, this));
    holdRow->addWidget(holdMs_);
    holdRow->addWidget(new QLabel(StringText(Str::OptionMilliseconds), this), 1);
    column->addLayout(holdRow);
    column->addWidget(sortByHeader_);

    QDialogButtonBox* buttons = OkAndCancel(*this);
    column->addStretch(1);
    // A small screen scrolls the options and keeps the buttons in sight.
    QWidget* scroller = Scrolled(page);
    auto* whole = new QVBoxLayout(this);
    whole->setContentsMargins(margin, margin, margin, margin);
    whole->addWidget(scroller, 1);
    whole->addWidget(buttons);
    resize((scroller->sizeHint() + QSize(2, 3) * fontMetrics().height()).boundedTo(screen()->availableSize()));
    FillSmallWindow(*this, *parentWidget()->window());
    characters_->setAccessibleName(StringText(Str::OptionColumnGroup));
    holdMs_->setAccessibleName(StringText(Str::OptionHoldPopup).remove(u'&'));
}

TableViewSettings COptionsDialog::Chosen() const
{
    TableViewSettings chosen = settings_;
    chosen.confirmDelete = confirmDelete_->isChecked();
    chosen.maxColumnChars = limit_->isChecked() ? characters_->value() : TableViewSettings::kNoColumnLimit;
    chosen.words = YesNoWords::FromSetting(words_->currentText(), settings_.words);
    chosen.holdTimeMs = popup_->isChecked() ? holdMs_->value() : 0;
    chosen.sortByHeader = sortByHeader_->isChecked();
    return chosen;
}

} // namespace mirel
