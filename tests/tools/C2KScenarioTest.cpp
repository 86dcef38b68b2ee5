// What the CDMA2000 scenario sends, read from the bytes as a receiver does.

#include "packets/C2KForwardLinkPacket.h"
#include "packets/C2KReverseLinkPacket.h"

#include "ScenarioItems.h"

#include "PacketReader.h"

#include <gtest/gtest.h>

#include <algorithm>
#include <cmath>
#include <map>
#include <set>

namespace orvex::korat {
namespace {

using namespace std::chrono_literals;

constexpr int kForwardBits[] = {128, 256, 512, 1024, 0, 128, 256, 512, 1024, 0, 128, 256, 512, 1024, 0, 128,
    256, 512, 1024, 0, 128, 256, 512, 1024, 0, 512, 1024, 2048, 0, 128, 256, 512, 1024, 0, 512, 1024, 2048, 0,
    1024, 3072, 0, 512, 1024, 2048, 0, 4096, 0, 1024, 3072, 0, 4096, 0, 5120, 0, 5120, 0};
constexpr int kReverseBits[] = {128, 256, 512, 768, 1024, 1536, 2048, 3072, 4096, 6144, 8192, 12288};
// A wrong weight of the sender would shift the rates too little to be seen in them.
static_assert(std::ranges::equal(kForwardBits, C2KForwardLinkPacket::kBits));
static_assert(std::ranges::equal(kReverseBits, C2KReverseLinkPacket::kBits));

class C2KDrive {
public:
    void note(const Scenario::Item& item);

    std::map<std::string, std::pair<double, double>> ranges;
    std::map<std::string, std::set<int>> kinds;

private:
    void note(const char* measure, double value)
    {
        auto& [least, most] = ranges.try_emplace(measure, value, value).first->second;
        least = std::min(least, value);
        most = std::max(most, value);
    }
    void noteRatio(const char* measure, double ratio) { note(measure, 10 * std::log10(ratio)); }
    void note1xStatus(const PacketReader& packet);
    void noteRate(const char* measure, std::uint32_t sequence, double bits);

