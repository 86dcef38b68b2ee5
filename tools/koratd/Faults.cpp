#include "Faults.h"

#include "MessageFrame.h"

#include <algorithm>
#include <charconv>
#include <cmath>
#include <span>

namespace orvex::korat {

namespace {
constexpr int kLargestError = 2'000'000'000;
constexpr double kLongestLife = 1e6; // s
constexpr int kLongestGarbage = 400;
constexpr LogCode kPropertyListCodes = 3; // extra packets of other codes are dropped

// The number that a text is, from the least to the most.
template <typename Number>
std::optional<Number> numberBetween(std::string_view text, Number least, Number most)
{
    Number value{};
    const auto [end, error] = std::from_chars(text.data(), text.data() + text.size(), value);
    const bool isNumber = error == std::errc() && end == text.data() + text.size();
    return isNumber && value >= least && value <= most ? std::optional(value) : std::nullopt;
}

// Whether a receiver reads the message as an extra packet with a property list.
bool isReadAsPropertyList(const Bytes& message)
{
    const MessageFrame frame(message);
    return frame.isComplete() && frame.logType() == MessageFrame::kTypeExtra
        && frame.logCode() - kExtraCodeBase < kPropertyListCodes;
}
} // namespace

bool Faults::add(std::string_view option)
{
    const auto equals = option.find('=');
    const std::string_view name = option.substr(0, equals);
    const std::string_view value = equals == option.npos ? std::string_view() : option.substr(equals + 1);
    if (name == "refuse-channel") {
        refuseChannel = numberBetween(value, -kLargestError, kLargestError);
        return refuseChannel.value_or(0) != 0; // 0 would be success
    }
    if (name == "die-after") {
        const auto seconds = numberBetween(value, 0.0, kLongestLife);
        if (seconds)
            dieAfter = std::chrono::milliseconds(std::llround(*seconds * 1000));
        return seconds.has_value();
    }
    if (name == "garbage") {
        const auto percent = numberBetween(value, 0, 100);
        garbagePercent = percent.value_or(0);
        return percent.has_value();
    }
    static constexpr struct {
        std::string_view name;
        bool Faults::*flag;
    } kFlags[] = {
        {"null-port", &Faults::nullPort},
        {"no-reply", &Faults::noReply},
        {"bad-reply", &Faults::badReply},
        {"unknown-technology", &Faults::unknownTechnology},
    };
    const auto flag = std::ranges::find(kFlags, option, [](const auto& each) { return each.name; });
    if (flag == std::end(kFlags))
        return false;
    this->*flag->flag = true;
    return true;
}

void GarbageSource::spoil(Message& message)
{
    if (!message.code || number(1, 100) > _percent)
        return;
    Bytes result = garbage(message.bytes);
    while (isReadAsPropertyList(result))
        result = garbage(message.bytes);
    message.bytes = std::move(result);
}

Bytes GarbageSource::garbage(const Bytes& message)
{
    const auto randomByte = [this] { return static_cast<std::uint8_t>(number(0, 255)); };
    Bytes result = message;
    switch (number(0, 3)) {
    case 0: // random bytes
        result.resize(static_cast<std::size_t>(number(0, kLongestGarbage)));
        std::ranges::generate(result, randomByte);
        break;
    case 1: // a random payload of a random length
        result.resize(kPacketHeaderLength + static_cast<std::size_t>(number(0, kLongestGarbage)));
        std::ranges::generate(std::span(result).subspan(kPacketHeaderLength), randomByte);
        break;
    case 2: // a random log type
        result[0] = randomByte();
        break;
    default: // a cut packet
        result.resize(static_cast<std::size_t>(number(0, static_cast<int>(message.size()) - 1)));
    }
    return result;
}

} // namespace orvex::korat
