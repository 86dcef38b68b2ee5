#pragma once

#include "CaptureClock.h"
#include "DecodeOptions.h"

#include "FileStorage.h"
#include "LogGenerator.h"
#include "QtRunLoop.h"

#include <memory>
#include <string>

namespace orvex {

// What decoding needs of the platform.
struct Platform {
    explicit Platform(const DecodeOptions& options)
        : resources(options.resources.value_or(FileResources::defaultDirectory()))
        , rawPacketLimit(options.snapshotFile ? RawPackets::kLimit : 0)
    {
    }

    GeneratorEnvironment environment() const { return {resources, clock, ORVEX_VERSION, rawPacketLimit}; }
    std::unique_ptr<LogGenerator> generatorFor(const std::string& technology) const
    {
        return LogGenerator::generatorFromTechnology(technology, environment());
    }

    FileResources resources;
    SystemClock systemClock;
    CaptureClock clock{systemClock};
    std::size_t rawPacketLimit; // bytes; only a snapshot needs raw packets
};

} // namespace orvex
