#include "SnapshotDocument.h"

#include "OfflineSession.h"

#include "DisplayTreePrinter.h"
#include "NodesByPath.h"
#include "PropertyList.h"
#include "RawMessages.h"
#include "SnapshotTree.h"
#include "TextFormat.h"

#include <utility>

namespace orvex {

namespace {

// Feeds the messages kept in an entry. Returns the number of bytes that are not part of one.
std::size_t feed(OfflineSession& session, const Value& kept)
{
    if (const BytesRef packets = kept.data()) {
        RawMessages messages(*packets);
        while (const auto message = messages.next())
            session.take(*message);
        return messages.rest();
    }
    // A technology whose messages are property lists keeps the last one, parsed.
    const auto message = propertyListXML(kept);
    if (!message)
        return 0;
    if (message->size() > PropertyListLimits().maximumBytes) // too large for a session
        return message->size();
    session.take(*message);
    return 0;
}

OrvexModelNodeRef treeOf(const Value& display)
{
    NodesByPath paths;
    return OrvexModelNode::makeTreeFromObject(display, paths);
}

} // namespace

SnapshotDocument::SnapshotDocument(const Snapshot& snapshot)
    : _timestamp(snapshot.timestamp)
    , _description(snapshot.description)
{
    for (const Value& element : *snapshot.data) {
        const Dictionary& entry = *element.dictionary();
        _entries.push_back(
            {snapshotEntryName(entry), entry["Date"], entry["Display"], entry["DisplayState"], {}});
        if (const BytesRef dlf = entry["DLF"].data())
            _dlf = dlf;
    }
}

void SnapshotDocument::decodeAnew(std::unique_ptr<LogGenerator> generator)
{
    OfflineSession session(std::move(generator), 0);
    for (Entry& entry : _entries) {
        if (entry.messages.isNull())
            continue;
        if (const std::size_t rest = feed(session, entry.messages))
            _omissions.push_back(
                text("%s: %zu bytes that make no message were left out", entry.description.c_str(), rest));
        entry.decoded = session.display().deepCopy(); // decoding the next entry changes it
    }
}

std::string SnapshotDocument::tree(std::size_t longestText) const
{
    NumberedRows rows{{"Timestamp", _timestamp}, {"Description", _description}};
    for (const Entry& entry : _entries) {
        auto shown = Dictionary::make();
        for (const auto& [name, value] : {std::pair<const char*, Value>{"Date", entry.date},
                 {"Display", entry.display}, {"Decoded anew", entry.decoded}}) {
            if (!value.isNull())
                shown->set(name, value);
        }
        rows.add(entry.description, shown);
    }
    return DisplayTreePrinter::text(*treeOf(rows.dictionary()), longestText);
}

void SnapshotDocument::writeJson(JsonWriter& json) const
{
    json.beginObject();
    json.member("timestamp", _timestamp);
    json.member("description", _description);
    json.key("entries");
    json.beginArray();
    for (const Entry& entry : _entries) {
        json.beginObject();
        json.member("description", entry.description);
        if (const std::string* date = entry.date.string())
            json.member("date", *date);
        for (const auto& [name, display] :
            {std::pair<const char*, const Value&>{"display", entry.display}, {"decoded", entry.decoded}}) {
            if (display.isNull())
                continue;
            json.key(name);
            writeTreeJson(json, *treeOf(display));
        }
        json.endObject();
    }
    json.endArray();
    json.endObject();
}

} // namespace orvex
