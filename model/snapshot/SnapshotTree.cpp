#include "SnapshotTree.h"

#include "NodesByPath.h"

#include "TextFormat.h"

namespace orvex {

std::string snapshotEntryName(const Dictionary& entry)
{
    const std::string* description = entry["Description"].string();
    return description ? *description : "(no description)";
}

OrvexModelNodeRef snapshotTree(const Snapshot& snapshot)
{
    NumberedRows rows;
    std::size_t dlfBytes = 0;
    for (const Value& element : *snapshot.data) {
        const Dictionary& entry = *element.dictionary();
        if (const Value& display = entry["Display"]; display.dictionary() || display.array())
            rows.add(snapshotEntryName(entry), display);
        if (const BytesRef dlf = entry["DLF"].data())
            dlfBytes += dlf->size();
    }
    if (dlfBytes > 0)
        rows.add("DLF", text("%zu bytes", dlfBytes));
    rows.add("Description", snapshot.description.empty() ? "—" : snapshot.description);

    NodesByPath paths; // not used: no path is looked up in a snapshot
    return OrvexModelNode::makeTreeFromObject(rows.dictionary(), paths);
}

void NumberedRows::add(const std::string& name, const Value& value)
{
    Value& last = _numbers.slot(name);
    std::int64_t number = last.integer() ? *last.integer() : 1;
    std::string free = name;
    while (_rows->contains(free))
        free = name + " (" + std::to_string(++number) + ')';
    last = number;
    _rows->set(free, value);
}

} // namespace orvex