    std::map<std::string, std::pair<std::uint32_t, double>> _counters;
    double _errorRate = 0;
    Microseconds _lastFrame{-1h};
    int _frames = 0;
};

void C2KDrive::note1xStatus(const PacketReader& packet)
{
    std::map<int, std::size_t> starts;
    std::size_t start = 17;
    for (int i = 0; i < packet.u8(14); ++i, start += packet.u16(start + 2))
        starts[packet.u8(start)] = start;
    EXPECT_EQ(starts.size(), 4U);
    EXPECT_EQ(start, packet.size());

    const int state = packet.u8(starts.at(1) + 4);
    kinds["1x states"].insert(state);
    note("1x AGC", static_cast<std::int8_t>(packet.u8(starts.at(2) + 10)) * 0.334 - 63.248);
    const std::size_t set = starts.at(3);
    const double sum = packet.u16(set + 4);
    const std::size_t fingers = packet.u8(set + 9);
    const std::size_t stride = (6 * fingers + 15) & 0xFFC;
    note("1x pilots", packet.u8(set + 8));
    for (std::size_t i = 0; i < packet.u8(set + 8); ++i) {
        const double energy = packet.u16(set + i * stride + 24 + 4 * fingers);
        const double scale = std::exp2(2 * packet.u8(set + 7) - 3) / (9 * sum * sum * packet.u8(set + 6));
        noteRatio("1x strength", scale * energy - 1 / sum);
        note("1x PN", packet.u16(set + 12 + i * stride));
    }
    if (state != 8 && _frames > 0) {
        note("call's frame errors, %", _errorRate * 100);
        _errorRate = 0;
        _frames = 0;
    }
}

void C2KDrive::noteRate(const char* measure, std::uint32_t sequence, double bits)
{
    if (const auto last = _counters.find(measure); last != _counters.end()) {
        EXPECT_EQ(sequence, last->second.first + 1);
        note(measure, (bits - last->second.second) / 1024);
    }
    _counters[measure] = {sequence, bits};
}

void C2KDrive::note(const Scenario::Item& item)
{
    static constexpr std::size_t kReverseColumns[] = {0, 4, 8, 12, 288, 292, 296, 300};

    const PacketReader packet(item.message.bytes);
    switch (item.message.code.value_or(0)) {
    case 0x119C: note1xStatus(packet); break;
    case 0x119D:
        // One every 20 ms of a call.
        EXPECT_TRUE(item.due - _lastFrame == 20ms || _frames == 0);
        _lastFrame = item.due;
        ++_frames;
        _errorRate = _errorRate * 63 / 64 + (packet.u8(17 + 24) != 0 ? 1 / 64.0 : 0);
        break;
    case 0x134F:
        kinds["systems"].insert(packet.u16(50));
        kinds["roaming"].insert(packet.s32(42));
        break;
    case 0x1183:
        kinds["EV-DO states"].insert(packet.u8(36));
        kinds["sessions"].insert(packet.u8(37));
        note("EV-DO AGC", static_cast<std::int8_t>(packet.u8(15)));
        note("serving PN", packet.u16(18));
        break;
    case 0x12B6:
        note("EV-DO pilots", packet.u8(15));
        for (std::size_t i = 0; i < packet.u8(15); ++i)
            noteRatio("EV-DO strength", packet.u16(25 + 12 * i + 2) / 512.0);
        break;
    case 0x108A: {
        int following = 0;
        for (std::size_t i = 0; i < packet.u8(22); ++i) {
            if (packet.u16(23 + 14 * i) == 65535)
                continue;
            ++following;
            noteRatio("C/I", packet.u16(23 + 14 * i + 6) / 512.0);
        }
        note("fingers", following);
        break;
    }
    case 0x1192: {
        double bits = 0;
        for (std::size_t i = 0; i < std::size(kForwardBits); ++i)
            bits += static_cast<double>(packet.u32(17 + 4 * i)) * kForwardBits[i];
        noteRate("forward kbps", packet.u32(13), bits);
        break;
    }
    case 0x127E: {
        double bits = 0;
        for (std::size_t r = 0; r < std::size(kReverseBits); ++r) {
            for (std::size_t j = 0; j < 3; ++j) {
                for (const std::size_t column : kReverseColumns)
                    bits += static_cast<double>(packet.u32(18 + 24 * r + 576 * j + column)) * kReverseBits[r];
            }
        }
        noteRate("reverse kbps", packet.u32(14), bits);
        break;
    }
    default: ADD_FAILURE() << item.message.code.value_or(0);
    }
}

TEST(C2KTownScenario, IsBelievableAndReachesEveryState)
{
    const struct {
        const char* measure;
        std::pair<double, double> least;
        std::pair<double, double> most;
    } ranges[] = {
        {"1x AGC", {-106, -90}, {-60, -20}},
        {"1x strength", {-29, -12}, {-9, -6.9}},
        {"1x pilots", {0, 0}, {2, 6}},
        {"1x PN", {0, 100}, {300, 511}},
        {"call's frame errors, %", {0, 3}, {1, 20}},
        {"EV-DO AGC", {-106, -90}, {-60, -20}},
        {"EV-DO strength", {-22, -6}, {-1, 0}},
        {"EV-DO pilots", {0, 0}, {2, 6}},
        {"serving PN", {0, 100}, {65535, 65535}},
        {"fingers", {0, 0}, {3, 8}},
        {"C/I", {-25, -10}, {9, 16}},
        {"forward kbps", {0, 0}, {1500, 2400}},
        {"reverse kbps", {0, 0}, {200, 500}},
    };
    C2KDrive drive;
    for (const auto& item : itemsOf(*findScenario("MRL_CDMA", "town"), 600s))
        drive.note(item);
    for (const auto& [measure, least, most] : ranges) {
        const auto& [actualLeast, actualMost] = drive.ranges.at(measure);
        EXPECT_TRUE(least.first <= actualLeast && actualLeast <= least.second)
            << measure << ' ' << actualLeast;
        EXPECT_TRUE(most.first <= actualMost && actualMost <= most.second) << measure << ' ' << actualMost;
    }
    EXPECT_EQ(drive.kinds,
        (std::map<std::string, std::set<int>>{{"1x states", {3, 4, 6, 7, 8}}, {"systems", {4106, 4122, 5213}},
            {"roaming", {0, 1, 7}}, {"EV-DO states", {0, 1, 2, 3, 4, 5}}, {"sessions", {0, 1, 2, 3, 4}}}));
}

} // namespace
} // namespace orvex::korat
