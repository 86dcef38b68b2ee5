#pragma once

#include "Array.h"
#include "FileStorage.h"
#include "FixedClock.h"
#include "LogGenerator.h"
#include "SystemLog.h"

#include <memory>

namespace orvex::test {

// A real generator with its real template, and what it shows after the messages it was fed.
class Decoding {
public:
    explicit Decoding(const char* technology)
    {
        installConsole([](std::string_view) {}); // some sections write a line for every packet
        _generator = LogGenerator::generatorFromTechnology(technology, {_resources, _clock, std::nullopt});
    }

    void feed(const Bytes& message) { _generator->updateState(*_state, message); }

    // Null before the first message.
    Value display() const { return (*_state)["Display"]; }

private:
    FileResources _resources{ORVEX_RESOURCES};
    FixedClock _clock;
    DictionaryRef _state = Dictionary::make();
    std::unique_ptr<LogGenerator> _generator;
};

} // namespace orvex::test
