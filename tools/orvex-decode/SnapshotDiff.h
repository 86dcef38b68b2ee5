#pragma once

#include "DecodeOptions.h"
#include "OrvexModelNode.h"
#include "Snapshot.h"

#include <functional>
#include <optional>
#include <ostream>
#include <string>

namespace orvex {

// A row that two trees show differently. A value is absent where the tree has no such row.
struct RowDifference {
    std::string path;
    const std::string* from;
    const std::string* to;
};

// Reports the rows that differ, in the order of the first tree, then those that only the second has, branch
// by branch. Branches and rows belong together by their names; of several with the same name the first
// belongs to the first, and so on. Either tree may be null.
void compareTrees(const OrvexModelNode* from, const OrvexModelNode* to, const std::string& path,
    const std::function<void(const RowDifference&)>& report);

// The last display of a snapshot, at the path; null when there is none.
OrvexModelNodeRef lastDisplay(const Snapshot& snapshot, const std::string& path);

// Writes the rows that differ: a line "PATH: FROM -> TO" each, or JSON. Returns their number.
std::size_t writeDifferences(
    const OrvexModelNode* from, const OrvexModelNode* to, const DecodeOptions& options, std::ostream& stream);

} // namespace orvex
