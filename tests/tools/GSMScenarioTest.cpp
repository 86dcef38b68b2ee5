// A drive on GSM and UMTS, read byte by byte.

#include "packets/ExtraPacket.h"

#include "Drive.h"

#include "Array.h"
#include "Dictionary.h"
#include "PacketReader.h"
#include "PropertyList.h"
#include "TelephonyConstants.h"

#include <cmath>

namespace orvex::korat {
namespace {

using namespace std::chrono_literals;

class GSMDrive : public Drive {
public:
    using Drive::note;
    void note(const LogMessage& message);

private:
    void noteGSM(LogCode code, const PacketReader& packet);
    void noteSearcher(const PacketReader& packet);
    void noteRanking(const PacketReader& packet);
    void noteTransmitPower(const PacketReader& packet);
    void noteEquivalentNetworks(const PacketReader& packet);
    void noteProcesses(const PacketReader& packet, std::size_t first, std::size_t count);
    void noteCellMonitor(const Array& cells);
    void expectGrowth(const std::string& counter, std::int64_t value);

    LogCode _lastCode = 0;
    std::set<int> _allocation;
    std::map<std::string, std::int64_t> _counters; // of this connection
};

void GSMDrive::note(const LogMessage& message)
{
    static constexpr struct {
        LogCode code;
        std::size_t offset;
        const char* name;
    } kBytes[] = {{0x512C, 13, "RR states"}, {0x512C, 16, "modes"}, {0x5072, 19, "DTX"},
        {0x51F4, 14, "SI13 positions"}, {0x51F6, 15, "T3192"}, {0x7130, 13, "GMM states"},
        {0x7131, 13, "MM states"}, {0x7131, 15, "updates"}, {0x7132, 13, "registrations"},
        {0x7132, 14, "selections"}, {0x7135, 14, "services"}, {0x7150, 16, "equivalent networks"},
        {0x4125, 13, "RRC states"}, {0x4157, 13, "ciphering"}, {0x4221, 16, "primary processes"},
        {0x4221, 17, "secondary processes"}, {0x4116, 13, "transport channels"}};
    const PacketReader packet(message.bytes);
    for (const auto& [wanted, offset, name] : kBytes) {
        if (wanted == message.code)
            kinds[name].insert(packet.u8(offset));
    }
    const LogCode code = message.code.value_or(0);
    switch (code) {
    case 0x417A: noteSearcher(packet); break;
    case 0x4005: noteRanking(packet); break;
    case 0x4031: noteTransmitPower(packet); break;
    case 0x4125:
        if (packet.u8(13) == 1)
            _counters.clear();
        break;
    case 0x4116:
        for (std::size_t i = 0; i < packet.u8(13); ++i) {
            const std::size_t record = 16 + 9 * i;
            expectGrowth("blocks " + std::to_string(packet.u8(record)), packet.s32(record + 1));
            EXPECT_LT(packet.s32(record + 5), packet.s32(record + 1) / 2);
        }
        break;
    case 0x4221:
        kinds["carriers"].insert(static_cast<int>(packet.bits(15, 2, 2)));
        noteProcesses(packet, 18, packet.u8(16));
        noteProcesses(packet, 18 + std::size_t{162} * packet.u8(16), packet.u8(17));
        break;
    case 0x7135: kinds["networks"].insert(packet.u8(15) << 16 | packet.u8(16) << 8 | packet.u8(17)); break;
    case 0x7150: noteEquivalentNetworks(packet); break;
    case kCellMonitorCode:
        noteCellMonitor(*propertyListFromData(packet.from(13).bytes()).value->array());
        break;
    case kPDPContextsCode: {
        const auto contexts = propertyListFromData(packet.from(13).bytes()).value->array();
        kinds["second context is active"].insert(
            (*(*contexts)[1].dictionary())["State"] == Value("Active") ? 1 : 0);
        break;
    }
    default: noteGSM(code, packet); break;
    }
    _lastCode = code;
}

void GSMDrive::noteGSM(LogCode code, const PacketReader& packet)
{
    switch (code) {
    case 0x5137:
        EXPECT_EQ(_lastCode, 0x51FFU);
        note("GSM level", -packet.u8(15));
        note("C1", packet.u32(16));
        note("GSM neighbours", packet.u8(28));
        for (std::size_t i = 0; i < packet.u8(28); ++i) {
            note("GSM neighbour level", -packet.u8(31 + 14 * i));
            EXPECT_EQ(packet.s32(32 + 14 * i), 104 - packet.u8(31 + 14 * i));
        }
        EXPECT_EQ(packet.size(), 29U + 14 * packet.u8(28));
        break;
    case 0x51FF:
        note("decoded neighbours", packet.u8(14));
        for (std::size_t i = 0; i < packet.u8(14); ++i)
            note("BSIC", packet.u8(17 + 4 * i));
        break;
    case 0x51F8:
        _allocation.clear();
        for (std::size_t i = 0; i < packet.u8(14); ++i)
            _allocation.insert(packet.u16(15 + 2 * i));
        note("hopping carriers", static_cast<double>(_allocation.size()));
        note("hopping carrier", *_allocation.begin());
        note("hopping carrier", *_allocation.rbegin());
        break;
    case 0x5076: EXPECT_TRUE(_allocation.contains(packet.u16(13))) << packet.u16(13); break;
    default: break;
    }
}

void GSMDrive::noteSearcher(const PacketReader& packet)
{
    const std::size_t n = packet.u8(15);
    const double rssi = (packet.s16(13) + 512) / 10.0 - 106;
    int active = 0;
    for (std::size_t i = 0; i < n; ++i) {
        const std::size_t cell = 16 + 15 * i;
        const std::size_t ecIo = 16 + 15 * n + 44 * i + 32;
        note("scrambling code", packet.bits(cell + 7, 0, 13));
        active += packet.bits(cell + 7, 13, 3) == 0 ? 1 : 0;
        std::size_t first = 0;
        while (first < 2 && packet.u32(ecIo + 4 * first) == 0)
            ++first;
        const double ratio = 10 * std::log10(packet.u32(ecIo + 4 * first) / 524288.0);
        note("Ec/Io", ratio);
        note("RSCP", rssi + ratio);
    }
    note("searched cells", static_cast<double>(n));
    note("active cells", active);
    EXPECT_EQ(active == 0, n == 0);
}

void GSMDrive::noteRanking(const PacketReader& packet)
{
    const std::size_t u = packet.u8(13);
    const std::size_t g = packet.u8(14);
    EXPECT_TRUE(u == 0 || g == 0); // the lists share their place
    note("ranked UMTS cells", static_cast<double>(u));
    note("ranked GSM cells", static_cast<double>(g));
    for (std::size_t i = 0; i < u; ++i) {
        const std::size_t record = 15 + 10 * i;
        note("UARFCN", packet.u16(record));
        note("ranked RSCP", static_cast<std::int8_t>(packet.u8(record + 4)) - 21);
        note("ranked Ec/No", static_cast<std::int8_t>(packet.u8(record + 7)) * 0.5);
    }
    for (std::size_t i = 0; i < g; ++i)
        note("ranked GSM level", static_cast<std::int8_t>(packet.u8(19 + 7 * i)));
}

void GSMDrive::noteTransmitPower(const PacketReader& packet)
{
    int told = 0;
    for (std::size_t i = 0; i < packet.u8(14); ++i) {
        const int power = packet.s16(20 + 14 * i);
        if (power != 0) {
            note("transmit power", (power + 512) / 10.0 - 70);
            ++told;
        }
    }
    EXPECT_GT(told, 0); // there is no average of none
}

void GSMDrive::noteEquivalentNetworks(const PacketReader& packet)
{
    for (std::size_t i = 0; i < packet.u8(16); ++i) {
        const auto at = [&](std::size_t place) { return static_cast<int>(packet.u8(17 + 3 * i + place)); };
        const int mcc = 100 * at(0) + 10 * at(2) + at(4);
        const int mnc = 100 * at(1) + 10 * at(3) + at(5);
        kinds["equivalent network"].insert(mcc * 1000 + mnc);
    }
}

void GSMDrive::noteProcesses(const PacketReader& packet, std::size_t first, std::size_t count)
{
    for (std::size_t i = 0; i < count; ++i) {
        const std::size_t record = first + 9 * i;
        const std::string name =
            (first == 18 ? "primary " : "secondary ") + std::to_string(packet.u8(record));
        expectGrowth(name + " bits", packet.u32(record + 1));
        expectGrowth(name + " blocks", packet.u16(record + 5));
        EXPECT_LE(packet.u16(record + 7), packet.u16(record + 5));
    }
    note("processes", static_cast<double>(count));
}

void GSMDrive::noteCellMonitor(const Array& cells)
{
    bool isServing = true; // the first one is, alone
    for (const Value& cell : cells) {
        const auto record = cell.dictionary();
        const auto number = [&](const char* key) {
            const auto* value = (*record)[key].integer();
            return value ? *value : 0;
        };
        EXPECT_EQ((*record)["CellType"], Value(isServing ? "Serving" : "Neighbor"));
        const bool isGSM = (*record)["RadioAccessTechnology"] == Value("GSM");
        kinds[isServing ? "serving technologies" : "neighbouring technologies"].insert(isGSM ? 2 : 3);
        const auto level = number(isGSM ? "RSSI" : "RSCP");
        kinds["monitored levels are known"].insert(level != 32767 ? 1 : 0);
        if (level != 32767)
            note(isGSM ? "monitored RSSI" : "monitored RSCP", static_cast<double>(isGSM ? 2 * level : level));
        EXPECT_GT(number(isGSM ? "ARFCN" : "UARFCN"), 0);
        isServing = false;
    }
}

void GSMDrive::expectGrowth(const std::string& counter, std::int64_t value)
{
    EXPECT_GT(value, _counters[counter]) << counter;
    _counters[counter] = value;
}

TEST(GSMTownScenario, IsBelievableAndReachesTheEndsOfItsLists)
{
    GSMDrive drive;
    for (const auto& item : itemsOf(*findScenario("MRL_GSM", "town"), 900s))
        drive.note(item.message);

    drive.expectRanges({{"GSM level", {-110, -75}, {-60, -47}}, {"C1", {0, 20}, {40, 57}},
        {"GSM neighbours", {0, 0}, {32, 32}}, {"GSM neighbour level", {-103, -100}, {-65, -47}},
        {"decoded neighbours", {0, 0}, {12, 32}}, {"BSIC", {0, 7}, {56, 63}},
        {"hopping carriers", {4, 4}, {8, 8}}, {"hopping carrier", {61, 67}, {80, 124}},
        {"scrambling code", {0, 100}, {400, 511}}, {"Ec/Io", {-25, -15}, {-5, 0}},
        {"RSCP", {-116, -100}, {-70, -25}}, {"searched cells", {0, 0}, {20, 32}},
        {"active cells", {0, 0}, {3, 6}}, {"ranked UMTS cells", {0, 0}, {20, 32}},
        {"ranked GSM cells", {0, 0}, {20, 32}}, {"UARFCN", {10563, 10563}, {10588, 10588}},
        {"ranked RSCP", {-112, -105}, {-75, -25}}, {"ranked Ec/No", {-24, -15}, {-7, 0}},
        {"ranked GSM level", {-103, -100}, {-70, -47}}, {"transmit power", {-50, -20}, {-5, 24}},
        {"monitored RSSI", {-110, -98}, {-70, -46}}, {"monitored RSCP", {-115, -105}, {-75, -25}}});

    const std::map<std::string, std::set<int>> kinds{{"RR states", {0, 3, 5, 6, 7, 9, 11, 14, 18}},
        {"modes", {0, 1}}, {"DTX", {0, 1}}, {"SI13 positions", {0, 1}}, {"T3192", {0, 1, 2, 3, 4, 5, 6, 7}},
        {"GMM states", {0, 1, 2, 3, 4, 5, 6}}, {"MM states", {0, 3, 6, 7, 9, 10, 13, 14, 19}},
        {"updates", {0, 1, 3}}, {"registrations", {1, 2, 3, 4, 5, 6}}, {"selections", {0, 1, 2}},
        {"services", {0, 1, 3, 4}}, {"networks", {0x00F110, 0x990901}}, {"equivalent networks", {0, 1, 3}},
        {"equivalent network", {1199, 999100, 1901}}, {"RRC states", {0, 1, 2, 3, 4, 5}},
        {"ciphering", {0, 1}}, {"carriers", {0, 1, 2}}, {"primary processes", {0, 8, 16}},
        {"secondary processes", {0, 8}}, {"transport channels", {1, 3}}, {"second context is active", {0, 1}},
        {"serving technologies", {2, 3}}, {"neighbouring technologies", {2, 3}},
        {"monitored levels are known", {0, 1}}};
    EXPECT_EQ(drive.kinds, kinds);
}

} // namespace
} // namespace orvex::korat
