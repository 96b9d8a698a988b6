#include "tableview/export_draft.h"

#include "data/field_names.h"
#include "data/provider_error.h"
#include "resources/string_table.h"

#include <QDir>
#include <QFileInfo>

namespace mirel {

using namespace Qt::StringLiterals;

ExportDraft::ExportDraft(DbConnection& connection, DatabaseLocation database, UserPrompt& prompt)
    : records_(connection)
    , database_(std::move(database))
    , prompt_(prompt)
{
}

bool ExportDraft::SetSource(const QString& statement)
{
    statement_ = statement;
    if (records_.OpenSource(statement, database_, CursorType::Static, LockType::ReadOnly))
        return true;
    ReportProviderError(prompt_, &records_, records_.LastResult());
    records_.Close();
    statement_.clear();
    return false;
}

std::vector<ExportDraft::Field> ExportDraft::Fields() const
{
    std::vector<Field> fields;
    for (int i = 0; i < records_.FieldCount(); ++i) {
        Field field{records_.FieldName(i), {}, records_.IsEof() ? QString() : records_.ValueText(i)};
        TypeNameOfField(records_.TypeOfField(i), field.type);
        fields.push_back(std::move(field));
    }
    return fields;
}

bool ExportDraft::ChoosePath(const QString& path)
{
    if (path.isEmpty())
        return false;
    const QString file = QFileInfo(path).suffix().isEmpty() ? path + EndingOf(options_.kind) : path;
    if (QFileInfo::exists(file) && !prompt_.AskYesNo({Str::ReplaceFileQuestion, {QDir::toNativeSeparators(file)}}))
        return false;
    path_ = file;
    return true;
}

QString ExportDraft::EndingOf(ExportKind kind)
{
    switch (kind) {
    case ExportKind::Csv:
        break;
    case ExportKind::Json:
        return u".json"_s;
    case ExportKind::Html:
        return u".html"_s;
    case ExportKind::Pdf:
        return u".pdf"_s;
    }
    return u".csv"_s;
}

bool ExportDraft::SetKind(ExportKind kind)
{
    const QString before = path_;
    const QString ending = EndingOf(options_.kind);
    options_.kind = kind;
    if (before.isEmpty() || !before.endsWith(ending, Qt::CaseInsensitive))
        return true;
    path_.clear();
    return ChoosePath(before.chopped(ending.size()) + EndingOf(kind));
}

bool ExportDraft::Run(ExportFunction write)
{
    return CanRun() && ExportCsvFile(records_, options_,
                                     {.path = path_, .database = database_.FilePath(), .write = write}, prompt_)
                           .has_value();
}

} // namespace mirel
