// What the captures in captures/ show: everything that the screens can.

#include "Captures.h"
#include "Decoding.h"

#include "PacketReader.h"

#include <gtest/gtest.h>

#include <algorithm>
#include <filesystem>
#include <map>
#include <set>

namespace orvex::test {
namespace {

// How many records each list has at most. It starts without any, but for lists of a fixed length.
using Lengths = std::map<std::string, std::pair<std::size_t, std::size_t>>;

const struct {
    const char* technology;
    Lengths lists;
    std::set<std::string> empty; // nothing that the technology can send fills them
} kCaptures[] = {
    {"MRL_GSM",
        {
            {"/Mobility/Equivalent PLMN List", {0, 3}},
            {"/Neighbors/GSM Set", {0, 32}},
            {"/Neighbors/Neighboring Cells", {0, 32}},
            {"/Neighbors/UMTS Set", {0, 44}},
            {"/Packet Data/HSDPA Info/Primary HARQ Process", {0, 16}},
            {"/Packet Data/HSDPA Info/Secondary HARQ Process", {0, 8}},
            {"/Packet Data/PDP Context Info", {0, 2}},
            {"/Serving/Active Set", {0, 2}},
            {"/Serving/BLER/Transport Channels", {0, 3}},
            {"/Serving/Mobile Allocation/ARFCNs", {0, 8}},
        },
        {"/Neighbors/Cell Change Counters", "/Neighbors/Detected Set", "/Neighbors/Monitored Set",
            "/Neighbors/Non-Ranked GSM Set", "/Neighbors/Non-Ranked UMTS Set",
            "/Neighbors/Virtual Active Set", "/Packet Data/Coding Scheme", "/Serving/UMTS RR Measurement"}},
    {"MRL_CDMA", {}, {}},
    {"MRL_LTE",
        {
            {"/Detected Cells", {0, 15}},
            {"/Measured Neighbor Cells", {0, 32}},
            {"/Neighbor Cells List", {0, 32}},
            {"/PDP Context Info", {0, 2}},
            {"/Reselection Candidates List", {0, 9}},
        },
        {}},
    {"MRL_UTRAN2",
        {
            {"/CCTRCH SIR", {0, 15}},
            {"/CCTRCH SIR/SIR", {6, 6}},
            {"/Neighbor Cell List", {0, 32}},
            {"/PDP Context Info", {0, 2}},
            {"/TRCH BLER", {0, 63}},
        },
        {"/GSM Neighbor Cell List"}},
    {"IFX",
        {
            {"/Mobility/Cell Changes", {0, 8}},
            {"/Mobility/Forbidden Networks", {2, 2}},
            {"/Neighbours/GSM", {0, 7}},
            {"/Neighbours/UMTS", {0, 5}},
            {"/Packet Data", {2, 2}},
            {"/Packet Data/Name Servers", {2, 2}},
        },
        {}},
};

// What a capture has shown by now.
struct Seen {
    Lengths lists;
    std::map<std::string, bool> filled; // sections, groups and rows

    void note(const std::string& path, const Value& shown)
    {
        bool& isFilled = filled[path];
        if (const auto rows = shown.dictionary()) {
            isFilled = isFilled || !rows->isEmpty();
            for (const auto& [row, value] : *rows) // those of pilots are numbered
                note(path + "/" + (row.find(';') == std::string::npos ? row : "Pilot"), value);
        } else if (const auto list = shown.array()) {
            isFilled = isFilled || !list->isEmpty();
            auto& [least, most] = lists.try_emplace(path, list->size(), 0).first->second;
            least = std::min(least, list->size());
            most = std::max(most, list->size());
            for (const Value& record : *list)
                note(path, record);
        } else {
            ASSERT_TRUE(shown.string()) << path;
            isFilled = isFilled || (*shown.string() != "" && *shown.string() != "—");
        }
    }
};

TEST(Captures, FillEverySectionEveryRowAndEveryList)
{
    for (const auto& [technology, lists, empty] : kCaptures) {
        SCOPED_TRACE(technology);
        Decoding decoding(technology);
        Seen seen;
        for (const Bytes& message : captureOf(technology)) {
            decoding.feed(message);
            seen.note("", decoding.display());
        }
        std::set<std::string> neverFilled;
        for (const auto& [path, isFilled] : seen.filled) {
            if (!isFilled)
                neverFilled.insert(path);
        }
        EXPECT_EQ(neverFilled, empty);
        for (const std::string& path : empty)
            seen.lists.erase(path);
        EXPECT_EQ(seen.lists, lists);
    }
}

TEST(Captures, AreSmallPcapFilesWhoseTimesGoOn)
{
    std::uintmax_t all = 0;
    for (const char* technology : kTechnologies) {
        SCOPED_TRACE(technology);
        const std::string path = capturePath(technology);
        EXPECT_LE(std::filesystem::file_size(path), 1U << 20);
        all += std::filesystem::file_size(path);
        const auto reader = CaptureReader::open(path); // which refuses other link types
        std::chrono::microseconds first{};
        std::chrono::microseconds last{};
        auto status = reader->next();
        for (; status == CaptureReader::Status::message; status = reader->next()) {
            EXPECT_GE(reader->time(), last);
            last = reader->time();
            first = first.count() ? first : last;
            if (technology == std::string_view("IFX"))
                continue; // its messages have no time of their own
            const PacketReader packet(reader->message());
            EXPECT_EQ(packet.u32(5) | static_cast<std::uint64_t>(packet.u32(9)) << 32,
                static_cast<std::uint64_t>(last.count()));
        }
        EXPECT_EQ(status, CaptureReader::Status::end) << reader->error();
        EXPECT_EQ(reader->omissions(), "");
        EXPECT_NEAR(static_cast<double>((last - first).count()), 120e6, 2e6);
    }
    EXPECT_LE(all, 3U << 20);
}

} // namespace
} // namespace orvex::test
