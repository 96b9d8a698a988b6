#include "app/ui/findings_dialog.h"

#include "platform/ui/entry_list.h"
#include "platform/ui/scrolled_page.h"
#include "platform/ui/window_place.h"
#include "resources/string_table.h"
#include "resources/ui/theme_icon.h"

#include <QClipboard>
#include <QDialogButtonBox>
#include <QGuiApplication>
#include <QLabel>
#include <QPushButton>
#include <QVBoxLayout>

namespace mirel {
namespace {

using namespace Qt::StringLiterals;

constexpr size_t kMostShown = 500; // the rest is copied
constexpr int kFirstColumns = 64;  // characters of the dialog's first width
constexpr int kFirstLines = 20;
constexpr int kTextLines = 7; // of a finding and its remedy
constexpr int kLeastTextLines = 3;

QLabel* TextLabel(QWidget* parent)
{
    auto* label = new QLabel(parent);
    label->setWordWrap(true);
    label->setTextFormat(Qt::PlainText);
    return label;
}

} // namespace

CFindingsDialog::CFindingsDialog(std::vector<CheckFinding> findings, const QString& summary, QWidget* parent)
    : QDialog(parent)
    , findings_(std::move(findings))
    , summary_(TextLabel(this))
    , list_(new EntryList(this))
{
    setWindowTitle(StringText(Str::CheckTitle));
    summary_->setText(summary);
    list_->setAccessibleName(StringText(Str::CheckListName));
    auto* page = new QWidget(this);
    text_ = TextLabel(page);
    remedy_ = TextLabel(page);
    text_->setTextInteractionFlags(Qt::TextSelectableByMouse);
    remedy_->setForegroundRole(QPalette::PlaceholderText);
    auto* texts = new QVBoxLayout(page);
    texts->setContentsMargins({});
    texts->addWidget(text_);
    texts->addWidget(remedy_);
    texts->addStretch();
    auto* buttons = new QDialogButtonBox(QDialogButtonBox::Close, this);
    QPushButton* copy = buttons->addButton(StringText(Str::CheckCopyAll), QDialogButtonBox::ActionRole);
    copy->setIcon(ThemeIcon(u"edit-copy"));
    connect(copy, &QPushButton::clicked, this, [this] { QGuiApplication::clipboard()->setText(AllText()); });
    connect(buttons, &QDialogButtonBox::rejected, this, &QDialog::reject);
    connect(list_, &EntryList::RowChanged, this, &CFindingsDialog::ShowSelected);
    QWidget* scroller = Scrolled(page);
    scroller->setMinimumHeight(fontMetrics().lineSpacing() * kLeastTextLines);
    scroller->setMaximumHeight(fontMetrics().lineSpacing() * kTextLines);
    auto* column = new QVBoxLayout(this);
    column->addWidget(summary_);
    column->addWidget(list_, 1);
    column->addWidget(scroller, 1);
    column->addWidget(buttons);
    ShowList(summary);
    resize(fontMetrics().averageCharWidth() * kFirstColumns, fontMetrics().lineSpacing() * kFirstLines);
    FillSmallWindow(*this, *parent->window());
    list_->setFocus();
}

void CFindingsDialog::ShowList(const QString& summary)
{
    std::vector<EntryLine> lines;
    for (size_t i = 0; i < std::min(findings_.size(), kMostShown); ++i)
        lines.push_back(
            {.name = findings_[i].text, .detail = {}, .toolTip = findings_[i].text, .icon = u"dialog-warning"});
    list_->SetLines(std::move(lines));
    if (findings_.size() > kMostShown)
        summary_->setText(summary + u' ' +
                          StringText(Str::CheckEnough, {QString::number(findings_.size() - kMostShown)}));
    list_->SetRow(0);
    ShowSelected();
}

void CFindingsDialog::ShowSelected()
{
    const size_t row = size_t(std::max(list_->Row(), 0));
    if (row >= findings_.size())
        return;
    text_->setText(findings_[row].text);
    remedy_->setText(StringText(findings_[row].remedy));
}

QString CFindingsDialog::AllText() const
{
    QStringList lines;
    for (const CheckFinding& finding : findings_)
        lines += finding.text + u'\n' + StringText(finding.remedy);
    return lines.join(u'\n');
}

} // namespace mirel
