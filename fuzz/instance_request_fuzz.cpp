// Reads any bytes as what another start asks of a window. What was read must survive being sent and read again.
#include "app/instance.h"

#include <cstdint>

using namespace mirel;

extern "C" int LLVMFuzzerTestOneInput(const uint8_t* data, size_t size)
{
    const QByteArray line(reinterpret_cast<const char*>(data), qsizetype(size));
    if (const std::optional<InstanceRequest> request = ReadInstanceRequest(line)) {
        if (ReadInstanceRequest(InstanceRequestLine(*request)) != request)
            __builtin_trap();
    }
    return 0;
}
