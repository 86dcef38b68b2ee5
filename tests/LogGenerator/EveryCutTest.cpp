// Packets of every code, cut at every length: of what a cut packet still holds it shows what the whole one
// shows, and leaves the rest alone.

#include "HostilePackets.h"

namespace orvex::test {
namespace {

// Rows that say something of their own about a cut packet.
struct Exempt {
    const char* decoder;
    LogCode code;
    const char* row;
};

constexpr Exempt kExempt[] = {
    {"UMTS RR Info", 0x4031, "Transmit Power"}, // an average of the entries that are there
    {"RRC Info", 0xD0E0, "State"},              // reports a missing state as unknown
};

bool isExempt(const Decoder& decoder, std::string_view row)
{
    return std::ranges::any_of(kExempt, [&](const Exempt& each) {
        return each.decoder == decoder.name && each.code == decoder.code && each.row == row;
    });
}

// A text is the same; a list has only records of the whole one, from its first one on.
bool isBeginningOf(const Value& shown, const Value& whole)
{
    const auto records = shown.array();
    const auto allRecords = whole.array();
    if (records && allRecords)
        return records->size() <= allRecords->size()
            && std::equal(records->begin(), records->end(), allRecords->begin());
    const auto rows = shown.dictionary();
    const auto allRows = whole.dictionary();
    if (rows && allRows)
        return rows->size() <= allRows->size() && std::equal(rows->begin(), rows->end(), allRows->begin());
    return shown == whole;
}

// Every length of the header and what follows it at once; of a long packet's rest, samples.
std::vector<std::size_t> cutsOf(const Bytes& packet)
{
    constexpr std::size_t kEveryLength = 420;
    constexpr std::size_t kStep = 23;
    std::vector<std::size_t> cuts;
    for (std::size_t length = 0; length < packet.size(); length += length < kEveryLength ? 1 : kStep)
        cuts.push_back(length);
    return cuts;
}

class EveryCut : public testing::TestWithParam<const char*> {
protected:
    // All rows that the whole packet shows, and one that it does not.
    static Value markedRows(const Dictionary& whole)
    {
        auto rows = Dictionary::make({{"Other", kKept}});
        for (const auto& [key, value] : whole)
            rows->set(key, kKept);
        return rows;
    }

    void tryRows(const Decoder& decoder, const Bytes& packet)
    {
        const auto whole = Dictionary::make();
        survives(decoder, whole, packet);
        for (const std::size_t length : cutsOf(packet)) {
            const Value container = markedRows(*whole);
            survives(decoder, container, Bytes(packet.begin(), packet.begin() + std::ptrdiff_t(length)));
            for (const auto& [row, shown] : *container.dictionary()) {
                if (shown == Value(kKept) || isExempt(decoder, row))
                    continue;
                EXPECT_TRUE(isBeginningOf(shown, (*whole)[row]))
                    << decoder.name << ' ' << row << ' ' << length;
                if (decoder.code < kExtraCodeBase)
                    expectBound(decoder, row.c_str(), shown, length);
            }
        }
        _hasShown[decoder.code] |= !whole->isEmpty();
    }

    void tryList(const Decoder& decoder, const Bytes& packet)
    {
        const auto whole = Array::make({kKept});
        survives(decoder, whole, packet);
        for (const std::size_t length : cutsOf(packet)) {
            const auto container = Array::make({kKept});
            survives(decoder, container, Bytes(packet.begin(), packet.begin() + std::ptrdiff_t(length)));
            if (*container == Array{kKept})
                continue;
            EXPECT_TRUE(isBeginningOf(container, whole)) << decoder.name << ' ' << length;
            if (decoder.code < kExtraCodeBase)
                expectBound(decoder, nullptr, container, length);
        }
        _hasShown[decoder.code] |= *whole != Array{kKept};
    }

    std::map<LogCode, bool> _hasShown;
};

INSTANTIATE_TEST_SUITE_P(, EveryCut, testing::ValuesIn(kMarlinTechnologies),
    [](const auto& each) { return std::string(each.param); });

TEST_P(EveryCut, ShowsOfThePacketWhatIsThere)
{
    const EveryDecoder decoders(GetParam());
    PacketsOfCode packets(GetParam());
    for (const Decoder& decoder : decoders.all()) {
        EXPECT_FALSE(packets[decoder.code].empty()) << decoder.code;
        for (const Bytes& packet : packets[decoder.code]) {
            tryRows(decoder, packet);
            tryList(decoder, packet);
        }
    }
    for (const auto& [code, hasShown] : _hasShown)
        EXPECT_TRUE(hasShown || code == 0x51FF) << code; // which is only remembered
}

} // namespace
} // namespace orvex::test
