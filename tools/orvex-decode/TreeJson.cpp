#include "TreeJson.h"

#include "NodesByPath.h"

#include <nlohmann/json.hpp>

namespace orvex {

namespace {
using Json = nlohmann::ordered_json;

Json jsonOf(const OrvexModelNode& node, const std::string& path)
{
    Json result = {{"name", node.displayName()}, {"path", path}};
    if (const auto* children = node.childNodes()) {
        Json list = Json::array();
        for (const auto& child : *children)
            list.push_back(jsonOf(*child, pathByAppending(path, child->displayName())));
        result["children"] = std::move(list);
    } else if (const std::string* value = node.value()) {
        result["value"] = *value;
    }
    return result;
}
} // namespace

Json treeJson(const OrvexModelNode& root)
{
    return jsonOf(root, "/");
}

std::string documentText(const Json& document)
{
    return document.dump(2, ' ', false, Json::error_handler_t::replace) + "\n";
}

} // namespace orvex
