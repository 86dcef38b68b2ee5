#pragma once

#include <string>
#include <string_view>
#include <vector>

namespace orvex {

// The rows of the display that somebody wants to follow, as paths of the display tree. "*" stands for one
// component; a branch takes everything below it.
class TimelineFields {
public:
    // What the paths leave of a branch. Valid as long as the fields.
    class Part {
    public:
        bool isNothing() const { return !_isWhole && _rests.empty(); }
        bool isWhole() const { return _isWhole; }
        // What they leave of the child with that display name.
        Part below(std::string_view name) const;

    private:
        friend class TimelineFields;

        struct Rest {
            std::string_view path; // below the branch, without "/" in front
            bool* isFound;         // set when a row or branch with the whole path turns up
        };

        bool _isWhole = false;
        std::vector<Rest> _rests;
    };

    // Everything.
    TimelineFields() = default;
    // Only these; each begins with "/".
    explicit TimelineFields(const std::vector<std::string>& paths);
    TimelineFields(const TimelineFields&) = delete;
    TimelineFields& operator=(const TimelineFields&) = delete;

    // What they leave of the display.
    Part ofDisplay();
    // The paths at which nothing was shown so far.
    std::vector<std::string> missing() const;

private:
    struct Field {
        std::string path;
        bool isFound = false;
    };

    std::vector<Field> _fields;
};

} // namespace orvex
