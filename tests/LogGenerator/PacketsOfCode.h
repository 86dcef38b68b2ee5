#pragma once

#include "Captures.h"
#include "MessageFrame.h"
#include "PropertyList.h"

#include "PacketText.h"

#include <algorithm>
#include <functional>
#include <map>
#include <random>

namespace orvex::test {

// Packets to try on a technology's decoders, by code: the longest ones of its capture, which have lists
// that are not empty, property lists in both forms, and for baseband codes two of random bytes.
class PacketsOfCode {
public:
    explicit PacketsOfCode(const std::string& technology)
    {
        for (Bytes& message : captureOf(technology))
            _packets[MessageFrame(message).logCode()].push_back(std::move(message));
        for (auto& [code, packets] : _packets) {
            std::ranges::stable_sort(packets, std::greater(), &Bytes::size);
            packets.resize(std::min(packets.size(), kOfCapture));
            if (code >= kExtraCodeBase) {
                packets.push_back(inBinaryForm(packets.front()));
            } else if (std::ranges::find(kOfOneLength, code) == std::end(kOfOneLength)) {
                for (const std::size_t length : {60U, 1800U})
                    packets.push_back(packet(code, randomBytes(length)));
            }
        }
    }

    const std::vector<Bytes>& operator[](LogCode code) { return _packets[code]; }

private:
    static constexpr std::size_t kOfCapture = 3;
    static constexpr LogCode kOfOneLength[] = {0x108A, 0x1183}; // others are dropped

    static Bytes inBinaryForm(const Bytes& packet)
    {
        const auto list = propertyListFromData(ByteView(packet).subspan(kPacketHeaderLength));
        Bytes result(packet.begin(), packet.begin() + kPacketHeaderLength);
        const Bytes binary = propertyListBinary(list.value.value()).value();
        result.insert(result.end(), binary.begin(), binary.end());
        return result;
    }

    Bytes randomBytes(std::size_t length)
    {
        Bytes bytes(length);
        for (std::uint8_t& byte : bytes)
            byte = static_cast<std::uint8_t>(_random());
        return bytes;
    }

    std::map<LogCode, std::vector<Bytes>> _packets;
    std::mt19937 _random{1}; // the same packets every time
};

} // namespace orvex::test
