#include "Snapshot.h"

#include "PropertyList.h"
#include "RegularFile.h"
#include "TextFormat.h"

#include <algorithm>
#include <cmath>
#include <fstream>

namespace orvex {

namespace {

constexpr const char* kTimestamp = "Timestamp";
constexpr const char* kData = "Data";
constexpr const char* kDescription = "Description";

SnapshotResult failure(const std::string& path, const std::string& reason)
{
    return {std::nullopt, path + ": " + reason};
}

// Why the property list is no snapshot; null when it is one.
const char* faultOf(const Value& list)
{
    const DictionaryRef dictionary = list.dictionary();
    if (!dictionary)
        return "not a snapshot: its property list is no dictionary";
    const ArrayRef data = (*dictionary)[kData].array();
    if (!data)
        return R"(not a snapshot: it has no list "Data")";
    if (!std::ranges::all_of(*data, [](const Value& entry) { return entry.dictionary() != nullptr; }))
        return R"(not a snapshot: an entry of "Data" is no dictionary)";
    for (const char* key : {kTimestamp, kDescription}) {
        if (!(*dictionary)[key].string())
            return R"(not a snapshot: "Timestamp" or "Description" is no text)";
    }
    return nullptr;
}

} // namespace

std::string snapshotPath(const std::string& directory, Date saved)
{
    return text("%s/OrvexSnapshot-%ld.orvex", directory.c_str(),
        static_cast<long>(std::floor(saved.secondsSince1970)));
}

bool writeSnapshot(const Snapshot& snapshot, const std::string& path)
{
    const auto list = propertyListXML(Dictionary::make({
        {kTimestamp, snapshot.timestamp},
        {kData, snapshot.data},
        {kDescription, snapshot.description},
    }));
    if (!list)
        return false;
    std::ofstream file(path, std::ios::binary);
    file.write(reinterpret_cast<const char*>(list->data()), static_cast<std::streamsize>(list->size()));
    file.close();
    return !file.fail();
}

SnapshotResult readSnapshot(const std::string& path)
{
    const auto [bytes, error] = readFile(path, PropertyListLimits().maximumBytes);
    if (!error.empty())
        return failure(path, error);
    const auto list = propertyListFromData(bytes);
    if (!list.value)
        return failure(path, "not a snapshot: " + list.error);
    if (const char* fault = faultOf(*list.value))
        return failure(path, fault);
    const Dictionary& dictionary = *list.value->dictionary();
    return {Snapshot{*dictionary[kTimestamp].string(), dictionary[kData].array(),
                *dictionary[kDescription].string()},
        {}};
}

} // namespace orvex
