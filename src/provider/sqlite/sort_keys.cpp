#include "provider/sqlite/sort_keys.h"

#include "platform/user_locale.h"

#include <unicode/ustring.h>

namespace mirel::sqlite {

void SortKeys::Open()
{
    opened_ = true;
    UErrorCode status = U_ZERO_ERROR;
    const QByteArray language = UserLocale::Current().Locale().name().toLatin1();
    collator_.reset(ucol_open(language.constData(), &status));
    if (collator_)
        ucol_setStrength(collator_.get(), UCOL_SECONDARY); // accents count, case does not
}

std::span<const uint8_t> SortKeys::KeyOf(std::string_view utf8)
{
    if (!opened_)
        Open();
    if (!collator_)
        return {reinterpret_cast<const uint8_t*>(utf8.data()), utf8.size()};
    if (units_.size() < utf8.size())
        units_.resize(utf8.size() * 2 + 64);
    UErrorCode status = U_ZERO_ERROR;
    int32_t length = 0;
    u_strFromUTF8WithSub(units_.data(), int32_t(units_.size()), &length, utf8.data(), int32_t(utf8.size()), 0xFFFD,
                         nullptr, &status);
    int32_t size = ucol_getSortKey(collator_.get(), units_.data(), length, key_.data(), int32_t(key_.size()));
    if (size > int32_t(key_.size())) {
        key_.resize(size_t(size) * 2 + 64);
        size = ucol_getSortKey(collator_.get(), units_.data(), length, key_.data(), int32_t(key_.size()));
    }
    return {key_.data(), size > 0 ? size_t(size) - 1 : 0};
}

} // namespace mirel::sqlite
