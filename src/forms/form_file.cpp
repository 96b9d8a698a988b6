#include "forms/form_file.h"

#include "forms/form_store.h"
#include "resources/string_table.h"

#include <QByteArrayView>
#include <QFile>

namespace mirel {

bool ExportForm(const FormDef& form, const QString& path, QString& error)
{
    FormStore file(path);
    FormDef copy;
    copy.CopyFrom(form);
    file.AddForm(std::move(copy));
    if (file.Save())
        return true;
    error = file.LastError();
    return false;
}

namespace {

// Almost any bytes can be read as a form, these too.
bool IsDatabase(const QString& path)
{
    constexpr QByteArrayView kMark = "SQLite format 3";
    QFile file(path);
    return file.open(QIODevice::ReadOnly) && file.peek(kMark.size()) == kMark;
}

} // namespace

std::optional<FormDef> ImportForm(const QString& path, QString& error)
{
    FormStore file(path);
    if (!file.Load()) {
        error = file.LastError();
        return {};
    }
    if (file.Forms().empty() || IsDatabase(path)) {
        error = StringText(Str::FormFileIsEmpty, {path});
        return {};
    }
    FormDef form;
    form.CopyFrom(file.Forms().front());
    return form;
}

} // namespace mirel
