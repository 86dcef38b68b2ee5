#include "InputMessages.h"

#include <algorithm>

namespace orvex::fuzz {

namespace {
constexpr std::size_t kLengthWidth = 2;
} // namespace

std::optional<Bytes> InputMessages::next()
{
    if (_rest.size() < kLengthWidth)
        return std::nullopt;
    const std::size_t told = _rest[0] | static_cast<std::size_t>(_rest[1]) << 8;
    _rest = _rest.subspan(kLengthWidth);
    const ByteView message = _rest.first(std::min(told, _rest.size()));
    _rest = _rest.subspan(message.size());
    return Bytes(message.begin(), message.end());
}

Bytes InputMessages::inputOf(std::span<const Bytes> messages)
{
    Bytes input;
    for (const Bytes& message : messages) {
        input.push_back(static_cast<std::uint8_t>(message.size()));
        input.push_back(static_cast<std::uint8_t>(message.size() >> 8));
        input.insert(input.end(), message.begin(), message.end());
    }
    return input;
}

} // namespace orvex::fuzz
