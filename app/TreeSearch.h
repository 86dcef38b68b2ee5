#pragma once

#include "OrvexModelNode.h"

#include <QString>

#include <string>
#include <vector>

namespace orvex {

// A row of the tree that a search has found.
struct FoundRow {
    std::vector<std::string> names; // of the branches on the way, from below the root, and of the row
    OrvexModelNodeRef node;
};

// The rows whose name or value has the text, in upper or lower case, in the order of the tree; at most
// `most`. An empty text is nowhere.
std::vector<FoundRow> searchTree(const OrvexModelNode& root, const QString& text, std::size_t most = 200);

} // namespace orvex
