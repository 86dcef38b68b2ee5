#include "UTRAN/CCTRCHSIRMeasurement.h"
#include "UTRAN/GSMNeighbhorMeasurements.h"
#include "UTRAN/LogCode_0xD00C.h"
#include "UTRAN/LogCode_0xD00E.h"
#include "UTRAN/TRCHBLERMeasurement.h"
#include "UTRAN/UTRANNeighbhorMeasurements.h"

#include "BitStringWriter.h"
#include "LogPackets.h"
#include "SectionFixture.h"

namespace orvex::test {
namespace {

using Lines = std::vector<std::string>;

// 0xD00A with this byte 16 and these records from byte 168 on.
Bytes neighborPacket(std::uint8_t countByte, const std::vector<Bytes>& records)
{
    Bytes bytes = packet(0xD00A, {0, 0, 0, countByte});
    bytes.resize(168, 0xEE);
    for (const Bytes& record : records)
        bytes.insert(bytes.end(), record.begin(), record.end());
    return bytes;
}

TEST(UTRANNeighbhorMeasurements, ReadsEachFieldFromItsOwnBits)
{
    const Bytes plain = BitStringWriter()
                            .put(0, 14, 10054)
                            .put(14, 7, 99)
                            .put(21, 8, 128)
                            .put(29, 2, 1)
                            .put(32, 96, 0)
                            .bytes(16);
    const Bytes full(16, 0xFF);
    SectionFixture<UTRANNeighbhorMeasurements> fixture;
    EXPECT_EQ(fixture.listAfter(neighborPacket(2 << 1 | 1, {plain, full}), 0xD00A),
        (std::vector<RowTexts>{
            {{"UARFCN", "10054"}, {"Cell ID", "99"}, {"Filter RSCP", "0.500000"}, {"Status", "MSET"},
                {"inJDCS", "FALSE"}},
            {{"UARFCN", "16383"}, {"Cell ID", "127"}, {"Filter RSCP", "0.996094"}, {"inJDCS", "TRUE"}},
        }))
        << "the fourth set has no name and no row";
    EXPECT_EQ(fixture.log.take(), Lines{"<4>NeighbhorMeasurements List"});

    for (const auto& [set, name] : {std::pair{0U, "ASET"}, {2U, "DSET"}}) {
        const Bytes record = BitStringWriter().put(29, 2, set).bytes(16);
        EXPECT_EQ(fixture.listAfter(neighborPacket(1 << 1, {record}), 0xD00A),
            (std::vector<RowTexts>{{{"UARFCN", "0"}, {"Cell ID", "0"}, {"Filter RSCP", "0.000000"},
                {"Status", name}, {"inJDCS", "FALSE"}}}));
    }
}

TEST(UTRANNeighbhorMeasurements, ShowsTheRecordsThatFit)
{
    const Bytes record(16, 0);
    Bytes cut = neighborPacket(2 << 1, {record, record});
    cut.pop_back();
    const struct {
        const char* name;
        Bytes packet;
        std::size_t records;
    } cases[] = {
        {"bit 0 is not the count's", neighborPacket(0x01, {record}), 0},
        {"all that is counted", neighborPacket(0xFE, std::vector<Bytes>(127, record)), 127},
        {"more than fit", neighborPacket(0xFE, {record}), 1},
        {"the last one cut", cut, 1},
        {"packet ends before the records", packet(0xD00A, {0, 0, 0, 0xFE, 0, 0, 0, 0}), 0},
    };
    SectionFixture<UTRANNeighbhorMeasurements> fixture;
    for (const auto& [name, bytes, records] : cases)
        EXPECT_EQ(fixture.listAfter(bytes, 0xD00A).size(), records) << name;
}

TEST(GSMNeighbhorMeasurements, EmptiesItsListAndNeverFillsIt)
{
    SectionFixture<GSMNeighbhorMeasurements> fixture;
    Bytes bytes = packet(0xD00E, {0, 0, 0, 3});
    bytes.resize(17 + 24, 1);
    EXPECT_EQ(fixture.listAfter(bytes, 0xD00E), std::vector<RowTexts>{});
    EXPECT_EQ(fixture.log.take(), Lines{"<4>GSM Neighbor Cell List"});
}

TEST(LogCode_0xD00E, ReadsEachFieldFromItsOwnBytes)
{
    const Bytes bytes = packet(0xD00E, {0, 0, 0, 1, 0x34, 0x92, 0x05, 0x06, 0x07, 0x02, 0xA6, 0xFF});
    const auto neighbors = LogCode_0xD00E(bytes).neighbors();
    const auto neighbor = neighbors[0];
    EXPECT_EQ(neighbor.cellIdentity(), 0x1234);
    EXPECT_EQ(neighbor.bandIndicator(), 0);
    EXPECT_EQ(neighbor.bsicValid(), 1);
    EXPECT_EQ(neighbor.ncc(), 5);
    EXPECT_EQ(neighbor.bcc(), 6);
    EXPECT_EQ(neighbor.arfcn(), 519);
    EXPECT_EQ(neighbor.rssi(), -90);
    EXPECT_THROW(neighbors[1], ArrayOutOfBoundsException);
    const Bytes flags = packet(0xD00E, {0, 0, 0, 1, 0xFF, 0x7F, 0, 0, 0, 0, 0, 0});
    EXPECT_EQ(LogCode_0xD00E(flags).neighbors()[0].bandIndicator(), 1);
    EXPECT_EQ(LogCode_0xD00E(flags).neighbors()[0].bsicValid(), 0);
    EXPECT_EQ(LogCode_0xD00E(flags).neighbors()[0].cellIdentity(), 16383);
}

// 0xD00C of t transport channels and k composite channels, both numbered from 1, whatever fits `length`.
Bytes channelPacket(unsigned t, unsigned k, std::size_t length)
{
    Bytes bytes = packet(0xD00C, {0});
    const Bytes counts = BitStringWriter().put(0, 6, 63).put(6, 6, t).put(12, 4, k).bytes(2);
    bytes.insert(bytes.end(), counts.begin(), counts.end());
    bytes.resize(std::max<std::size_t>(289 + 34 * t + 8 * k, 17));
    for (unsigned i = 0; i < t; ++i) {
        bytes[17 + 2 * i] = static_cast<std::uint8_t>(i + 1);
        bytes[18 + 2 * i] = 200;
    }
    for (unsigned j = 0; j < k; ++j) {
        for (unsigned i = 0; i < 8; ++i)
            bytes[289 + 34 * t + 8 * j + i] = static_cast<std::uint8_t>(10 * (j + 1) + i);
    }
    bytes.resize(length);
    return bytes;
}

TEST(TransportChannelMeasurements, ReadTheirRecordsFromTheirOwnPlaces)
{
    SectionFixture<TRCHBLERMeasurement> transport;
    const Bytes bytes = channelPacket(1, 1, 331);
    EXPECT_EQ(bytes[323], 10) << "where the composite channel of this packet begins";
    EXPECT_EQ(transport.listAfter(bytes, 0xD00C),
        (std::vector<RowTexts>{{{"TRCH ID", "1"}, {"TRCH BLER Measurement", "200"}}}));
    EXPECT_EQ(transport.log.take(), Lines{"<5>TRCH BLER Measurement"});

    SectionFixture<CCTRCHSIRMeasurement> composite;
    EXPECT_EQ(composite.listAfter(bytes, 0xD00C),
        (std::vector<RowTexts>{{{"CCTRCH ID", "10"}, {"TSNUM", "11"}, {"SIR", "[12, 13, 14, 15, 16, 17]"}}}));
    EXPECT_EQ(composite.log.take(), Lines{"<4>CCTRCH SIR Measurement"});
}

TEST(TransportChannelMeasurements, ShowTheRecordsThatFit)
{
    const std::size_t whole = 289 + 34 * 63 + 8 * 15;
    const struct {
        const char* name;
        Bytes packet;
        std::size_t transport;
        std::size_t composite;
    } cases[] = {
        {"none", channelPacket(0, 0, 17), 0, 0},
        {"all", channelPacket(63, 15, whole), 63, 15},
        {"the last composite channel cut", channelPacket(63, 15, whole - 1), 63, 14},
        {"transport channels cut in the middle", channelPacket(63, 15, 17 + 2 * 4 + 1), 4, 0},
    };
    SectionFixture<TRCHBLERMeasurement> transport;
    SectionFixture<CCTRCHSIRMeasurement> composite;
    for (const auto& [name, bytes, transportCount, compositeCount] : cases) {
        EXPECT_EQ(transport.listAfter(bytes, 0xD00C).size(), transportCount) << name;
        EXPECT_EQ(composite.listAfter(bytes, 0xD00C).size(), compositeCount) << name;
    }

    const Bytes counted = channelPacket(2, 1, 400);
    const LogCode_0xD00C report(counted);
    EXPECT_THROW(report.transportChannels()[2], ArrayOutOfBoundsException);
    EXPECT_THROW(report.compositeChannels()[1], ArrayOutOfBoundsException);
    EXPECT_THROW(report.compositeChannels()[0].sir(6), ArrayOutOfBoundsException);
}

} // namespace
} // namespace orvex::test
