#include "SnapshotDiff.h"

#include "Envelope.h"
#include "Reporting.h"

#include "NodesByPath.h"
#include "VisibleText.h"

#include <map>
#include <string_view>
#include <vector>

namespace orvex {

namespace {

using Report = std::function<void(const RowDifference&)>;

const std::vector<OrvexModelNodeRef>& childrenOf(const OrvexModelNode* node)
{
    static const std::vector<OrvexModelNodeRef> kNone;
    return node && node->childNodes() ? *node->childNodes() : kNone;
}

// The children of a node, taken by name and each once.
class Children {
public:
    explicit Children(const OrvexModelNode* node)
    {
        const auto& children = childrenOf(node);
        for (std::size_t i = children.size(); i > 0; --i)
            _byName[children[i - 1]->displayName()].push_back(children[i - 1].get());
    }

    // The first that is left; null when there is none.
    const OrvexModelNode* take(const std::string& name)
    {
        const auto found = _byName.find(name);
        if (found == _byName.end() || found->second.empty())
            return nullptr;
        const OrvexModelNode* node = found->second.back();
        found->second.pop_back();
        return node;
    }

private:
    std::map<std::string_view, std::vector<const OrvexModelNode*>> _byName; // the first comes last
};

// What a line shows of a value.
std::string shown(const std::string* value, std::size_t longest)
{
    if (!value)
        return "(absent)";
    return value->empty() ? "(empty)" : visibleText(*value, longest);
}

} // namespace

void compareTrees(
    const OrvexModelNode* from, const OrvexModelNode* to, const std::string& path, const Report& report)
{
    const std::string* fromValue = from ? from->value() : nullptr;
    const std::string* toValue = to ? to->value() : nullptr;
    const bool areEqual = fromValue && toValue && *fromValue == *toValue;
    if ((fromValue || toValue) && !areEqual)
        report({path, fromValue, toValue});

    Children others(to);
    Children rest(from);
    for (const OrvexModelNodeRef& child : childrenOf(from)) {
        const std::string& name = child->displayName();
        compareTrees(child.get(), others.take(name), pathByAppending(path, name), report);
    }
    for (const OrvexModelNodeRef& child : childrenOf(to)) {
        const std::string& name = child->displayName();
        if (!rest.take(name)) // every other has been compared
            compareTrees(nullptr, child.get(), pathByAppending(path, name), report);
    }
}

OrvexModelNodeRef lastDisplay(const Snapshot& snapshot, const std::string& path)
{
    Value display;
    for (const Value& element : *snapshot.data) {
        if (const Value& shown = (*element.dictionary())["Display"]; !shown.isNull())
            display = shown;
    }
    NodesByPath nodes;
    OrvexModelNode::makeTreeFromObject(display, nodes);
    return display.isNull() ? nullptr : nodes[path];
}

std::size_t writeDifferences(
    const OrvexModelNode* from, const OrvexModelNode* to, const DecodeOptions& options, std::ostream& stream)
{
    std::size_t count = 0;
    if (options.format == DecodeOptions::Format::tree) {
        const std::size_t longest = longestText(options);
        compareTrees(from, to, options.path, [&](const RowDifference& row) {
            stream << visibleText(row.path, longest) << ": " << shown(row.from, longest) << " -> "
                   << shown(row.to, longest) << '\n';
            ++count;
        });
        return count;
    }
    JsonWriter json(stream);
    json.beginObject();
    json.member("schema", kJsonSchema);
    writeTexts(json, "snapshots", options.inputs);
    json.key("differences");
    json.beginArray();
    compareTrees(from, to, options.path, [&](const RowDifference& row) {
        json.beginObject();
        json.member("path", row.path);
        if (row.from)
            json.member("from", *row.from);
        if (row.to)
            json.member("to", *row.to);
        json.endObject();
        ++count;
    });
    json.endArray();
    json.endObject();
    json.endDocument();
    return count;
}

} // namespace orvex
