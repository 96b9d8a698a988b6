// Reads any bytes as a file of drafts. What was read must survive being written and read again.
#include "app/draft.h"

#include <cstdint>

using namespace mirel;

extern "C" int LLVMFuzzerTestOneInput(const uint8_t* data, size_t size)
{
    const QByteArray file(reinterpret_cast<const char*>(data), qsizetype(size));
    const DraftsRead read = ReadDraftsFile(file);
    if (read.outcome == DraftsRead::Outcome::Newer)
        return read.drafts.empty() ? 0 : (__builtin_trap(), 0);
    const DraftsRead again = ReadDraftsFile(DraftsFile(read.drafts));
    if (again.outcome != DraftsRead::Outcome::Read || again.drafts != read.drafts)
        __builtin_trap();
    return 0;
}
