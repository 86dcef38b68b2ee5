#pragma once

#include <cstddef>
#include <cstdint>
#include <string>
#include <vector>

namespace orvex {

// A line on a terminal that says how far a large job is; on anything else, and for small jobs, nothing.
class Progress {
public:
    // The captures that will be read, whose sizes make the job large or not.
    explicit Progress(const std::vector<std::string>& captures);
    ~Progress();
    Progress(const Progress&) = delete;
    Progress& operator=(const Progress&) = delete;

    // One more message of this length was taken.
    void advance(std::size_t messageLength);

private:
    void show() const;

    std::uintmax_t _totalBytes = 0;
    std::uintmax_t _bytes = 0;
    std::uintmax_t _nextShown = 0;
    bool _isShown = false;
};

} // namespace orvex
