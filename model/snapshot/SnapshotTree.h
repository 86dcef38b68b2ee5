#pragma once

#include "OrvexModelNode.h"
#include "Snapshot.h"

namespace orvex {

// What a snapshot shows on the list screens: a branch for every entry that has a display, named by its
// description, then as texts the size of the DLF and the user's words.
OrvexModelNodeRef snapshotTree(const Snapshot& snapshot);

// What an entry of a snapshot is called: its description.
std::string snapshotEntryName(const Dictionary& entry);

// Sets a row. Rows of one name would hide each other: from the second on they are numbered.
void setUnderFreeName(Dictionary& rows, const std::string& name, const Value& value);

} // namespace orvex
