#pragma once

#include "Array.h"
#include "Dictionary.h"

#include <optional>
#include <string>

namespace orvex {

// What a user saved of a session. The file is a property list in XML form, a dictionary:
//
//   "Timestamp"    text    when saving was begun, as in 2024-03-05 14:07:09 +0000
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

// DIRECTORY/OrvexSnapshot-SECONDS.orvex, by the moment of the save. Two of one second have one path.
std::string snapshotPath(const std::string& directory, Date saved);

// Writes the file in place: one that fails in the middle is left as it is. Data that no property list can
// hold leaves the file untouched. Returns why the snapshot could not be written, one line with the path, or
// an empty text.
std::string writeSnapshot(const Snapshot& snapshot, const std::string& path);

// Takes the binary form too. A file that is cut or holds values of other kinds gives no snapshot.
SnapshotResult readSnapshot(const std::string& path);

} // namespace orvex
