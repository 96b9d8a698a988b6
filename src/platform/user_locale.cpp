#include "platform/user_locale.h"

namespace mirel {

void UserLocale::SetCurrent(const QLocale&)
{
}

} // namespace mirel
