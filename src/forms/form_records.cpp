#include "forms/form_records.h"

namespace mirel {

void FormDef::CopyFrom(const FormDef& other)
{
    FormDef copy = other;
    copy.SetName(other.name.Text());
    copy.SetTableName(other.tableName.Text());
    copy.padding = {};
    *this = std::move(copy);
}

} // namespace mirel
