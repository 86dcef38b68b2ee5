#include "DlfRecords.h"
#include "MTLDLFAddVersionReport.h"
#include "ReadAhead.h"

#include "CaptureBytes.h"
#include "TemporaryFile.h"

#include <gmock/gmock.h>

#include <filesystem>

#include <sys/stat.h>

namespace orvex {
namespace {

using namespace test;
using namespace std::chrono_literals;

// The time of the first message, the lengths of all, and how it ended.
std::string contentOf(const std::string& path, std::unique_ptr<CaptureReader> reader)
{
    std::string result;
    auto status = reader->next();
    for (; status == CaptureReader::Status::message; status = reader->next()) {
        if (result.empty())
            result = std::to_string(reader->time().count() % 1'000'000) + " us:";
        result += ' ' + std::to_string(reader->message().size());
    }
    if (status == CaptureReader::Status::broken)
        result += "; " + reader->error().substr(std::min(reader->error().size(), path.size() + 2));
    if (const std::string omissions = reader->omissions(); !omissions.empty())
        result += "; " + omissions;
    return result;
}

// The same whether it is read ahead or not.
std::string contentOf(const std::string& path)
{
    std::string content = contentOf(path, CaptureReader::open(path));
    EXPECT_EQ(contentOf(path, std::make_unique<ReadAhead>(CaptureReader::open(path))), content);
    return content;
}

TEST(CaptureReader, GivesWhatIsWholeAndSaysWhatIsNot)
{
    const Bytes five(5, 7);
    const Bytes seven(7, 7);
    const auto two = [&](PcapFile file) { return file.add(five).add(seven).bytes; };
    const Bytes near = dlfRecord(20, 1);
    Bytes far = near;
    far[11] = 0x80;
    Bytes version(kMTLDLFVersionReportLength); // by which alone its file is known
    version[0] = 161;
    version[2] = 0xFD;
    version[3] = 0x1F;
    const auto joined = [](Bytes front, std::initializer_list<Bytes> others) {
        for (const Bytes& other : others)
            front += other;
        return front;
    };
    const char* none = "; neither a pcap nor a DLF file";
    const Bytes zeros(500);
    const std::string skipped = "; 500 bytes that make no record were skipped";
    const struct {
        const char* name;
        Bytes bytes;
        std::string content;
    } cases[] = {
        {"microseconds", two(PcapFile()), "654321 us: 5 7"},
        {"nanoseconds", two(PcapFile(147, false, 0xA1B23C4D)), "654 us: 5 7"},
        {"big-endian, nanoseconds", two(PcapFile(147, true, 0xA1B23C4D)), "654 us: 5 7"},
        {"of nothing", PcapFile().bytes, ""},
        {"another link type", two(PcapFile(1)), "; its link type is 1; log messages have 147 (USER0)"},
        {"partial packet", PcapFile().add(five).add(seven, 1).add(five).bytes,
            "654321 us: 5 5; 1 packets hold only the beginning of their message and were left out"},
        {"DLF", joined(near, {dlfRecord(30, 2)}), "1 us: 21 31"},
        {"DLF, cut", joined(near, {dlfRecord(30, 2), {20, 0, 0xC1, 0xB0}}),
            "1 us: 21 31; 4 bytes that make no record were skipped"},
        {"DLF, times far from each other", joined(near, {far, near, far}), "1 us: 21 21 21 21"},
        {"DLF, most times near", joined(far, {near, near, zeros}), "1 us: 21 21 21" + skipped},
        {"DLF of a snapshot", joined(version, {zeros}), "0 us: 162" + skipped},
        {"one record and no more", joined(near, {zeros}), none},
        {"records by chance", joined(near, {far, zeros}), none},
        {"another file", Bytes(100, 'x'), none},
        {"zero bytes", {}, none},
    };
    const TemporaryFile file;
    for (const auto& [name, bytes, content] : cases)
        EXPECT_EQ(contentOf(writeFile(file.path, bytes)), content) << name;
    for (std::size_t cut = 1; cut < 7 + 16; ++cut) {
        const Bytes whole = two(PcapFile());
        const std::string content = contentOf(
            writeFile(file.path, Bytes(whole.begin(), whole.end() - static_cast<std::ptrdiff_t>(cut))));
        EXPECT_EQ(content.find("654321 us: 5; truncated"), 0U) << content;
    }
    const auto reader = CaptureReader::open(writeFile(file.path, near));
    reader->next();
    EXPECT_EQ(Bytes(reader->message().begin(), reader->message().end()), joined({1}, {near}));
    EXPECT_EQ(contentOf("/no/such/capture"), "; No such file or directory");
    EXPECT_EQ(contentOf("/"), "; Is a directory");
    EXPECT_EQ(contentOf("/dev/zero"), "; not a regular file");
    std::filesystem::remove(file.path);
    ASSERT_EQ(mkfifo(file.path.c_str(), 0600), 0);
    EXPECT_EQ(contentOf(file.path), "; not a regular file") << "nobody waits for a writer";
}

// Read window by window it gives the records that it gives as a whole.
TEST(CaptureReader, LongDlfIsReadAsAStream)
{
    Bytes dlf;
    for (std::size_t i = 0; dlf.size() < std::size_t{3} << 20; ++i) {
        dlf += dlfRecord(i % 97 == 0 ? 65'535 : 12 + i % 1'000, static_cast<std::uint8_t>(i), 0);
        if (i % 50 == 0)
            dlf += Bytes(i); // makes no record
    }
    dlf += Bytes(std::size_t{2} << 20); // longer than a window
    dlf += dlfRecord(40, 1);
    dlf += dlfRecord(50, 2);
    std::string expected = "0 us:";
    DlfRecords records(dlf);
    while (const auto record = records.next())
        expected += ' ' + std::to_string(record->bytes.size() + 1);
    expected += "; " + std::to_string(records.skippedBytes()) + " bytes that make no record were skipped";
    const TemporaryFile file;
    EXPECT_TRUE(contentOf(writeFile(file.path, dlf)) == expected) << expected.size();
    EXPECT_GT(expected.size(), 5'000U);
}

TEST(ReadAhead, KeepsLongCapturesInOrderAndMayBeLeft)
{
    PcapFile capture;
    for (std::size_t i = 0; i < 3'000; ++i)
        capture.add(Bytes(1 + i % 700, static_cast<std::uint8_t>(i)));
    const TemporaryFile file;
    capture.bytes.pop_back();
    EXPECT_NE(contentOf(writeFile(file.path, capture.bytes)).find("; truncated"), std::string::npos);
    ReadAhead reader(CaptureReader::open(file.path));
    for (std::size_t i = 0; i < 2'000; ++i) {
        ASSERT_EQ(reader.next(), CaptureReader::Status::message);
        ASSERT_EQ(Bytes(reader.message().begin(), reader.message().end()),
            Bytes(1 + i % 700, static_cast<std::uint8_t>(i)));
    }
}

} // namespace
} // namespace orvex
