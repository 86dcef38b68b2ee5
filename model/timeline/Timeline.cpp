#include "Timeline.h"

#include "TimelineLayout.h"
#include "TimelineNode.h"

#include "Array.h"
#include "ArrayLock.h"
#include "Dictionary.h"
#include "DisplayOrder.h"

#include <algorithm>

namespace orvex {

namespace {

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
    TimelineLayout layout(node, ++_layouts);
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
    finish(layout, fields);
}

void Timeline::layOut(TimelineNode& node, const Array& array, const TimelineFields::Part& fields)
{
    TimelineBranch& branch = *node.branch;
    TimelineLayout layout(node, ++_layouts);
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
        place.node = &layout.element(identity);
    }
    finish(layout, fields);
}

void Timeline::finish(const TimelineLayout& layout, const TimelineFields::Part& fields)
{
    if (layout.wasStale() || !fields.isWhole())
        layout.markStale();
    for (TimelineNode* node : layout.leftOver())
        hide(*node);
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
