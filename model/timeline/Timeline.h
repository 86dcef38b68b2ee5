#pragma once

#include "TimelineFields.h"
#include "TimelineSink.h"

#include "Value.h"

#include <memory>
#include <string>
#include <unordered_set>

namespace orvex {

class TimelineLayout;
struct TimelineNode;

// Follows the display over time: tells the sink which rows have changed between two looks at it.
//
// Keeps what each row showed last, so its memory grows with the rows ever shown. It walks the containers of
// the display, which the next message changes, rather than the tree made from them: building that costs as
// much as decoding two seconds of messages. It shares no container, because a list that somebody else holds
// is not refilled in place.
class Timeline {
public:
    // Both outlive the timeline.
    Timeline(TimelineFields& fields, TimelineSink& sink);
    ~Timeline();
    Timeline(const Timeline&) = delete;
    Timeline& operator=(const Timeline&) = delete;

    // Times are those of the caller and may go back. A null display shows nothing.
    void sample(Date time, const Value& display);

private:
    void follow(TimelineNode& node, const Value& value, const TimelineFields::Part& fields);
    void followText(TimelineNode& node, const std::string& text);
    void followChildren(TimelineNode& node, const Dictionary& dictionary, const TimelineFields::Part& fields);
    void followElements(TimelineNode& node, const Array& array, const TimelineFields::Part& fields);
    void layOut(TimelineNode& node, const Dictionary& dictionary, const TimelineFields::Part& fields);
    void layOut(TimelineNode& node, const Array& array, const TimelineFields::Part& fields);
    void finish(const TimelineLayout& layout, const TimelineFields::Part& fields);
    void addRow(TimelineNode& node);
    void hide(TimelineNode& node);
    void hideText(TimelineNode& node);

    TimelineSink& _sink;
    TimelineFields::Part _fields;
    std::unique_ptr<TimelineNode> _root;
    const Value* _display = nullptr;           // while it is looked at
    std::unordered_set<std::string> _rowNames; // path and key of each row
    std::size_t _layouts = 0;
};

} // namespace orvex
