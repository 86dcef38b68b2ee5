#pragma once

#include "TreeJson.h"

#include <cstdint>
#include <string>
#include <vector>

namespace orvex {

// A text over time, drawn as a strip. Changes beyond the first 20,000 are left out.
class Band {
public:
    static constexpr std::size_t kLimit = 20'000;

    Band(std::string title, bool isCell)
        : _title(std::move(title))
        , _isCell(isCell)
    {
    }

    // An empty text is no text. A change at the position of the last one replaces that.
    void add(std::int64_t position, const std::string& text);

    bool isEmpty() const { return _changes.empty(); }
    void writeJson(JsonWriter& json) const;

private:
    struct Change {
        std::int64_t position;
        std::string text;
    };

    std::string _title;
    bool _isCell;
    std::vector<Change> _changes;
    std::size_t _omitted = 0;
};

} // namespace orvex
