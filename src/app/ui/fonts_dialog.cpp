#include "app/ui/fonts_dialog.h"

#include "app/ui/colors_dialog.h"
#include "platform/ui/dialog_buttons.h"
#include "platform/ui/window_place.h"
#include "resources/string_table.h"

#include <QCheckBox>
#include <QComboBox>
#include <QDialogButtonBox>
#include <QFontDatabase>
#include <QGridLayout>
#include <QLabel>
#include <QLineEdit>
#include <QPushButton>
#include <QScrollArea>
#include <QVBoxLayout>

#include <algorithm>
#include <array>

namespace mirel {
namespace {

constexpr std::array kSizes = {6, 7, 8, 9, 10, 11, 12, 14, 16, 18, 20, 24, 28, 36, 48, 72};

} // namespace

QFont FontOf(const FontDesc& description)
{
    QFont font(description.faceName);
    font.setPointSizeF(description.size);
    font.setItalic(description.italic != 0);
    font.setWeight(description.bold != 0 ? QFont::Bold : QFont::Normal);
    font.setUnderline(description.underline != 0);
    font.setStrikeOut(description.strikeout != 0);
    return font;
}

QColor ColorOfRef(quint32 bgr)
{
    return {int(bgr & 0xFF), int(bgr >> 8 & 0xFF), int(bgr >> 16 & 0xFF)};
}

quint32 RefOfColor(const QColor& color)
{
    return quint32(color.red()) | quint32(color.green()) << 8 | quint32(color.blue()) << 16;
}

CFontsDialog::CFontsDialog(const FontDesc& font, QWidget* parent)
    : QDialog(parent)
    , font_(font)
    , face_(new QComboBox(this))
    , size_(new QComboBox(this))
    , bold_(new QCheckBox(StringText(Str::FontBold), this))
    , italic_(new QCheckBox(StringText(Str::FontItalic), this))
    , strikeout_(new QCheckBox(StringText(Str::FontStrikeout), this))
    , underline_(new QCheckBox(StringText(Str::FontUnderline), this))
    , swatch_(new QLabel(this))
    , sample_(new QLineEdit(StringText(Str::FontSampleText), this))
{
    setWindowTitle(StringText(Str::FontsTitle));
    FillChoices();
    LayOut();
    for (QComboBox* choice : {face_, size_})
        connect(choice, &QComboBox::currentIndexChanged, this, &CFontsDialog::TakeUpChoices);
    for (QCheckBox* flag : {bold_, italic_, strikeout_, underline_})
        connect(flag, &QCheckBox::toggled, this, &CFontsDialog::TakeUpChoices);
    TakeUpChoices();
    FillSmallWindow(*this, *parent->window());
}

// What the description names and the screen does not offer gives way to the first of what it does.
void CFontsDialog::FillChoices()
{
    face_->addItems(QFontDatabase::families());
    face_->setCurrentIndex(
        std::max(face_->findText(font_.faceName, Qt::MatchExactly | Qt::MatchCaseSensitive), 0));
    face_->setSizeAdjustPolicy(QComboBox::AdjustToMinimumContentsLengthWithIcon);
    face_->setMinimumContentsLength(8);
    for (const int size : kSizes)
        size_->addItem(QString::number(size));
    size_->setCurrentIndex(std::max(size_->findText(QString::number(font_.size)), 0));
    bold_->setChecked(font_.bold != 0);
    italic_->setChecked(font_.italic != 0);
    strikeout_->setChecked(font_.strikeout != 0);
    underline_->setChecked(font_.underline != 0);
}

void CFontsDialog::LayOut()
{
    auto* scroller = new QScrollArea(this);
    auto* page = new QWidget(scroller);
    scroller->setWidget(page);
    scroller->setWidgetResizable(true);
    scroller->setFrameShape(QFrame::NoFrame);
    auto* grid = new QGridLayout(page);
    auto* faceLabel = new QLabel(StringText(Str::FontName), page);
    faceLabel->setBuddy(face_);
    auto* sizeLabel = new QLabel(StringText(Str::FontSize), page);
    sizeLabel->setBuddy(size_);
    auto* color = new QPushButton(StringText(Str::FontColor), page);
    connect(color, &QPushButton::clicked, this, &CFontsDialog::ChooseColor);
    swatch_->setAutoFillBackground(true);
    swatch_->setFrameShape(QFrame::Panel);
    swatch_->setMinimumWidth(swatch_->fontMetrics().height() * 2);
    sample_->setReadOnly(true);
    sample_->setFocusPolicy(Qt::NoFocus);
    sample_->setAlignment(Qt::AlignCenter);
    sample_->setMinimumHeight(sample_->fontMetrics().height() * 3);
    sample_->setAccessibleName(StringText(Str::FontSampleName));
    grid->addWidget(faceLabel, 0, 0);
    grid->addWidget(face_, 0, 1);
    grid->addWidget(sizeLabel, 1, 0);
    grid->addWidget(size_, 1, 1);
    grid->addWidget(bold_, 2, 0);
    grid->addWidget(italic_, 2, 1);
    grid->addWidget(strikeout_, 3, 0, 1, 2); // in some languages as long as a small window is wide
    grid->addWidget(underline_, 4, 0, 1, 2);
    grid->addWidget(color, 5, 0);
    grid->addWidget(swatch_, 5, 1);
    grid->addWidget(sample_, 6, 0, 1, 2);
    grid->setColumnStretch(1, 1);
    grid->setRowStretch(6, 1);
    QDialogButtonBox* buttons = OkAndCancel(*this);
    auto* whole = new QVBoxLayout(this);
    whole->addWidget(scroller, 1);
    whole->addWidget(buttons);
    setTabOrder(face_, size_);
    face_->setFocus();
}

void CFontsDialog::TakeUpChoices()
{
    font_.faceName = face_->currentText();
    font_.size = size_->currentText().toInt();
    font_.bold = bold_->isChecked() ? 1 : 0;
    font_.italic = italic_->isChecked() ? 1 : 0;
    font_.strikeout = strikeout_->isChecked() ? 1 : 0;
    font_.underline = underline_->isChecked() ? 1 : 0;
    ShowSample();
}

void CFontsDialog::ChooseColor()
{
    CColorsDialog dialog(ColorOfRef(font_.color), CColorsDialog::Unset::Refused, this);
    if (dialog.exec() != QDialog::Accepted || !dialog.Chosen())
        return;
    font_.color = RefOfColor(*dialog.Chosen());
    ShowSample();
}

void CFontsDialog::ShowSample()
{
    sample_->setFont(FontOf(font_));
    QPalette inked;
    inked.setColor(QPalette::Text, ColorOfRef(font_.color));
    sample_->setPalette(inked);
    QPalette filled;
    filled.setColor(QPalette::Window, ColorOfRef(font_.color));
    swatch_->setPalette(filled);
}

} // namespace mirel
