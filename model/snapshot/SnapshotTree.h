#pragma once

#include "OrvexModelNode.h"
#include "Snapshot.h"

namespace orvex {

// What a snapshot shows on the list screens: a branch for every entry that has a display, named by its
// description, then as texts the size of the DLF and the user's words.
OrvexModelNodeRef snapshotTree(const Snapshot& snapshot);

} // namespace orvex
