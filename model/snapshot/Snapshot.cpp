#include "Snapshot.h"

#include "OutputFile.h"
#include "PropertyList.h"
#include "RegularFile.h"
#include "TextFormat.h"

#include <algorithm>
#include <cmath>
#include <utility>

namespace orvex {

namespace {

constexpr const char* kTimestamp = "Timestamp";
constexpr const char* kData = "Data";
constexpr const char* kDescription = "Description";

// Enough for five history entries, each with the largest report that a session accepts, as received and as
// shown, inside the snapshot's own containers; or for 64 MiB of raw messages, twice, in base64.
constexpr PropertyListLimits kLimits{
    .maximumBytes = std::size_t{512} << 20, .maximumDepth = 512, .maximumNodes = 24'000'000};

SnapshotResult failure(const std::string& path, const std::string& reason)
{
    return {std::nullopt, path + ": " + reason};
}

// Keeps a large file that would be refused anyway from being read into memory.
bool isLongAndNoPropertyList(const std::string& path)
{
    constexpr std::size_t kLong = std::size_t{1} << 20;
    RegularFile file(path);
    if (file.size() <= kLong)
        return false;
    std::string beginning(64, '\0');
    file.readAt(0, {reinterpret_cast<std::uint8_t*>(beginning.data()), beginning.size()});
    const auto first = beginning.find_first_not_of("\xEF\xBB\xBF \t\r\n");
    return first == std::string::npos || (beginning[first] != '<' && !beginning.starts_with("bplist"));
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

std::string writeSnapshot(const Snapshot& snapshot, const std::string& path)
{
    const Value list = Dictionary::make({
        {kTimestamp, snapshot.timestamp},
        {kData, snapshot.data},
        {kDescription, snapshot.description},
    });
    if (const std::string fault = writePropertyListXML(list, [](std::string_view) {}); !fault.empty())
        return path + ": " + fault;
    auto [file, error] = openOutputFile(path);
    if (file) {
        writePropertyListXML(list,
            [&file = *file](std::string_view piece) { std::fwrite(piece.data(), 1, piece.size(), &file); });
        error = closeOutputFile(std::move(file));
    }
    return error.empty() ? std::string() : path + ": " + error;
}

SnapshotResult readSnapshot(const std::string& path)
{
    if (isLongAndNoPropertyList(path))
        return failure(path, "not a snapshot: it does not begin like a property list");
    auto [bytes, error] = readFile(path, kLimits.maximumBytes);
    if (!error.empty())
        return failure(path, error);
    const auto list = propertyListFromData(std::move(bytes), kLimits);
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
