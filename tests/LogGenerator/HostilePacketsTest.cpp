// Packets of every code, cut at every length and with other values at each of their first bytes. Of a cut
// packet a decoder shows what the whole one shows, and leaves the rest alone; no list is longer than its
// packet.

#include "EveryDecoder.h"
#include "PacketsOfCode.h"

#include "CellMonitorList.h"
#include "ExtraPackets.h"

#include <gtest/gtest.h>

#include <numeric>

namespace orvex::test {
namespace {

// Where the records of a list stand in its packet, and the least that one of them takes.
struct ListBound {
    const char* decoder;
    LogCode code;
    const char* row; // empty: the container itself is the list
    std::size_t start;
    std::size_t least;
};

// Every list that a baseband packet fills. Lists of property lists are as long as the list says.
constexpr ListBound kListBounds[] = {
    {"Active Set", 0x417A, "", 16, 15 + 44},
    {"BLER", 0x4116, "Transport Channels", 16, 9},
    {"CCTRCH SIR", 0xD00C, "", 289, 8},
    {"CDMA2000", 0x108A, "kFingerC2I", 23, 14},
    {"CDMA2000", 0x119C, "k1xActiveSetInfo", 17 + 12, 12},
    {"CDMA2000", 0x12B6, "kActiveSetPilots", 25, 12},
    {"Detected Cells", 0xB179, "", 29, 2},
    {"Equivalent PLMN List", 0x7150, "", 17 + 3, 3},
    {"GSM Set", 0x4005, "", 15, 7},
    {"HSDPA Info", 0x4221, "Primary HARQ Process", 18, 9},
    {"HSDPA Info", 0x4221, "Secondary HARQ Process", 18, 9},
    {"Measured Neighbor Cells", 0xB179, "", 29, 6},
    {"Mobile Allocation", 0x51F8, "ARFCNs", 15, 2},
    {"Neighbor Cell List", 0xD00A, "", 168, 16},
    {"Neighbor Cells List", 0xB180, "", 21, 20},
    {"Neighboring Cells", 0x5137, "", 29, 14},
    {"Reselection Candidates List", 0xB186, "", 21, 4},
    {"TRCH BLER", 0xD00C, "", 17, 2},
    {"UMTS Set", 0x4005, "", 15, 10},
};

// Whether the shown list is no longer than the packet's bytes allow. A list of which nothing is known has no
// records.
void expectBound(const Decoder& decoder, const std::string& row, const Value& shown, std::size_t packetLength)
{
    const auto rows = shown.dictionary();
    if (decoder.code >= kExtraCodeBase || (!rows && !shown.array()))
        return;
    const std::size_t records =
        rows ? rows->size() - (rows->contains("_sorted") ? 1 : 0) : shown.array()->size();
    const auto bound = std::ranges::find_if(kListBounds, [&](const ListBound& each) {
        return each.decoder == decoder.name && each.code == decoder.code && each.row == row;
    });
    const bool isKnown = bound != std::end(kListBounds) && packetLength >= bound->start;
    EXPECT_LE(records, isKnown ? (packetLength - bound->start) / bound->least : 0)
        << decoder.name << ' ' << row << ' ' << packetLength;
}

// Feeds one packet, which may be one that ends the process by design.
void feed(const Decoder& decoder, const Value& container, const Bytes& packet)
{
    try {
        decoder.feed(container, packet);
    } catch (const LogCode_0xFF0000::UnknownDataException&) {
        EXPECT_EQ(decoder.code, kExtraCodeSimFiles) << decoder.name;
    } catch (const PDPContextList::UnknownDataException&) {
        EXPECT_EQ(decoder.code, kExtraCodePDPContexts) << decoder.name;
    } catch (const CellMonitorList::WrongKindException&) {
        EXPECT_EQ(decoder.code, kExtraCodeCellMonitorList) << decoder.name;
    }
}

class HostilePackets : public testing::TestWithParam<const char*> {
protected:
    // Calls the function with every decoder and packet of its code.
    template <typename Function>
    void forEachPacket(Function function)
    {
        for (const Decoder& decoder : _decoders.all()) {
            EXPECT_FALSE(_packets[decoder.code].empty()) << decoder.code;
            for (const Bytes& packet : _packets[decoder.code])
                function(decoder, packet);
        }
    }
    bool isFirst(const Decoder& decoder, const Bytes& packet)
    {
        return &packet == &_packets[decoder.code].front();
    }

private:
    const EveryDecoder _decoders{GetParam()};
    PacketsOfCode _packets{GetParam()};
};

INSTANTIATE_TEST_SUITE_P(, HostilePackets,
    testing::Values(telephony::kTechnologyMRL_GSM, telephony::kTechnologyMRL_CDMA,
        telephony::kTechnologyMRL_LTE, telephony::kTechnologyMRL_UTRAN2),
    [](const auto& each) { return std::string(each.param); });

// Rows that say something of their own about a cut packet: an average of the entries that are there, and a
// missing state, which is reported as unknown.
bool isExempt(const Decoder& decoder, const std::string& row)
{
    return (decoder.code == 0x4031 && row == "Transmit Power") || (decoder.code == 0xD0E0 && row == "State");
}

// A text is the same; a list has only records of the whole one, from its first one on.
bool isBeginningOf(const Value& shown, const Value& whole)
{
    const auto begins = [](const auto& some, const auto& all) {
        return some.size() <= all.size() && std::equal(some.begin(), some.end(), all.begin());
    };
    if (shown.array() && whole.array())
        return begins(*shown.array(), *whole.array());
    if (shown.dictionary() && whole.dictionary())
        return begins(*shown.dictionary(), *whole.dictionary());
    return shown == whole;
}

TEST_P(HostilePackets, CutOnesShowWhatIsThere)
{
    constexpr std::size_t kEveryLength = 420; // then samples
    const Value kept = "kept";
    std::map<LogCode, bool> hasShown;
    forEachPacket([&](const Decoder& decoder, const Bytes& packet) {
        const auto whole = Dictionary::make();
        feed(decoder, whole, packet);
        const auto wholeList = Array::make({kept});
        feed(decoder, wholeList, packet);
        hasShown[decoder.code] |= !whole->isEmpty() || *wholeList != Array{kept};
        for (std::size_t length = 0; length < packet.size(); length += length < kEveryLength ? 1 : 23) {
            const Bytes cut(packet.begin(), packet.begin() + static_cast<std::ptrdiff_t>(length));
            const auto rows = Dictionary::make({{"Other", kept}});
            for (const auto& row : *whole)
                rows->set(row.key, kept);
            feed(decoder, rows, cut);
            for (const auto& [row, shown] : *rows) {
                if (shown == kept || isExempt(decoder, row))
                    continue;
                EXPECT_TRUE(isBeginningOf(shown, (*whole)[row]))
                    << decoder.name << ' ' << row << ' ' << length;
                expectBound(decoder, row, shown, length);
            }
            const auto list = Array::make({kept});
            feed(decoder, list, cut);
            if (*list != Array{kept}) {
                EXPECT_TRUE(isBeginningOf(list, wholeList)) << decoder.name << ' ' << length;
                expectBound(decoder, "", list, length);
            }
        }
    });
    for (const auto& [code, isShown] : hasShown)
        EXPECT_TRUE(isShown || code == 0x51FF) << code; // which is only remembered
}

TEST_P(HostilePackets, ChangedOnesMakeNoListLongerThanThePacket)
{
    constexpr std::size_t kBytesTried = 60; // of the payload
    const std::vector<std::uint8_t> edges = {0, 1, 2, 3, 7, 8, 15, 16, 31, 64, 127, 128, 254, 255};
    std::vector<std::uint8_t> all(256);
    std::iota(all.begin(), all.end(), 0);
    forEachPacket([&](const Decoder& decoder, const Bytes& packet) {
        const bool isExtra = decoder.code >= kExtraCodeBase;
        if (isExtra && packet[kPacketHeaderLength] == '<')
            return; // begins with a heading; the binary form does not
        const auto probe = Dictionary::make();
        feed(decoder, probe, packet);
        const std::size_t end = std::min(packet.size(), kPacketHeaderLength + kBytesTried);
        Bytes changed = packet;
        for (std::size_t offset = kPacketHeaderLength; offset < end; ++offset) {
            for (const std::uint8_t value : isFirst(decoder, packet) && !isExtra ? all : edges) {
                changed[offset] = value;
                if (probe->isEmpty()) {
                    const auto list = Array::make();
                    feed(decoder, list, changed);
                    expectBound(decoder, "", list, packet.size());
                    continue;
                }
                const auto rows = Dictionary::make();
                feed(decoder, rows, changed);
                for (const auto& [row, shown] : *rows)
                    expectBound(decoder, row, shown, packet.size());
            }
            changed[offset] = packet[offset];
        }
    });
}

} // namespace
} // namespace orvex::test
