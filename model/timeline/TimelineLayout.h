#pragma once

#include "TimelineNode.h"

#include <cstddef>
#include <string>
#include <string_view>
#include <unordered_map>
#include <vector>

namespace orvex {

// Distributes the nodes of a branch anew when its container has other entries than before. The caller fills
// the places, which are empty at first.
class TimelineLayout {
public:
    // Numbers are unique and above 0.
    TimelineLayout(TimelineNode& node, std::size_t number);

    // The node with that display name; the second of the same name is called "name (2)".
    TimelineNode& child(std::string_view name);
    // The node of the element with that identity, likewise.
    TimelineNode& element(const std::string& identity);

    // Has every branch below laid out anew, whatever its container says: an element that has moved may be
    // wanted in other parts.
    void markStale() const;
    // True if this branch was marked so itself.
    bool wasStale() const { return _wasStale; }
    // What had a place before and has none any more.
    std::vector<TimelineNode*> leftOver() const;

private:
    struct Claim {
        TimelineNode& node;
        bool isNew;
        std::string id;
    };

    Claim claim(std::unordered_map<std::string, TimelineNode>& nodes, const std::string& name);

    TimelineNode& _node;
    TimelineBranch& _branch;
    std::size_t _number;
    bool _wasStale;
    std::vector<TimelineBranch::Place> _before;
    std::unordered_map<std::string, std::size_t> _counts; // of names after their first
};

// Without the separator where there is nothing in front of it.
std::string joined(std::string_view first, std::string_view separator, std::string_view second);
// The second of the same name is "name (2)".
std::string numbered(const std::string& name, std::size_t number);

} // namespace orvex
