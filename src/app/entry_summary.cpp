#include "app/entry_summary.h"

#include "platform/ole_date.h"
#include "platform/user_locale.h"
#include "resources/string_table.h"

#include <QFileInfo>

namespace mirel {

using namespace Qt::StringLiterals;

namespace {

const QString kDot = QStringLiteral(" · ");

QString CountText(qint64 count, Str text)
{
    return StringText(text, {UserLocale::Current().Locale().toString(count)});
}

QString ChangeText(const QDateTime& changed)
{
    const QString time = UserLocale::Current().Locale().toString(changed.time(), QLocale::ShortFormat);
    if (changed.date() == QDate::currentDate())
        return StringText(Str::SummaryChangedToday, {time});
    const std::optional<double> day = OleDate(changed.date().startOfDay());
    return StringText(Str::SummaryChanged, {day ? UserLocale::Current().DateText(*day) : time});
}

} // namespace

EntrySummary::EntrySummary(DatabaseSession& session)
    : session_(session)
{
}

EntrySummary::~EntrySummary() = default;

void EntrySummary::LookAt(const std::optional<MainEntry>& entry)
{
    const bool same = entry == entry_;
    entry_ = entry;
    file_ = FileState::Of(session_.Location().FilePath());
    StopCounting();
    if (!same)
        records_.reset(); // or the number stays until the new one is known
    fields_.reset();
    if (!entry_ || entry_->missing || entry_->kind != EntryKind::Table)
        return;
    counted_ = std::make_unique<DbRecordset>(session_.Connection());
    if (!counted_->Open(u"SELECT * FROM "_s + FieldReference(entry_->name), session_.Location(),
                        CursorType::Static, LockType::ReadOnly)) {
        counted_.reset();
        return;
    }
    fields_ = counted_->FieldCount();
}

void EntrySummary::CountOn(int budgetMs)
{
    if (!counted_ || !counted_->CountStep(budgetMs))
        return;
    records_ = counted_->RecordCount();
    StopCounting();
}

void EntrySummary::StopCounting()
{
    counted_.reset();
}

QString EntrySummary::Name() const
{
    if (entry_)
        return entry_->name;
    return file_.exists ? QFileInfo(session_.Location().FilePath()).fileName() : QString();
}

QStringList EntrySummary::Lines() const
{
    QStringList lines;
    if (entry_)
        lines += EntryLine();
    if (file_.exists) {
        const QString size = UserLocale::Current().Locale().formattedDataSize(file_.sizeBytes, 1);
        lines += entry_
                     ? StringText(Str::SummaryFile, {QFileInfo(session_.Location().FilePath()).fileName(), size})
                     : size;
        lines += ChangeText(file_.changed);
    }
    return lines;
}

QString EntrySummary::EntryLine() const
{
    if (entry_->missing)
        return StringText(Str::SummaryGone);
    switch (entry_->kind) {
    case EntryKind::Form:
        return StringText(Str::SummaryFormOf, {entry_->table});
    case EntryKind::Query:
        return StringText(Str::SummaryQueryOf, {entry_->table});
    case EntryKind::Table:
        break;
    }
    QStringList parts;
    if (fields_)
        parts += CountText(*fields_, Str::SummaryFields);
    if (records_)
        parts += CountText(*records_, Str::SummaryRecords);
    else if (counted_)
        parts += StringText(Str::SummaryCounting);
    return parts.join(kDot);
}

} // namespace mirel
