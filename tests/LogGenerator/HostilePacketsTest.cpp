// Packets of every code, cut at every length: of a cut packet the display shows what it shows of the whole
// one, and the rest is left alone.

#include "Captures.h"
#include "GeneratorFixture.h"

#include "FileStorage.h"
#include "MessageFrame.h"
#include "PacketText.h"

#include <algorithm>
#include <map>
#include <random>

namespace orvex::test {
namespace {

const Value kKept = "kept";

// Every row is "kept" then, and every list has "kept" alone.
void clear(const Value& container)
{
    if (const auto list = container.array()) {
        list->removeAll();
        list->append(kKept);
    } else if (const auto rows = container.dictionary()) {
        for (const auto& [name, value] : *rows) {
            clear(value);
            if (!value.array() && !value.dictionary())
                rows->set(name, kKept);
        }
    }
}

class HostilePackets : public GeneratorFixture, public testing::WithParamInterface<const char*> {
protected:
    // What this packet alone shows, in a display cleared before.
    Value displayOf(const Bytes& packet)
    {
        state.remove("TrafficFER"); // an average
        for (const char* counter : {"FLDataSeqNum", "FLDataSent", "RLDataSeqNum", "RLDataSent"})
            state.set(counter, 0); // without which no rate is shown
        clear(state["Display"]);
        try {
            _generator->updateState(state, packet);
        } catch (...) { // by design, of an extra packet without a property list
            EXPECT_GE(MessageFrame(packet).logCode(), kExtraCodeBase);
        }
        return state["Display"];
    }

    // Packets to try, by code: the longest ones of the capture, which have lists that are not empty, and for
    // baseband codes two of random bytes, whose counts mostly lie.
    static std::map<LogCode, std::vector<Bytes>> packetsToTry()
    {
        constexpr std::size_t kOfCapture = 3;
        std::mt19937 random{1}; // the same packets every time
        std::map<LogCode, std::vector<Bytes>> packetsByCode;
        for (Bytes& message : captureOf(GetParam()))
            packetsByCode[MessageFrame(message).logCode()].push_back(std::move(message));
        for (auto& [code, packets] : packetsByCode) {
            std::ranges::stable_sort(packets, std::greater(), &Bytes::size);
            packets.resize(std::min(packets.size(), kOfCapture));
            for (Bytes payload : {Bytes(60), Bytes(1800)}) {
                if (code >= kExtraCodeBase || code == 0x108A || code == 0x1183)
                    break; // the last two have one length; others are dropped
                std::ranges::generate(payload, [&random] { return static_cast<std::uint8_t>(random()); });
                packets.push_back(packet(code, payload));
            }
        }
        return packetsByCode;
    }

private:
    FileResources _templates{ORVEX_RESOURCES};
    ConsoleLines _console;
    std::unique_ptr<LogGenerator> _generator =
        LogGenerator::generatorFromTechnology(GetParam(), {_templates, clock, {}, 0});
};

INSTANTIATE_TEST_SUITE_P(, HostilePackets, testing::Values("MRL_GSM", "MRL_CDMA", "MRL_LTE", "MRL_UTRAN2"),
    [](const auto& each) { return std::string(each.param); });

// True when each text is kept or the same, and each list has only records of the whole one, from its first
// one on.
bool isPartOf(const Value& shown, const Value& whole)
{
    const auto list = shown.array();
    const auto wholeList = whole.array();
    if (list && wholeList)
        return *list == Array({kKept})
            || (list->size() <= wholeList->size()
                && std::equal(list->begin(), list->end(), wholeList->begin()));
    const auto rows = shown.dictionary();
    const auto wholeRows = whole.dictionary();
    if (!rows || !wholeRows)
        return shown == kKept || shown == whole;
    return std::ranges::all_of(*rows, [&wholeRows](const Dictionary::Entry& row) {
        // An average of the entries that are there, and a missing state, which is reported as unknown.
        const bool hasItsOwnWay = row.key == "Transmit Power" || row.key == "State";
        return hasItsOwnWay || isPartOf(row.value, (*wholeRows)[row.key]);
    });
}

TEST_P(HostilePackets, ShowWhatIsThereWhenCut)
{
    constexpr std::size_t kEveryLength = 420; // then samples
    for (const auto& [code, packets] : packetsToTry()) {
        displayOf(packets[0]); // lays out the display
        const std::string nothing = shown(displayOf({}));
        bool hasShown = code == 0x51FF; // which is only remembered
        for (const Bytes& packet : packets) {
            const Value whole = displayOf(packet).deepCopy();
            hasShown = hasShown || shown(whole) != nothing;
            for (std::size_t length = 0; length < packet.size(); length += length < kEveryLength ? 1 : 23) {
                const Value part = displayOf({packet.begin(), packet.begin() + static_cast<long>(length)});
                EXPECT_TRUE(isPartOf(part, whole)) << code << " cut to " << length << ": " << shown(part);
            }
        }
        EXPECT_TRUE(hasShown) << code;
    }
}

} // namespace
} // namespace orvex::test
