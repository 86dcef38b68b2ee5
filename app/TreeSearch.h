#pragma once

#include "OrvexModelNode.h"

#include <QString>

#include <string>
#include <vector>

namespace orvex {

// A row found by a search.
struct FoundRow {
    std::vector<std::string> names; // of the branches on the way, from below the root, and of the row
    OrvexModelNodeRef node;
};

// Up to `most` rows whose name or value contains the text, regardless of case, in tree order. None for an
// empty text.
std::vector<FoundRow> searchTree(const OrvexModelNode& root, const QString& text, std::size_t most = 200);

} // namespace orvex
