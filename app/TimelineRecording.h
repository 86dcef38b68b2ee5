#pragma once

#include "OutputFile.h"
#include "Sampling.h"
#include "Timeline.h"
#include "TimelineCsv.h"

#include <memory>
#include <optional>
#include <ostream>
#include <string>

namespace orvex {

// Records what a session shows over time as comma-separated values (TimelineCsv).
//
// The file has its name from the start and each sample is written at once, so that a field test that ends
// with an empty battery has its rows.
class TimelineRecording {
public:
    // Creates the file, or empties it.
    TimelineRecording(std::string path, const Sampling& sampling);

    void sample(Date now, const Value& display);
    // Why the file could not be created or written, in one line; empty if it could.
    const std::string& failure() const { return _failure; }

private:
    void write();

    std::string _path;
    std::string _failure;
    FilePointer _file;
    std::optional<FileBuffer> _buffer;
    std::ostream _stream{nullptr};
    TimelineFields _fields;
    std::optional<TimelineCsv> _csv;
    std::optional<Timeline> _timeline;
};

} // namespace orvex
