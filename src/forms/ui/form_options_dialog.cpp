#include "forms/ui/form_options_dialog.h"

#include "platform/ui/dialog_buttons.h"
#include "platform/ui/look_roles.h"
#include "platform/ui/scrolled_page.h"
#include "platform/ui/window_place.h"
#include "resources/string_table.h"

#include <QCheckBox>
#include <QComboBox>
#include <QDialogButtonBox>
#include <QHBoxLayout>
#include <QLabel>
#include <QScreen>
#include <QSpinBox>
#include <QVBoxLayout>

namespace mirel {
namespace {

constexpr int kMostCharacters = 9999;
constexpr int kLongestHoldMs = 5000;
constexpr int kFarthestScrollPx = 2000;

} // namespace

CFormOptionsDialog::CFormOptionsDialog(const FormViewSettings& settings, QWidget* parent)
    : QDialog(parent)
    , settings_(settings)
    , confirmDelete_(new QCheckBox(StringText(Str::OptionConfirmDelete), this))
    , confirmSave_(new QCheckBox(StringText(Str::FormOptionConfirmSave), this))
    , thirdAnswer_(new QCheckBox(StringText(Str::FormOptionThirdAnswer), this))
    , aggregate_(new QCheckBox(StringText(Str::FormOptionAggregate), this))
    , fit_(new QCheckBox(StringText(Str::FormOptionFit), this))
    , sort_(new QCheckBox(StringText(Str::FormOptionSort), this))
    , limit_(new QCheckBox(StringText(Str::OptionMaximum), this))
    , characters_(new QSpinBox(this))
    , popup_(new QCheckBox(StringText(Str::OptionHoldPopup), this))
    , holdMs_(new QSpinBox(this))
    , scrollPx_(new QSpinBox(this))
    , words_(new QComboBox(this))
{
    setWindowTitle(StringText(Str::FormOptionsTitle));
    characters_->setRange(1, kMostCharacters);
    holdMs_->setRange(1, kLongestHoldMs);
    scrollPx_->setRange(1, kFarthestScrollPx);
    words_->setEditable(true);
    words_->addItems({FormViewSettings().words.Setting(), QStringLiteral("True/False"), QStringLiteral("On/Off")});
    connect(confirmSave_, &QCheckBox::toggled, thirdAnswer_, &QWidget::setEnabled);
    connect(limit_, &QCheckBox::toggled, characters_, &QWidget::setEnabled);
    connect(popup_, &QCheckBox::toggled, holdMs_, &QWidget::setEnabled);
    ShowSettings();
    LayOut();
}

void CFormOptionsDialog::ShowSettings()
{
    const FormViewSettings defaults;
    const bool limited = settings_.maxColumnChars >= 0;
    confirmDelete_->setChecked(settings_.confirmDelete);
    confirmSave_->setChecked(settings_.confirmSave);
    thirdAnswer_->setChecked(settings_.saveAsThirdAnswer);
    thirdAnswer_->setEnabled(settings_.confirmSave);
    aggregate_->setChecked(settings_.updateAggregate);
    fit_->setChecked(settings_.fitToWindow);
    sort_->setChecked(settings_.sortByHeader);
    limit_->setChecked(limited);
    characters_->setValue(limited ? settings_.maxColumnChars : defaults.maxColumnChars);
    characters_->setEnabled(limited);
    popup_->setChecked(settings_.holdTimeMs > 0);
    holdMs_->setValue(settings_.holdTimeMs > 0 ? settings_.holdTimeMs : defaults.holdTimeMs);
    holdMs_->setEnabled(settings_.holdTimeMs > 0);
    scrollPx_->setValue(settings_.scrollPixels);
    words_->setEditText(settings_.words.Setting());
}

void CFormOptionsDialog::LayOut()
{
    auto* page = new QWidget(this);
    auto* column = new QVBoxLayout(page);
    constexpr int margin = spacing::kTight;
    column->setContentsMargins(margin, margin, margin, margin);
    for (QCheckBox* box : {confirmDelete_, confirmSave_, thirdAnswer_, aggregate_, fit_, sort_})
        column->addWidget(box);
    AddNumbers(*column);
    auto* wordsLabel = new QLabel(StringText(Str::OptionYesNoWords), this);
    wordsLabel->setBuddy(words_);
    wordsLabel->setWordWrap(true);
    column->addWidget(wordsLabel);
    column->addWidget(words_);
    column->addStretch(1);

    QDialogButtonBox* buttons = OkAndCancel(*this);
    // A small screen scrolls the options and keeps the buttons in sight.
    auto* whole = new QVBoxLayout(this);
    whole->setContentsMargins(margin, margin, margin, margin);
    whole->addWidget(Scrolled(page), 1);
    whole->addWidget(buttons);
    const QSize wanted = page->sizeHint() + QSize(2, 5) * fontMetrics().height();
    const QSize window = parentWidget() ? parentWidget()->window()->size() : wanted;
    resize(IsHandheldSize(window) ? window : wanted.boundedTo(screen()->availableSize()));
}

// The options that are a number, each in a line of its own.
void CFormOptionsDialog::AddNumbers(QVBoxLayout& column)
{
    const auto addLine = [this, &column](QWidget* before, QSpinBox* number, Str unit) {
        column.addWidget(before);
        auto* line = new QHBoxLayout;
        line->addWidget(number);
        line->addWidget(new QLabel(StringText(unit), this), 1);
        column.addLayout(line);
    };
    auto* scrollLabel = new QLabel(StringText(Str::FormOptionScroll), this);
    scrollLabel->setBuddy(scrollPx_);
    scrollLabel->setWordWrap(true);
    auto* limitLabel = new QLabel(StringText(Str::OptionColumnGroup), this);
    limitLabel->setWordWrap(true);
    column.addWidget(limitLabel);
    addLine(limit_, characters_, Str::OptionCharacters);
    addLine(popup_, holdMs_, Str::OptionMilliseconds);
    addLine(scrollLabel, scrollPx_, Str::FormOptionPixels);
    characters_->setAccessibleName(StringText(Str::OptionColumnGroup));
    holdMs_->setAccessibleName(StringText(Str::OptionHoldPopup));
    scrollPx_->setAccessibleName(StringText(Str::FormOptionScroll));
}

FormViewSettings CFormOptionsDialog::Chosen() const
{
    FormViewSettings chosen = settings_;
    chosen.confirmDelete = confirmDelete_->isChecked();
    chosen.confirmSave = confirmSave_->isChecked();
    chosen.saveAsThirdAnswer = thirdAnswer_->isChecked();
    chosen.updateAggregate = aggregate_->isChecked();
    chosen.fitToWindow = fit_->isChecked();
    chosen.sortByHeader = sort_->isChecked();
    chosen.maxColumnChars = limit_->isChecked() ? characters_->value() : FormViewSettings::kNoColumnLimit;
    chosen.holdTimeMs = popup_->isChecked() ? holdMs_->value() : 0;
    chosen.scrollPixels = scrollPx_->value();
    chosen.words = YesNoWords::FromSetting(words_->currentText(), settings_.words);
    return chosen;
}

} // namespace mirel
