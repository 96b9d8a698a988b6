#include "app/ui/entry_panel.h"

#include "platform/ui/elided_label.h"
#include "resources/string_table.h"

#include <QLabel>
#include <QVBoxLayout>

namespace mirel {
namespace {

constexpr int kLookDelayMs = 60; // walking through a list opens nothing
constexpr int kCountSliceMs = 8;

} // namespace

EntryPanel::EntryPanel(DatabaseSession& session, QWidget* parent)
    : QWidget(parent)
    , summary_(session)
    , name_(new ElidedLabel(this))
    , lines_(new QLabel(this))
{
    QFont bold = font();
    bold.setBold(true);
    name_->setFont(bold);
    lines_->setForegroundRole(QPalette::PlaceholderText);
    lines_->setTextFormat(Qt::PlainText);
    lines_->setWordWrap(true);
    lines_->setMinimumWidth(1);
    lines_->setAccessibleName(StringText(Str::SummaryName));
    auto* column = new QVBoxLayout(this);
    column->setContentsMargins(12, 8, 12, 8);
    column->setSpacing(4);
    column->addWidget(name_);
    column->addWidget(lines_);
    lookTimer_.setSingleShot(true);
    connect(&lookTimer_, &QTimer::timeout, this, &EntryPanel::Look);
    connect(&countTimer_, &QTimer::timeout, this, [this] {
        summary_.CountOn(kCountSliceMs);
        if (!summary_.IsCounting()) {
            countTimer_.stop();
            ShowLines();
        }
    });
}

void EntryPanel::LookAt(const std::optional<MainEntry>& entry)
{
    entry_ = entry;
    summary_.StopCounting();
    countTimer_.stop();
    name_->setVisible(entry.has_value());
    name_->SetText(entry ? entry->name : QString());
    lookTimer_.start(kLookDelayMs);
}

void EntryPanel::Look()
{
    if (!isVisible())
        return;
    summary_.LookAt(entry_);
    ShowLines();
    if (summary_.IsCounting())
        countTimer_.start(0);
}

void EntryPanel::ShowLines()
{
    name_->SetText(summary_.Name());
    name_->setVisible(!summary_.Name().isEmpty());
    name_->setToolTip(summary_.Name().toHtmlEscaped());
    lines_->setText(summary_.Lines().join(u'\n'));
}

} // namespace mirel
