#include "provider/stop_check.h"

#include <utility>

namespace mirel {
namespace {

std::function<bool()> stopCheck;

} // namespace

void SetStopCheck(std::function<bool()> check)
{
    stopCheck = std::move(check);
}

bool IsStopWanted()
{
    return stopCheck && stopCheck();
}

} // namespace mirel
