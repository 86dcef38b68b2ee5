#include "DlfRecords.h"
#include "ReadAhead.h"

#include "ByteText.h"
#include "CaptureBytes.h"
#include "CaseLines.h"
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
    const TemporaryFile file;
    Bytes pcap;
    for (const std::string& line : caseLines("wire/captures.txt")) {
        const auto [capture, expected] = divided(line, " -> ");
        const Bytes bytes = bytesOfWords(divided(capture, ": ").second);
        const std::string content = contentOf(writeFile(file.path, bytes));
        EXPECT_EQ(content.empty() ? "(nothing)" : content, expected) << line;
        if (line.starts_with("microseconds"))
            pcap = bytes;
    }
    for (std::size_t cut = 1; cut < 7 + 16; ++cut) {
        pcap.pop_back();
        EXPECT_THAT(contentOf(writeFile(file.path, pcap)), testing::StartsWith("654321 us: 5; truncated"));
    }
    const auto reader = CaptureReader::open(writeFile(file.path, dlfRecord(20, 1)));
    reader->next();
    EXPECT_EQ(reader->message().front(), 1) << "a log type before the record";
    EXPECT_EQ(Bytes(reader->message().begin() + 1, reader->message().end()), dlfRecord(20, 1));
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
    const Bytes dlf = longDlf();
    std::string expected = "0 us:";
    DlfRecords records(dlf);
    while (const auto record = records.next())
        expected += ' ' + std::to_string(record->bytes.size() + 1);
    expected += "; " + std::to_string(records.skippedBytes()) + " bytes that make no record were skipped";
    const TemporaryFile file;
    EXPECT_TRUE(contentOf(writeFile(file.path, dlf)) == expected) << expected.size();
    EXPECT_GT(expected.size(), 5'000U);
    ReadAhead left(CaptureReader::open(file.path)); // ends while there is more to read
    EXPECT_EQ(left.next(), CaptureReader::Status::message);
}

} // namespace
} // namespace orvex
