// Reads a snapshot file, shows it as the application and orvex-decode do, writes it and reads it again.

#include "FuzzTarget.h"
#include "MemoryFile.h"

#include "DisplayTreePrinter.h"
#include "Snapshot.h"
#include "SnapshotDocument.h"
#include "SnapshotTree.h"
#include "TreeJson.h"
#include "XMLText.h"

#include <sstream>

int LLVMFuzzerTestOneInput(const std::uint8_t* data, std::size_t size)
{
    using namespace orvex;
    const fuzz::MemoryFile file({data, size});
    const auto read = readSnapshot(file.path());
    fuzz::require(
        read.snapshot.has_value() == read.error.empty(), "a snapshot or the reason why there is none");
    if (!read.snapshot)
        return 0;
    DisplayTreePrinter::text(*snapshotTree(*read.snapshot));
    const SnapshotDocument document(file.path(), read);
    document.tree();
    std::ostringstream text;
    JsonWriter json(text);
    document.writeJson(json);

    const fuzz::MemoryFile copy;
    if (!writeSnapshot(*read.snapshot, copy.path()).empty())
        return 0;
    const auto again = readSnapshot(copy.path());
    fuzz::require(again.snapshot.has_value(), "a snapshot that was written can be read");
    fuzz::require(again.snapshot->description == xmlText(read.snapshot->description),
        "the description is kept, except for invalid bytes");
    fuzz::require(again.snapshot->data->size() == read.snapshot->data->size(), "the entries are kept");
    return 0;
}
