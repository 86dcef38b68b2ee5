#include "TreeJson.h"

#include "NodesByPath.h"

#include <algorithm>
#include <string>

namespace orvex {

namespace {

constexpr std::size_t kLevelsWithPaths = 32;

std::size_t levelsBelow(const OrvexModelNode& node)
{
    std::size_t levels = 0;
    if (const auto* children = node.childNodes()) {
        for (const auto& child : *children)
            levels = std::max(levels, 1 + levelsBelow(*child));
    }
    return levels;
}

// Without paths when there is none.
void writeNode(JsonWriter& json, const OrvexModelNode& node, const std::string* path)
{
    json.beginObject();
    json.member("name", node.displayName());
    if (path)
        json.member("path", *path);
    if (const auto* children = node.childNodes()) {
        json.key("children");
        json.beginArray();
        for (const auto& child : *children) {
            const std::string childPath = path ? pathByAppending(*path, child->displayName()) : "";
            writeNode(json, *child, path ? &childPath : nullptr);
        }
        json.endArray();
    } else if (const std::string* value = node.value()) {
        json.member("value", *value);
    }
    json.endObject();
}

} // namespace

void writeTreeJson(JsonWriter& json, const OrvexModelNode& root)
{
    const std::string rootPath = "/";
    const bool isDeep = levelsBelow(root) >= kLevelsWithPaths;
    json.setCompact(isDeep);
    writeNode(json, root, isDeep ? nullptr : &rootPath);
    json.setCompact(false);
}

} // namespace orvex
