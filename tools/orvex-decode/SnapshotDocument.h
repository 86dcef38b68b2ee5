#pragma once

#include "JsonWriter.h"
#include "LogGenerator.h"
#include "Snapshot.h"

#include <memory>
#include <string>
#include <vector>

namespace orvex {

// What is printed of a snapshot: when it was saved, the user's words, and of every history entry date,
// description and display, as it was stored and, if wanted, decoded anew from the entry's raw messages.
class SnapshotDocument {
public:
    explicit SnapshotDocument(const Snapshot& snapshot);

    // Feeds the raw messages of all entries to the generator, oldest first.
    void decodeAnew(std::unique_ptr<LogGenerator> generator);

    // The snapshot as a tree, its entries beside each other.
    // The tree as text, names and values cut to the longest.
    std::string tree(std::size_t longestText = std::string::npos) const;
    // {"timestamp": …, "description": …, "entries": [{"description": …, "date": …, "display": TREE,
    // "decoded": TREE}, …]}, the trees as those of captures. An entry without display has none, one without
    // messages is not decoded.
    void writeJson(JsonWriter& json) const;

    // The binary log; null when the snapshot holds none.
    const BytesRef& dlf() const { return _dlf; }
    // What could not be decoded anew, a line each.
    const std::vector<std::string>& omissions() const { return _omissions; }

private:
    struct Entry {
        std::string description;
        Value date;    // text, as a rule
        Value display; // null when the entry has none, like that of the binary log
        Value messages;
        Value decoded; // null until it is decoded anew
    };

    std::string _timestamp;
    std::string _description;
    std::vector<Entry> _entries;
    BytesRef _dlf;
    std::vector<std::string> _omissions;
};

} // namespace orvex
