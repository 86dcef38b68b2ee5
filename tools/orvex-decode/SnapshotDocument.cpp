#include "SnapshotDocument.h"

#include "Envelope.h"
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
    return display.isNull() ? nullptr : OrvexModelNode::makeTreeFromObject(display, paths);
}

// The same node under another name.
OrvexModelNodeRef renamed(const OrvexModelNode& node, const char* name)
{
    if (const auto* children = node.childNodes())
        return std::make_shared<OrvexModelTreeNode>(name, *children);
    return std::make_shared<OrvexModelLeafNode>(name, node.value() ? *node.value() : "");
}

} // namespace

SnapshotDocument::SnapshotDocument(std::string path, const SnapshotResult& result)
    : _path(std::move(path))
{
    const auto& [snapshot, error] = result;
    if (!snapshot) {
        const std::string prefix = _path + ": ";
        _failure = error.starts_with(prefix) ? error.substr(prefix.size()) : error;
        return;
    }
    _timestamp = snapshot->timestamp;
    _description = snapshot->description;
    for (const Value& element : *snapshot->data) {
        const Dictionary& entry = *element.dictionary();
        _entries.push_back(
            {snapshotEntryName(entry), entry["Date"], entry["DisplayState"], treeOf(entry["Display"]), {}});
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
        entry.decoded = treeOf(session.display());
    }
}

bool SnapshotDocument::restrictTo(const std::string& path)
{
    _nodePath = path;
    bool isFound = false;
    for (Entry& entry : _entries) {
        for (OrvexModelNodeRef* tree : {&entry.display, &entry.decoded}) {
            *tree = NodesByPath(*tree)[path];
            isFound = isFound || *tree;
        }
    }
    return isFound;
}

std::string SnapshotDocument::tree(std::size_t longestText) const
{
    NumberedRows names{{"Timestamp", _timestamp}, {"Description", _description}};
    for (const Entry& entry : _entries)
        names.add(entry.description, "");
    std::vector<OrvexModelNodeRef> rows;
    std::size_t number = 0;
    for (const auto& [name, value] : *names.dictionary()) {
        if (rows.size() < 2) {
            rows.push_back(std::make_shared<OrvexModelLeafNode>(name, *value.string()));
            continue;
        }
        const Entry& entry = _entries[number++];
        std::vector<OrvexModelNodeRef> shown;
        for (const auto& [title, node] : {std::pair("Date", treeOf(entry.date)),
                 std::pair("Display", entry.display), std::pair("Decoded anew", entry.decoded)}) {
            if (node)
                shown.push_back(renamed(*node, title));
        }
        rows.push_back(std::make_shared<OrvexModelTreeNode>(name, std::move(shown)));
    }
    return DisplayTreePrinter::text(OrvexModelTreeNode("Orvex", std::move(rows)), longestText);
}

void SnapshotDocument::writeJson(JsonWriter& json) const
{
    beginEnvelope(json, "snapshot", _path);
    if (!_failure.empty()) {
        json.member("error", _failure);
        json.endObject();
        return;
    }
    json.member("timestamp", _timestamp);
    json.member("description", _description);
    writeTexts(json, "errors", _omissions);
    json.key("entries");
    json.beginArray();
    for (const Entry& entry : _entries) {
        json.beginObject();
        json.member("description", entry.description);
        if (const std::string* date = entry.date.string())
            json.member("date", *date);
        for (const auto& [name, node] :
            {std::pair("display", entry.display), std::pair("decoded", entry.decoded)}) {
            if (!node)
                continue;
            json.key(name);
            writeTreeJson(json, *node, _nodePath);
        }
        json.endObject();
    }
    json.endArray();
    json.endObject();
}

} // namespace orvex
