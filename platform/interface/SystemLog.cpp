#include "SystemLog.h"

#include <utility>

namespace orvex {

SystemLog* SystemLog::install(SystemLog* sink)
{
    return std::exchange(_installed, sink);
}

} // namespace orvex
