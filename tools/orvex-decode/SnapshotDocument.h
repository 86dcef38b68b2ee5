#pragma once

#include "LogGenerator.h"
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
    explicit SnapshotDocument(const Snapshot& snapshot);

    // Feeds the raw messages of all entries to the generator, oldest first.
    void decodeAnew(std::unique_ptr<LogGenerator> generator);

    // The snapshot as a tree in text, with names and values cut to the longest.
    std::string tree(std::size_t longestText = std::string::npos) const;
    // {"timestamp": …, "description": …, "entries": [{"description": …, "date": …, "display": TREE,
    // "decoded": TREE}, …]}, the trees like those of captures. "display" and "decoded" are left out where an
    // entry has no display or no messages.
    void writeJson(JsonWriter& json) const;

    // The binary log; null when the snapshot holds none.
    const BytesRef& dlf() const { return _dlf; }
    // A line for each thing that could not be decoded again.
    const std::vector<std::string>& omissions() const { return _omissions; }

private:
    struct Entry {
        std::string description;
        Value date;    // usually text
        Value display; // null when the entry has none, such as that of the binary log
        Value messages;
        Value decoded; // null until decodeAnew()
    };

    std::string _timestamp;
    std::string _description;
    std::vector<Entry> _entries;
    BytesRef _dlf;
    std::vector<std::string> _omissions;
};

} // namespace orvex
