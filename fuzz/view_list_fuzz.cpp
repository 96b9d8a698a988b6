// Reads any text as the profile's line of open views. What was read must survive being kept and read again.
#include "app/view_list.h"

#include <cstdint>

using namespace mirel;

extern "C" int LLVMFuzzerTestOneInput(const uint8_t* data, size_t size)
{
    const QString text = QString::fromUtf8(reinterpret_cast<const char*>(data), qsizetype(size));
    const ViewList views = ReadViewList(text);
    const bool frontIsOne = views.front < int(views.views.size());
    if (!frontIsOne || ReadViewList(ViewListText(views)) != views)
        __builtin_trap();
    return 0;
}
