#include "Timeline.h"

#include "TimelineNode.h"

#include "Array.h"
#include "ArrayLock.h"
#include "Dictionary.h"
#include "DisplayOrder.h"
#include "NodesByPath.h"
#include "TextFormat.h"

#include <algorithm>
#include <utility>

namespace orvex {

namespace {

// Without the separator where there is nothing in front of it.
std::string joined(std::string_view first, std::string_view separator, std::string_view second)
{
    std::string result(first);
    if (!result.empty())
        result += separator;
    result += second;
    return result;
}

// The second of the same name is "name (2)".
std::string numbered(const std::string& name, std::size_t number)
{
    return number == 1 ? name : joined(name, " ", text("(%zu)", number));
}

TimelineBranch& branchOf(TimelineNode& node)
{
    if (!node.branch) {
        node.branch = std::make_unique<TimelineBranch>();
        node.branch->sharedIdentity = sharedIdentityOfList(node.name.path);
        node.branch->elementName = elementNameOfDictionary(node.name.path);
    }
    return *node.branch;
}

bool isLaidOut(const TimelineBranch& branch, const Dictionary& dictionary)
{
    return !branch.isArray && !branch.isStale
        && std::ranges::equal(branch.places, dictionary, [](const auto& place, const auto& entry) {
               return place.key == entry.key && place.isNull == entry.value.isNull();
           });
}

bool isLaidOut(const TimelineBranch& branch, const Array& array)
{
    return branch.isArray && !branch.isStale
        && std::ranges::equal(branch.places, array,
            [](const auto& place, const Value& element) { return place.identity.isStillOf(element); });
}

// Distributes the nodes of a branch anew. What was shown and has no place any more is left over.
class Layout {
public:
    Layout(TimelineNode& node, std::size_t number)
        : _node(node)
        , _branch(*node.branch)
        , _number(number)
        , _before(std::exchange(_branch.places, {}))
    {
    }

    TimelineNode& child(std::string_view name)
    {
        const auto [child, isNew, id] = claim(_branch.children, std::string(name));
        if (isNew)
            child.name = {pathByAppending(_node.name.path, id), _node.name.key};
        return child;
    }
    TimelineNode& element(std::string identity)
    {
        const auto [element, isNew, id] = claim(_branch.elements, std::move(identity));
        if (isNew) {
            const std::string& key = _node.name.key;
            element.name = {pathByAppending(_node.name.path, "*"), joined(key, "; ", id)};
        }
        return element;
    }

    template <typename Hide>
    void finish(const TimelineFields::Part& fields, Hide hide) const
    {
        // An element that has moved may be wanted in other parts, and so all below it.
        if (std::exchange(_branch.isStale, false) || !fields.isWhole()) {
            for (const TimelineBranch::Place& place : _branch.places) {
                if (place.node && place.node->branch)
                    place.node->branch->isStale = true;
            }
        }
        for (const TimelineBranch::Place& place : _before) {
            if (place.node && place.node->layout != _number)
                hide(*place.node);
        }
    }

private:
    struct Claim {
        TimelineNode& node;
        bool isNew;
        std::string id;
    };

    Claim claim(std::unordered_map<std::string, TimelineNode>& nodes, const std::string& name)
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

