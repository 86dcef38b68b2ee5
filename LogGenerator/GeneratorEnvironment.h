#pragma once

#include "RawPackets.h"

#include "Clock.h"
#include "Resources.h"

#include <optional>
#include <string>

namespace orvex {

// What every generator needs of the platform. The referents outlive all generators.
struct GeneratorEnvironment {
    const Resources& resources;                      // templates
    const Clock& clock;                              // dates of history entries, times of a DLF
    std::optional<std::string> buildVersion;         // of the application; absent when it has none
    std::size_t rawPacketLimit = RawPackets::kLimit; // bytes kept for snapshots; 0 for a session never saved
};

} // namespace orvex
