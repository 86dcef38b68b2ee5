#include "TimelineLayout.h"

#include "NodesByPath.h"
#include "TextFormat.h"

#include <utility>

namespace orvex {

TimelineLayout::TimelineLayout(TimelineNode& node, std::size_t number)
    : _node(node)
    , _branch(*node.branch)
    , _number(number)
    , _wasStale(std::exchange(_branch.isStale, false))
    , _before(std::exchange(_branch.places, {}))
{
}

TimelineNode& TimelineLayout::child(std::string_view name)
{
    const auto [child, isNew, id] = claim(_branch.children, std::string(name));
    if (isNew)
        child.name = {pathByAppending(_node.name.path, id), _node.name.key};
    return child;
}

TimelineNode& TimelineLayout::element(const std::string& identity)
{
    const auto [element, isNew, id] = claim(_branch.elements, identity);
    if (isNew)
        element.name = {pathByAppending(_node.name.path, "*"), joined(_node.name.key, "; ", id)};
    return element;
}

TimelineLayout::Claim TimelineLayout::claim(
    std::unordered_map<std::string, TimelineNode>& nodes, const std::string& name)
{
    const auto [first, isNewName] = nodes.try_emplace(name);
    if (std::exchange(first->second.layout, _number) != _number)
        return {first->second, isNewName, name};
    for (std::size_t& count = _counts[name];;) {
        std::string id = numbered(name, ++count + 1);
        const auto [found, isNew] = nodes.try_emplace(id);
        if (std::exchange(found->second.layout, _number) != _number)
            return {found->second, isNew, std::move(id)};
    }
}

void TimelineLayout::markStale() const
{
    for (const TimelineBranch::Place& place : _branch.places) {
        if (place.node && place.node->branch)
            place.node->branch->isStale = true;
    }
}

std::vector<TimelineNode*> TimelineLayout::leftOver() const
{
    std::vector<TimelineNode*> result;
    for (const TimelineBranch::Place& place : _before) {
        if (place.node && place.node->layout != _number)
            result.push_back(place.node);
    }
    return result;
}

std::string joined(std::string_view first, std::string_view separator, std::string_view second)
{
    std::string result(first);
    if (!result.empty())
        result += separator;
    result += second;
    return result;
}

std::string numbered(const std::string& name, std::size_t number)
{
    return number == 1 ? name : joined(name, " ", text("(%zu)", number));
}

} // namespace orvex