    TimelineNode& _node;
    TimelineBranch& _branch;
    std::size_t _number;
    std::vector<TimelineBranch::Place> _before;
    std::unordered_map<std::string, std::size_t> _counts; // of names after their first
};

} // namespace

Timeline::Timeline(TimelineFields& fields, TimelineSink& sink)
    : _sink(sink)
    , _fields(fields.ofDisplay())
    , _root(std::make_unique<TimelineNode>())
{
    _root->name.path.push_back('/');
}

Timeline::~Timeline() = default;

void Timeline::sample(Date time, const Value& display)
{
    const ArrayLockScope lock;
    _sink.sample(time);
    _display = &display;
    if (display.isNull())
        hide(*_root);
    else
        follow(*_root, display, _fields);
    _display = nullptr;
}

void Timeline::follow(TimelineNode& node, const Value& value, const TimelineFields::Part& fields)
{
    if (const Dictionary* dictionary = value.heldDictionary()) {
        hideText(node);
        followChildren(node, *dictionary, fields);
    } else if (const Array* array = value.heldArray()) {
        hideText(node);
        followElements(node, *array, fields);
    } else if (fields.isWhole()) {
        followText(node, shownText(value));
    } else {
        hide(node);
    }
}

void Timeline::followText(TimelineNode& node, const std::string& text)
{
    if (node.isShown && node.text == text)
        return;
    if (!node.isShown)
        hide(node); // a container until now
    if (!node.row)
        addRow(node);
    node.isShown = true;
    node.text = text;
    _sink.set(*node.row, text);
}

void Timeline::followChildren(
    TimelineNode& node, const Dictionary& dictionary, const TimelineFields::Part& fields)
{
    TimelineBranch& branch = branchOf(node);
    if (!isLaidOut(branch, dictionary))
        layOut(node, dictionary, fields);
    auto place = branch.places.begin();
    for (const Dictionary::Entry& entry : dictionary) {
        if (place->node)
            follow(*place->node, entry.value, place->fields);
        ++place;
    }
}

void Timeline::followElements(TimelineNode& node, const Array& array, const TimelineFields::Part& fields)
{
    TimelineBranch& branch = branchOf(node);
    const std::string* shared = branch.sharedIdentity ? textOf(*branch.sharedIdentity, *_display) : nullptr;
    const bool isSameShared = shared ? branch.sharedText == *shared : !branch.sharedText;
    if (!isSameShared)
        branch.sharedText = shared ? std::optional(*shared) : std::nullopt;
    if (!isSameShared || !isLaidOut(branch, array))
        layOut(node, array, fields);
    auto place = branch.places.begin();
    for (const Value& element : array) {
        if (place->node)
            follow(*place->node, element, place->fields);
        ++place;
    }
}

void Timeline::layOut(TimelineNode& node, const Dictionary& dictionary, const TimelineFields::Part& fields)
{
    TimelineBranch& branch = *node.branch;
    Layout layout(node, ++_layouts);
    branch.isArray = false;
    branch.places.reserve(dictionary.size());
    for (const Dictionary::Entry& entry : dictionary)
        branch.places.push_back({entry.key, entry.value.isNull(), nullptr, {}, {}});
    visitShown(dictionary, [&](std::string_view name, const Dictionary::Entry& entry) {
        TimelineBranch::Place& place = branch.places[static_cast<std::size_t>(&entry - &*dictionary.begin())];
        place.fields = fields.below(name);
        if (place.fields.isNothing())
            return;
        place.node =
            branch.elementName ? &layout.element(joined(branch.elementName, " ", name)) : &layout.child(name);
    });
    layout.finish(fields, [this](TimelineNode& left) { hide(left); });
}

void Timeline::layOut(TimelineNode& node, const Array& array, const TimelineFields::Part& fields)
{
    TimelineBranch& branch = *node.branch;
    Layout layout(node, ++_layouts);
    branch.isArray = true;
    branch.places.reserve(array.size());
    for (const Value& element : array) {
        const std::string number = std::to_string(branch.places.size());
        TimelineBranch::Place& place = branch.places.emplace_back();
        place.fields = fields.below(number);
        place.identity = ElementIdentity(element);
        if (place.fields.isNothing())
            continue;
        std::string identity = place.identity.text();
        if (identity.empty())
            identity = number;
        else if (branch.sharedText)
            identity.append(", ").append(branch.sharedIdentity->label).append(" ").append(*branch.sharedText);
        place.node = &layout.element(std::move(identity));
    }
    layout.finish(fields, [this](TimelineNode& left) { hide(left); });
}

void Timeline::addRow(TimelineNode& node)
{
    // Names hold anything, so "a/b" may be one of them or two.
    const std::string key = node.name.key;
    for (std::size_t number = 2; !_rowNames.insert(joined(node.name.path, "\n", node.name.key)).second;
         ++number)
        node.name.key = numbered(key, number);
    node.row = _rowNames.size() - 1;
    _sink.addRow(*node.row, node.name);
}

void Timeline::hide(TimelineNode& node)
{
    hideText(node);
    if (!node.branch)
        return;
    for (const TimelineBranch::Place& place : node.branch->places) {
        if (place.node)
            hide(*place.node);
    }
}

void Timeline::hideText(TimelineNode& node)
{
    if (!node.isShown)
        return;
    node.isShown = false;
    node.text.clear();
    _sink.clear(*node.row);
}

} // namespace orvex
