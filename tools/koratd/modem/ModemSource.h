#pragma once

#include "modem/ModemPackets.h"
#include "modem/ModemReader.h"

#include "Source.h"

#include <deque>
#include <map>

namespace orvex::korat {

// The messages of one technology about a modem, while a monitor watches: each when its content changes, and
// again after 30 seconds without a change.
class ModemSource final : public Source {
public:
    static constexpr std::chrono::seconds kLongestSilence{30};

    // The reader outlives the source.
    ModemSource(const ModemReader& reader, std::string technology, bool withMeasurements);

    std::optional<Message> next(Microseconds now) override;
    bool isLive() const override { return true; }

private:
    struct Sent {
        Bytes payload;
        Microseconds time{};
    };

    void look(Microseconds now);

    const ModemReader& _reader;
    std::string _technology;
    bool _withMeasurements;
    std::optional<std::uint64_t> _version; // of the state when it was looked at last
    Microseconds _repeat{};                // when something unchanged is due again
    std::map<std::optional<LogCode>, Sent> _sent;
    std::deque<Message> _waiting;
};

} // namespace orvex::korat
