#pragma once

#include "LogGenerator.h"
#include "OrvexModelNode.h"
#include "Snapshot.h"
#include "TreeJson.h"

#include <memory>
#include <string>
#include <vector>

namespace orvex {

// What is printed of a snapshot: timestamp, description and, for every history entry, date, description,
// stored display and, if wanted, the display decoded again from the entry's raw messages.
class SnapshotDocument {
public:
    SnapshotDocument(std::string path, const SnapshotResult& result);

    // Why the file could not be read, without its path; empty when it could. Nothing else is valid then.
    const std::string& failure() const { return _failure; }

    // Feeds the raw messages of all entries to the generator, oldest first.
    void decodeAnew(std::unique_ptr<LogGenerator> generator);

    // Keeps of each display only what is at the path. Returns false when no display has anything there.
    bool restrictTo(const std::string& path);

    // The snapshot as a tree in text, with names and values cut to the longest.
    std::string tree(std::size_t longestText = std::string::npos) const;
    // As one JSON document.
    void writeJson(JsonWriter& json) const;

    // The binary log; null when the snapshot holds none.
    const BytesRef& dlf() const { return _dlf; }
    // A line for each thing that could not be decoded again.
    const std::vector<std::string>& omissions() const { return _omissions; }

private:
    struct Entry {
        std::string description;
        Value date; // usually text
        Value messages;
        OrvexModelNodeRef display; // null when the entry has none, such as that of the binary log
        OrvexModelNodeRef decoded; // null until decodeAnew()
    };

    std::string _path;
    std::string _failure;
    std::string _timestamp;
    std::string _description;
    std::vector<Entry> _entries;
    BytesRef _dlf;
    std::string _nodePath = "/";
    std::vector<std::string> _omissions;
};

} // namespace orvex
