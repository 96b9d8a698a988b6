#include "csvimport/ui/separator_page.h"

#include "csvimport/ui/import_options_dialog.h"
#include "platform/ui/look_roles.h"
#include "platform/ui/window_place.h"
#include "resources/string_table.h"

#include <QCheckBox>
#include <QGridLayout>
#include <QHeaderView>
#include <QLabel>
#include <QLineEdit>
#include <QPushButton>
#include <QRadioButton>
#include <QTableWidget>
#include <QVBoxLayout>

#include <algorithm>
#include <array>

namespace mirel {
namespace {

struct Separator {
    char16_t character; // 0: another, which is typed
    Str text;
};
constexpr std::array kSeparators = {
    Separator{u'\t', Str::CsvSeparatorTab},  Separator{u';', Str::CsvSeparatorSemicolon},
    Separator{u',', Str::CsvSeparatorComma}, Separator{u' ', Str::CsvSeparatorSpace},
    Separator{0, Str::ImportSeparatorEtc},
};

// A text in one line, as long as a cell of the preview needs.
QString Shortened(const QString& text)
{
    constexpr qsizetype kLongest = 60;
    const QString line = text.left(2 * kLongest).simplified();
    return line.size() <= kLongest ? line : line.left(kLongest) + u'…';
}

} // namespace

ImportSeparatorPage::ImportSeparatorPage(ImportDraft& draft, UserPrompt& prompt, QWidget* parent)
    : ImportPage(parent)
    , draft_(draft)
    , prompt_(prompt)
    , other_(new QLineEdit(this))
    , header_(new QCheckBox(StringText(Str::CsvHeader), this))
    , preview_(new QTableWidget(this))
{
    auto* detect = new QPushButton(StringText(Str::ImportDetect), this);
    detect->setToolTip(StringText(Str::ImportDetectTip));
    auto* advanced = new QPushButton(StringText(Str::CsvAdvanced), this);
    for (QPushButton* button : {detect, advanced})
        button->setAutoDefault(false);
    preview_->setAccessibleName(StringText(Str::ImportPreview));
    preview_->setEditTriggers(QAbstractItemView::NoEditTriggers);
    preview_->setSelectionMode(QAbstractItemView::NoSelection);
    preview_->setHorizontalScrollMode(QAbstractItemView::ScrollPerPixel);
    preview_->setTabKeyNavigation(false);
    preview_->setSizePolicy(QSizePolicy::Expanding, QSizePolicy::Ignored);
    preview_->setMinimumHeight(5 * fontMetrics().height());
    preview_->verticalHeader()->hide();
    preview_->horizontalHeader()->setDefaultAlignment(Qt::AlignLeft | Qt::AlignVCenter);

    auto* column = new QVBoxLayout(this);
    column->setContentsMargins({});
    column->addWidget(Separators());
    column->addWidget(header_);
    auto* row = new QHBoxLayout;
    row->addWidget(detect);
    row->addWidget(advanced);
    row->addStretch(1);
    column->addLayout(row);
    column->addWidget(preview_, 1);

    connect(header_, &QCheckBox::toggled, this, &ImportSeparatorPage::TakeSeparator);
    connect(detect, &QPushButton::clicked, this, [this] {
        if (draft_.Detect())
            Enter();
    });
    connect(advanced, &QPushButton::clicked, this, &ImportSeparatorPage::ChooseOptions);
}

QWidget* ImportSeparatorPage::Separators()
{
    auto* group = new QWidget(this);
    auto* grid = new QGridLayout(group);
    grid->setContentsMargins({});
    for (size_t i = 0; i < kSeparators.size(); ++i) {
        auto* button = new QRadioButton(StringText(kSeparators[i].text), group);
        connect(button, &QRadioButton::toggled, this, [this](bool on) {
            if (on)
                TakeSeparator();
        });
        buttons_.push_back(button);
        grid->addWidget(button, int(i / 2), int(i % 2));
    }
    other_->setMaxLength(1);
    other_->setMaximumWidth(4 * fontMetrics().height());
    other_->setAccessibleName(StringText(Str::ImportSeparatorEtcName));
    connect(other_, &QLineEdit::textEdited, this, [this] {
        buttons_.back()->setChecked(true);
        TakeSeparator();
    });
    grid->addWidget(other_, int(kSeparators.size() / 2), 1);
    return group;
}

void ImportSeparatorPage::Enter()
{
    ShowFormat();
    ShowPreview();
}

bool ImportSeparatorPage::MayLeave()
{
    if (const std::optional<UserMessage> fault = draft_.FaultOfFormat()) {
        prompt_.Show(*fault);
        other_->setFocus();
        return false;
    }
    return true;
}

void ImportSeparatorPage::ShowFormat()
{
    showing_ = true;
    const CsvFormat& format = draft_.Format();
    const auto known = std::ranges::find(kSeparators, format.separator, &Separator::character);
    const bool isOther = known == kSeparators.end() || known->character == 0;
    const size_t at = isOther ? kSeparators.size() - 1 : size_t(known - kSeparators.begin());
    buttons_[at]->setChecked(true);
    other_->setText(isOther && format.separator != 0 ? QString(QChar(format.separator)) : QString());
    header_->setChecked(format.namesInFirstLine);
    showing_ = false;
}

void ImportSeparatorPage::TakeSeparator()
{
    if (showing_)
        return;
    CsvFormat format = draft_.Format();
    for (size_t i = 0; i < kSeparators.size(); ++i) {
        if (buttons_[i]->isChecked())
            format.separator = kSeparators[i].character;
    }
    if (buttons_.back()->isChecked()) {
        const QString typed = other_->text();
        format.separator = typed.isEmpty() ? u'\0' : typed[0].unicode();
        if (typed.isEmpty())
            other_->setFocus();
    }
    format.namesInFirstLine = header_->isChecked();
    draft_.SetFormat(format);
    ShowPreview();
}

void ImportSeparatorPage::ChooseOptions()
{
    CImportOptionsDialog dialog(draft_.Format(), this);
    FillSmallWindow(dialog, *window());
    if (dialog.exec() != QDialog::Accepted)
        return;
    draft_.SetFormat(dialog.Chosen());
    Enter();
}

void ImportSeparatorPage::ShowPreview()
{
    std::vector<ImportDraft::PreviewRow> rows = draft_.Preview();
    QStringList names;
    if (draft_.Format().namesInFirstLine && !rows.empty()) {
        names = rows.front().texts;
        rows.erase(rows.begin());
    }
    qsizetype columns = names.size();
    for (const ImportDraft::PreviewRow& row : rows)
        columns = std::max(columns, row.texts.size());
    preview_->clear();
    preview_->setRowCount(int(rows.size()));
    preview_->setColumnCount(int(columns));
    for (int column = 0; column < int(columns); ++column)
        preview_->setHorizontalHeaderItem(
            column, new QTableWidgetItem(Shortened(names.value(column, QString::number(column + 1)))));
    const QColor refused = ColorOfRole(LookRole::Error, palette());
    for (int row = 0; row < int(rows.size()); ++row) {
        const ImportDraft::PreviewRow& shown = rows[size_t(row)];
        for (int column = 0; column < int(shown.texts.size()); ++column) {
            auto* item = new QTableWidgetItem(Shortened(shown.texts[column]));
            if (!shown.fault.isEmpty()) {
                item->setForeground(refused);
                item->setToolTip(shown.fault);
            }
            preview_->setItem(row, column, item);
        }
    }
    preview_->resizeColumnsToContents();
    preview_->resizeRowsToContents();
}

} // namespace mirel
