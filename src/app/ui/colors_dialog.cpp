#include "app/ui/colors_dialog.h"

#include "platform/ui/dialog_buttons.h"
#include "platform/ui/scrolled_page.h"
#include "platform/ui/window_place.h"
#include "resources/string_table.h"

#include <QDialogButtonBox>
#include <QGridLayout>
#include <QLabel>
#include <QLineEdit>
#include <QPainter>
#include <QRegularExpressionValidator>
#include <QToolButton>
#include <QVBoxLayout>

#include <algorithm>
#include <array>

namespace mirel {
namespace {

constexpr int kColumns = 8;
constexpr int kRows = 6;
constexpr int kSwatchPx = 24;

// The first row goes from black to white; the others, a shade each from dark to pale, around the colours.
QColor ColorAt(int row, int column)
{
    if (row == 0) {
        const int grey = 255 * column / (kColumns - 1);
        return {grey, grey, grey};
    }
    constexpr std::array<float, kRows - 1> kLightness = {0.22F, 0.36F, 0.5F, 0.72F, 0.9F};
    constexpr std::array<float, kColumns> kHues = {0, 0.08F, 0.15F, 0.33F, 0.5F, 0.58F, 0.69F, 0.85F};
    return QColor::fromHslF(kHues[size_t(column)], 0.75F, kLightness[size_t(row - 1)]).toRgb();
}

QIcon SwatchIcon(const QColor& color, const QPalette& palette, qreal ratio)
{
    QPixmap picture(QSize(kSwatchPx - 6, kSwatchPx - 6) * ratio);
    picture.setDevicePixelRatio(ratio);
    picture.fill(color);
    QPainter painter(&picture);
    painter.setPen(palette.color(QPalette::Mid));
    painter.drawRect(0, 0, kSwatchPx - 7, kSwatchPx - 7);
    return picture;
}

} // namespace

CColorsDialog::CColorsDialog(const std::optional<QColor>& color, Unset unset, QWidget* parent)
    : QDialog(parent)
    , chosen_(color)
    , desktops_(new QToolButton(this))
    , code_(new QLineEdit(this))
    , sample_(new QWidget(this))
{
    setWindowTitle(StringText(Str::ColorsTitle));
    desktops_->setText(StringText(Str::ColorUnset));
    desktops_->setCheckable(true);
    desktops_->setVisible(unset == Unset::Offered);
    connect(desktops_, &QToolButton::clicked, this, [this] { Choose({}); });
    static const QRegularExpression form(QStringLiteral("#[0-9a-fA-F]{0,6}"));
    code_->setValidator(new QRegularExpressionValidator(form, code_));
    connect(code_, &QLineEdit::textEdited, this, [this](const QString& text) {
        constexpr qsizetype kWholeCode = 7;
        if (text.size() == kWholeCode)
            Choose(QColor(text));
    });
    sample_->setAutoFillBackground(true);
    sample_->setMinimumSize(2 * kSwatchPx, kSwatchPx);

    auto* label = new QLabel(StringText(Str::ColorCode), this);
    label->setBuddy(code_);
    auto* codeRow = new QHBoxLayout;
    codeRow->addWidget(label);
    codeRow->addWidget(code_, 1);
    codeRow->addWidget(sample_);
    QDialogButtonBox* buttons = OkAndCancel(*this);
    auto* page = new QWidget(this);
    auto* column = new QVBoxLayout(page);
    column->setContentsMargins({});
    column->addWidget(MakePalette());
    column->addWidget(desktops_);
    column->addLayout(codeRow);
    column->addStretch(1);
    auto* whole = new QVBoxLayout(this);
    whole->addWidget(Scrolled(page), 1);
    whole->addWidget(buttons);
    ShowChosen();
    const auto at = std::ranges::find_if(swatches_, &QToolButton::isChecked);
    (at == swatches_.end() ? (desktops_->isChecked() ? desktops_ : swatches_.front()) : *at)->setFocus();
    FillSmallWindow(*this, *parent->window());
}

QWidget* CColorsDialog::MakePalette()
{
    auto* palette = new QWidget(this);
    palette->setAccessibleName(StringText(Str::ColorPalette));
    auto* grid = new QGridLayout(palette);
    grid->setContentsMargins({});
    grid->setSpacing(0);
    for (int row = 0; row < kRows; ++row) {
        for (int column = 0; column < kColumns; ++column) {
            const QColor color = ColorAt(row, column);
            auto* swatch = new QToolButton(palette);
            swatch->setIcon(SwatchIcon(color, this->palette(), devicePixelRatioF()));
            swatch->setIconSize({kSwatchPx - 6, kSwatchPx - 6});
            swatch->setAutoRaise(true);
            swatch->setCheckable(true);
            swatch->setProperty("color", color);
            swatch->setToolTip(color.name());
            swatch->setAccessibleName(color.name());
            swatch->setFocusPolicy(Qt::StrongFocus);
            swatch->setSizePolicy(QSizePolicy::Preferred, QSizePolicy::Preferred);
            connect(swatch, &QToolButton::clicked, this, [this, color] { Choose(color); });
            grid->addWidget(swatch, row, column);
            swatches_ += swatch;
        }
    }
    return palette;
}

void CColorsDialog::Choose(const std::optional<QColor>& color)
{
    chosen_ = color;
    ShowChosen();
}

void CColorsDialog::ShowChosen()
{
    for (QToolButton* swatch : swatches_)
        swatch->setChecked(chosen_ && swatch->property("color").value<QColor>().rgb() == chosen_->rgb());
    desktops_->setChecked(!chosen_);
    if (!code_->hasFocus() || !chosen_ || QColor(code_->text()) != *chosen_)
        code_->setText(chosen_ ? chosen_->name() : QString());
    QPalette shown;
    if (chosen_)
        shown.setColor(QPalette::Window, *chosen_);
    sample_->setPalette(shown);
}

} // namespace mirel
