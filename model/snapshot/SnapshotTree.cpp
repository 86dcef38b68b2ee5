#include "SnapshotTree.h"

#include "TextFormat.h"

namespace orvex {

void setUnderFreeName(Dictionary& rows, const std::string& name, const Value& value)
{
    std::string free = name;
    for (int number = 2; rows.contains(free); ++number)
        free = text("%s (%d)", name.c_str(), number);
    rows.set(free, value);
}

std::string snapshotEntryName(const Dictionary& entry)
{
    const std::string* description = entry["Description"].string();
    return description ? *description : "(no description)";
}

OrvexModelNodeRef snapshotTree(const Snapshot& snapshot)
{
    Dictionary rows;
    std::size_t dlfBytes = 0;
    for (const Value& element : *snapshot.data) {
        const Dictionary& entry = *element.dictionary();
        if (const Value& display = entry["Display"]; display.dictionary() || display.array())
            setUnderFreeName(rows, snapshotEntryName(entry), display);
        if (const BytesRef dlf = entry["DLF"].data())
            dlfBytes += dlf->size();
    }
    if (dlfBytes > 0)
        setUnderFreeName(rows, "DLF", text("%zu bytes", dlfBytes));
    setUnderFreeName(rows, "Description", snapshot.description.empty() ? "—" : snapshot.description);

    NodesByPath paths; // nobody asks a snapshot for a path
    return OrvexModelNode::makeTreeFromObject(rows.shallowCopy(), paths);
}

} // namespace orvex
