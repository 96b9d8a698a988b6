#include "app/ui/entry_panel.h"

#include "platform/ui/elided_label.h"
#include "resources/string_table.h"

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
{
    QFont bold = font();
    bold.setBold(true);
    name_->setFont(bold);
    setAccessibleName(StringText(Str::SummaryName));
    auto* column = new QVBoxLayout(this);
    column->setContentsMargins(12, 8, 12, 8);
    column->setSpacing(4);
    column->addWidget(name_);
    for (ElidedLabel*& line : lines_) {
        line = new ElidedLabel(this);
        line->setForegroundRole(QPalette::PlaceholderText);
        column->addWidget(line);
    }
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
    const bool isFirst = !entry_ && summary_.Name().isEmpty();
    entry_ = entry;
    summary_.StopCounting();
    countTimer_.stop();
    lookTimer_.start(isFirst ? 0 : kLookDelayMs);
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
    name_->setToolTip(summary_.Name().toHtmlEscaped());
    const QStringList lines = summary_.Lines();
    for (size_t i = 0; i < lines_.size(); ++i) {
        const QString line = lines.value(qsizetype(i));
        lines_[i]->SetText(line);
        lines_[i]->setToolTip(line.toHtmlEscaped());
    }
    setAccessibleDescription(lines.join(u'\n'));
}

} // namespace mirel
