#include "GarbageSource.h"

#include "packets/PacketWriter.h"

#include "MessageFrame.h"

#include <algorithm>

namespace orvex::korat {

namespace {
constexpr int kLongestRandom = 400;
constexpr LogCode kPropertyListCodes = 3;
} // namespace

bool isReadAsPropertyList(const Bytes& message)
{
    const MessageFrame frame(message);
    return frame.isComplete() && frame.logType() == MessageFrame::kTypeExtra
        && frame.logCode() - kExtraCodeBase < kPropertyListCodes;
}

Bytes GarbageSource::pass(Bytes message)
{
    if (message.empty() || !_randomness.chance(_share))
        return message;
    Bytes result = garbage(message);
    while (isReadAsPropertyList(result))
        result = garbage(message);
    return result;
}

Bytes GarbageSource::garbage(const Bytes& message)
{
    const auto randomByte = [this] { return static_cast<std::uint8_t>(_randomness.number(0, 255)); };
    const auto header = static_cast<std::ptrdiff_t>(PacketWriter::kHeaderLength);
    Bytes result = message;
    switch (_randomness.number(0, 3)) {
    case 0: // random bytes
        result.resize(static_cast<std::size_t>(_randomness.number(0, kLongestRandom)));
        std::generate(result.begin(), result.end(), randomByte);
        break;
    case 1: // a random payload of a random length
        result.resize(
            PacketWriter::kHeaderLength + static_cast<std::size_t>(_randomness.number(0, kLongestRandom)));
        std::generate(result.begin() + header, result.end(), randomByte);
        break;
    case 2: // a random log type
        result[0] = randomByte();
        break;
    default: // a cut packet
        result.resize(static_cast<std::size_t>(_randomness.number(0, static_cast<int>(message.size()) - 1)));
    }
    return result;
}

} // namespace orvex::korat
