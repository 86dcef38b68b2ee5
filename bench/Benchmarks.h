#pragma once

#include <cstddef>
#include <string>

namespace orvex::bench {

// Each file of benchmarks enters its own, under the names by which the table knows them.
void registerFloors();
void registerDictionaries();
void registerDecoding();
void registerLoggedDecoding();
void registerRebuilding();
void registerPainting();
void registerStarting();
void registerPorts();
// Decodes captures that it writes into the directory: one of so many MiB, and smaller ones.
void registerOffline(const std::string& directory, std::size_t captureMiB);

} // namespace orvex::bench
