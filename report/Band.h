#pragma once

#include "TreeJson.h"

#include <cstdint>
#include <string>
#include <vector>

namespace orvex {

// A text over time, drawn as a strip. Of more than 20,000 changes, buckets of equal length remain, each with
// the text that held longest in it.
class Band {
public:
    static constexpr std::size_t kLimit = 20'000;

    Band(std::string title, bool isCell)
        : _title(std::move(title))
        , _isCell(isCell)
    {
    }

    // An empty text is no text.
    void add(std::int64_t position, const std::string& text);

    // Before it is written.
    void finish();

    bool isEmpty() const { return _changes.empty(); }
    void writeJson(JsonWriter& json) const;

private:
    void thin();

    struct Change {
        std::int64_t position;
        std::string text;
    };

    std::string _title;
    bool _isCell;
    std::vector<Change> _changes;
    std::int64_t _bucket = 0; // ms; 0 while nothing was thinned
};

} // namespace orvex
