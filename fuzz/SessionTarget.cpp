// Runs a whole session. The first byte selects the technology; each message of the input is a piece of the
// frame stream on the log channel, and an empty one is a refresh.

#include "FuzzSession.h"
#include "FuzzTarget.h"

#include "PortFrame.h"
#include "TelephonyConstants.h"

namespace {

using namespace orvex;

constexpr std::int32_t kLogChannelMessageId = 0;

bool takeAll(FrameReader& reader, fuzz::FuzzSession& session)
{
    while (const auto frame = reader.take()) {
        if (frame->messageId == kLogChannelMessageId && !session.take(frame->payload))
            return false;
    }
    return true;
}

} // namespace

int LLVMFuzzerTestOneInput(const std::uint8_t* data, std::size_t size)
{
    if (size == 0)
        return 0;
    fuzz::FuzzSession session(telephony::kTechnologies[data[0] % std::size(telephony::kTechnologies)]);
    FrameReader reader;
    fuzz::InputMessages pieces({data + 1, size - 1});
    while (const auto piece = pieces.next()) {
        reader.append(*piece);
        if (!(piece->empty() ? session.refresh() : takeAll(reader, session)))
            return 0;
    }
    if (session.refresh())
        session.finish(fuzz::FuzzSession::Ending::readAgain);
    return 0;
}
