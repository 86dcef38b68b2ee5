#pragma once

#include "OrvexModelNode.h"
#include "Snapshot.h"

namespace orvex {

// What a snapshot shows on the list screens: a branch for every entry that has a display, named by its
// description, then as texts the size of the DLF and the user's words.
OrvexModelNodeRef snapshotTree(const Snapshot& snapshot);

// What an entry of a snapshot is called: its description.
std::string snapshotEntryName(const Dictionary& entry);

} // namespace orvex
