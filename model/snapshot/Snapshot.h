#pragma once

#include "Array.h"
#include "Dictionary.h"

#include <optional>
#include <string>

namespace orvex {

// What a user saved of a session. The file is a property list in XML form, a dictionary:
//
//   "Timestamp"    text    when saving began, as in 2024-03-05 14:07:09 +0000
//   "Data"         array   what the session's generator gave to keep, a dictionary each: history entries with
//                          "Description", "Date", "Display" and "DisplayState", and of a Marlin technology
//                          one with the "DLF"
//   "Description"  text    the user's own words
struct Snapshot {
    std::string timestamp;
    ArrayRef data;
    std::string description;
};

struct SnapshotResult {
    std::optional<Snapshot> snapshot;
    std::string error; // why there is none, one line with the path
};

// DIRECTORY/OrvexSnapshot-SECONDS.orvex, by the moment of the save. Two saves within one second share a path.
std::string snapshotPath(const std::string& directory, Date saved);

// Writes the file in place: a failure half-way leaves a partial file. Data that no property list can hold
// leaves the file untouched. Returns why writing failed, one line with the path, or an empty text.
std::string writeSnapshot(const Snapshot& snapshot, const std::string& path);

// Reads the binary form too. A truncated file, or one with values of the wrong kinds, gives no snapshot.
SnapshotResult readSnapshot(const std::string& path);

} // namespace orvex
