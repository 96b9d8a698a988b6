#include "csvimport/ui/source_page.h"

#include "platform/ui/elided_label.h"
#include "platform/ui/file_choice.h"
#include "resources/string_table.h"

#include <QClipboard>
#include <QDir>
#include <QGuiApplication>
#include <QLabel>
#include <QLocale>
#include <QMimeData>
#include <QPushButton>
#include <QVBoxLayout>

namespace mirel {

using namespace Qt::StringLiterals;

ImportSourcePage::ImportSourcePage(ImportDraft& draft, QString near, QWidget* parent)
    : ImportPage(parent)
    , draft_(draft)
    , near_(std::move(near))
    , path_(new ElidedLabel(this))
    , summary_(new QLabel(this))
    , open_(new QPushButton(StringText(Str::ImportOpenFile), this))
    , paste_(new QPushButton(StringText(Str::ImportPaste), this))
{
    open_->setToolTip(StringText(Str::ImportOpenFileTip));
    paste_->setToolTip(StringText(Str::ImportPasteTip));
    paste_->setAutoDefault(false);
    path_->setAccessibleName(StringText(Str::ImportFileName));
    summary_->setWordWrap(true);
    summary_->setTextFormat(Qt::PlainText);
    auto* column = new QVBoxLayout(this);
    column->setContentsMargins({});
    column->addWidget(new QLabel(StringText(Str::ImportSourceLabel), this));
    column->addWidget(path_);
    auto* ways = new QHBoxLayout;
    ways->addWidget(open_);
    ways->addWidget(paste_);
    ways->addStretch(1);
    column->addLayout(ways);
    column->addWidget(summary_);
    column->addStretch(1);
    connect(open_, &QPushButton::clicked, this, &ImportSourcePage::ChooseFileToOpen);
    connect(paste_, &QPushButton::clicked, this, &ImportSourcePage::TakeClipboard);
    const auto follow = [this] {
        const QMimeData* copied = QGuiApplication::clipboard()->mimeData(); // null: nothing
        paste_->setEnabled(copied && copied->hasText());
    };
    connect(QGuiApplication::clipboard(), &QClipboard::dataChanged, this, follow);
    follow();
}

void ImportSourcePage::Enter()
{
    ShowSource();
    if (!CanGoOn())
        open_->setFocus();
}

void ImportSourcePage::ShowSource()
{
    const ImportSource& source = draft_.Source();
    const CsvFound& found = draft_.Found();
    const QString path = QDir::toNativeSeparators(source.Path());
    path_->SetText(source.IsNone() ? QString() : source.IsFile() ? path : StringText(Str::ImportClipboardText));
    path_->setToolTip(path);
    if (source.IsNone()) {
        summary_->setText(StringText(Str::ImportNoSource));
        return;
    }
    const QLocale locale;
    QString text =
        StringText(Str::ImportSummary, {locale.toString(found.records),
                                        locale.toString(qint64(found.columns.size())), found.format.encoding});
    if (found.failingLines > 0)
        text += u'\n' + StringText(Str::ImportSummaryFailing,
                                   {locale.toString(found.failingLines), found.format.encoding});
    summary_->setText(text);
}

void ImportSourcePage::ChooseFileToOpen()
{
    const QString path = ChooseFile(
        *this, {.title = Str::ImportOpenFile,
                .accept = Str::ImportOpenFileAccept,
                .use = FileUse::Open,
                .kind = {Str::ImportFileFilter, {u".csv"_s, u".tsv"_s, u".txt"_s, u".tab"_s}, u"text-csv"},
                .near = draft_.Source().IsFile() ? draft_.Source().Path() : near_,
                .name = {}});
    if (!path.isEmpty())
        Choose(ImportSource::OfFile(path));
}

void ImportSourcePage::TakeClipboard()
{
    Choose(ImportSource::OfText(QGuiApplication::clipboard()->text()));
}

void ImportSourcePage::Choose(const ImportSource& source)
{
    if (draft_.Choose(source))
        ShowSource();
    Q_EMIT StateChanged();
}

} // namespace mirel
