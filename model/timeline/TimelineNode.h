#pragma once

#include "ElementIdentity.h"
#include "TimelineFields.h"
#include "TimelineSink.h"

#include <cstddef>
#include <memory>
#include <optional>
#include <string>
#include <unordered_map>
#include <vector>

namespace orvex {

struct TimelineBranch;

// A row or a branch of the display that was ever shown: what a timeline knows of it.
struct TimelineNode {
    TimelineRow name;                       // of the row; of a branch, what those of its rows begin with
    std::optional<std::size_t> row;         // its number, once a text was shown here
    bool isShown = false;                   // as a text
    std::string text;                       // shown last
    std::size_t layout = 0;                 // the number of the layout that took it last
    std::unique_ptr<TimelineBranch> branch; // once a container was shown here
};

// A node that was ever a dictionary or an array.
struct TimelineBranch {
    // What is at a place of the container, in the order of its storage.
    struct Place {
        std::string key; // of a dictionary
        bool isNull = false;
        TimelineNode* node = nullptr; // null for what is not shown, or not wanted
        TimelineFields::Part fields;  // that are wanted below
        ElementIdentity identity;     // in an array
    };

    std::vector<Place> places; // all shown nodes are in here
    bool isArray = false;
    bool isStale = false;                  // the places no longer hold, whatever the container says
    std::optional<std::string> sharedText; // of the row beside an array that identifies its elements

    std::unordered_map<std::string, TimelineNode> children; // by shown name, numbered if not unique
    std::unordered_map<std::string, TimelineNode> elements; // by identity, likewise
    const SharedIdentity* sharedIdentity = nullptr;
    const char* elementName = nullptr;
};

} // namespace orvex
