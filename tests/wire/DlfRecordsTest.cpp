#include "DlfRecords.h"
#include "MTLDLFAddVersionReport.h"

#include "CaptureBytes.h"
#include "Captures.h"

#include <gmock/gmock.h>

namespace orvex {
namespace {

using namespace test;

// A record behind its log type and, before that, a prefix or its second byte; behind nothing, where the first
// byte of an interval was dropped.
struct Piece {
    Bytes front;
    Bytes record;

    bool operator==(const Piece&) const = default;
};
using Pieces = std::vector<Piece>;

Bytes versionReport()
{
    Bytes report(kMTLDLFVersionReportLength);
    std::uint32_t written = 0;
    MTLDLFAddVersionReport(
        report.data(), kMTLDLFVersionReportLength, written, 1, 1, "Orvex", "NAME", "DATE", {1, 60, 0});
    return report;
}

// Without spare capacity, in which reads beyond the end would go unseen.
Bytes joined(const Pieces& pieces)
{
    Bytes result;
    for (const Piece& piece : pieces) {
        result += piece.front;
        result += piece.record;
    }
    result.shrink_to_fit();
    return result;
}

// All records, with their log type alone in front. That they and what was skipped make up the file is what
// the replay of the fuzzer's corpus checks.
Pieces recordsOf(const Bytes& dlf, std::size_t& skipped)
{
    DlfRecords records(dlf);
    Pieces result;
    while (const auto record = records.next()) {
        result.push_back({{}, Bytes(record->bytes.begin(), record->bytes.end())});
        if (record->logType)
            result.back().front = {*record->logType};
    }
    skipped = records.skippedBytes();
    return result;
}

void expectFound(Pieces pieces)
{
    std::size_t skipped = 0;
    const auto found = recordsOf(joined(pieces), skipped);
    for (Piece& piece : pieces)
        piece.front.erase(piece.front.begin(), piece.front.end() - (piece.front.empty() ? 0 : 1));
    EXPECT_TRUE(found == pieces);
    EXPECT_EQ(skipped, 0U);
}

TEST(DlfRecords, AreFoundInEachForm)
{
    const Bytes version = versionReport();
    const Bytes a = dlfRecord(12, 1);
    const Bytes b = dlfRecord(40, 2);
    // Lengths that look like log types, and payloads that look like records.
    const Bytes odd[] = {dlfRecord(257, 1), dlfRecord(511, 2), dlfRecord(255, 3), dlfRecord(513, 4)};
    const Bytes nested[] = {dlfRecord(257, 1, 1), dlfRecord(257, 2, 1), dlfRecord(1281, 2, 1)};
    const std::pair<const char*, Pieces> cases[] = {
        {"clean", {{{}, a}, {{}, b}, {{}, a}}},
        {"clean, odd", {{{}, odd[0]}, {{}, odd[1]}, {{}, odd[2]}}},
        {"intervals", {{{}, version}, {{}, a}, {{}, b}, {{1}, b}, {{255}, a}, {{}, b}}},
        {"prefixes, the second byte of which looks like something",
            {{{}, version}, {{}, a}, {{0x81, 0, 1}, b}, {{0x81, 1, 1}, a}, {{0x81, 0x81, 255}, b},
                {{0x81, 255, 1}, a}}},
        {"intervals that begin within a prefix",
            {{{}, version}, {{7, 1}, a}, {{1, 255}, b}, {{0x81, 1}, a}, {{1}, b}}},
        {"snapshot, odd", {{{}, version}, {{}, odd[0]}, {{1}, odd[1]}, {{}, odd[2]}, {{255}, odd[3]}}},
        {"last one nested", {{{}, version}, {{}, a}, {{1}, nested[2]}}},
        {"nested", {{{}, version}, {{}, nested[0]}, {{}, nested[1]}}},
    };
    for (const auto& [name, pieces] : cases) {
        SCOPED_TRACE(name);
        expectFound(pieces);
    }
}

TEST(DlfRecords, AreFoundAgainBehindALengthThatLies)
{
    for (const unsigned lie : {0U, 1U, 11U, 65535U}) { // the last one leads beyond the end
        Bytes wrong = dlfRecord(30, 2);
        wrong[0] = static_cast<std::uint8_t>(lie);
        wrong[1] = static_cast<std::uint8_t>(lie >> 8);
        Pieces pieces = {{{}, dlfRecord(40, 1)}, {{}, wrong}, {{}, dlfRecord(20, 3)}, {{}, dlfRecord(25, 4)}};
        std::size_t skipped = 0;
        const auto found = recordsOf(joined(pieces), skipped);
        pieces.erase(pieces.begin() + 1);
        EXPECT_TRUE(found == pieces) << lie;
        EXPECT_EQ(skipped, 30U);
    }
}

TEST(DlfRecords, OfASnapshotGiveEveryMessageOfEveryCaptureBack)
{
    // No prefixes, all the same one, some of any second byte, and some that look like log types.
    const auto prefixOf = [](int kind, std::size_t i) {
        const std::size_t seconds[] = {0, 0, i, i % 2 ? 255U : 1U};
        const bool hasNone = kind == 0 || (kind == 2 && i % 3 != 0);
        return hasNone ? Bytes() : Bytes{0x81, static_cast<std::uint8_t>(seconds[kind])};
    };
    for (const char* technology : {"MRL_GSM", "MRL_CDMA", "MRL_LTE", "MRL_UTRAN2"}) {
        const std::vector<Bytes> drive = captureOf(technology);
        for (int kind = 0; kind < 4; ++kind) {
            for (const std::size_t perInterval : {1U, 2U, 7U, 60U}) {
                SCOPED_TRACE(technology + std::to_string(kind) + std::to_string(perInterval));
                Pieces pieces{{{}, versionReport()}};
                for (std::size_t i = 0; i < drive.size(); ++i) {
                    Bytes front = prefixOf(kind, i);
                    front.push_back(drive[i][0]);
                    if (i % perInterval == 0)
                        front.erase(front.begin());
                    pieces.push_back({front, Bytes(drive[i].begin() + 1, drive[i].end())});
                }
                expectFound(pieces);
            }
        }
    }
}

} // namespace
} // namespace orvex
