#pragma once

#include "Program.h"
#include "Range.h"

#include "Value.h"

#include <QLocalSocket>

#include <memory>
#include <vector>

namespace orvex::soak {

// What a hostile peer of the log channel sends.
struct HostileStream {
    Bytes bytes;
    long messages = 0; // that a Marlin technology takes without being ended by them
};

// Small property lists that are, or would be, large.
std::vector<HostileStream> bombs();
// Frames that stay incomplete, and headers that make no sense.
std::vector<HostileStream> brokenFrames();
// More peers than the channel serves; they say nothing.
std::vector<HostileStream> idlePeers();

// Messages of 60 KB that MRL_LTE takes, as a capture.
void writeLargeMessages(const std::string& capture);

// Peers of the monitor's log channel, one for each stream, until they are destroyed.
class HostilePeers {
public:
    HostilePeers(const test::ProgramFolder& folder, const std::vector<HostileStream>& streams);

    // The messages that may have arrived.
    Range sent() const { return _sent; }

private:
    std::vector<std::unique_ptr<QLocalSocket>> _peers;
    Range _sent;
};

} // namespace orvex::soak
