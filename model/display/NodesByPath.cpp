#include "NodesByPath.h"

namespace orvex {

namespace {

constexpr std::string_view kRootPath = "/";

// The last node, at or below this one, whose path is the node's own path plus `rest`.
OrvexModelNodeRef lastAt(const OrvexModelNodeRef& node, std::string_view rest, bool isAtRoot)
{
    if (rest.empty())
        return node;
    const auto* children = node->childNodes();
    if (!children)
        return nullptr;
    for (std::size_t i = children->size(); i > 0; --i) {
        const OrvexModelNodeRef& child = (*children)[i - 1];
        std::string_view restOfChild = rest;
        bool isChildAtRoot = isAtRoot;
        if (const std::string_view name = withoutSlashesAround(child->displayName()); !name.empty()) {
            if (!isAtRoot && !restOfChild.starts_with('/'))
                continue;
            restOfChild.remove_prefix(isAtRoot ? 0 : 1);
            if (!restOfChild.starts_with(name))
                continue;
            restOfChild.remove_prefix(name.size());
            isChildAtRoot = false;
        }
        if (auto found = lastAt(child, restOfChild, isChildAtRoot))
            return found;
    }
    return nullptr;
}

} // namespace

OrvexModelNodeRef NodesByPath::operator[](std::string_view path) const
{
    if (!_root || !path.starts_with(kRootPath))
        return nullptr;
    return lastAt(_root, path.substr(kRootPath.size()), true);
}

std::string_view withoutSlashesAround(std::string_view name)
{
    const auto first = name.find_first_not_of('/');
    if (first == std::string_view::npos)
        return {};
    return name.substr(first, name.find_last_not_of('/') - first + 1);
}

std::string pathByAppending(const std::string& path, std::string_view component)
{
    const std::string_view name = withoutSlashesAround(component);
    if (name.empty())
        return path;
    std::string result = path;
    if (!result.ends_with('/'))
        result += '/';
    return result += name;
}

} // namespace orvex
