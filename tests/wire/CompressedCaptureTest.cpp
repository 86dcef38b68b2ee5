#include "CaptureReader.h"

#include "CaptureBytes.h"
#include "PcapWriter.h"
#include "TemporaryFile.h"

#include <gtest/gtest.h>

#include <cstdlib>
#include <filesystem>
#include <iterator>

namespace orvex::test {
namespace {

Bytes bytesIn(const std::string& path)
{
    std::ifstream file(path, std::ios::binary);
    return {std::istreambuf_iterator<char>(file), {}};
}

// How many messages a capture has up to where it ends or breaks.
std::size_t messagesIn(CaptureReader& reader)
{
    std::size_t count = 0;
    while (reader.next() == CaptureReader::Status::message)
        ++count;
    return count;
}

// Longer than what is read ahead to tell the kind of file.
void writeLongPcap(const std::string& path)
{
    PcapWriter file(path);
    for (std::size_t i = 0; i < 3'000; ++i)
        file.write(Bytes(1 + i % 1'500, static_cast<std::uint8_t>(i * i)), {});
}

void writeLongDlf(const std::string& path)
{
    writeFile(path, longDlf());
}

// What is whole is read as from the file itself: tests/tools/transcripts/decode.txt.
TEST(CompressedCapture, GivesWhatIsWholeBeforeItBreaks)
{
    const TemporaryFile file;
    for (const std::string compressor : {"gzip", "xz"}) {
        for (const auto& write : {writeLongPcap, writeLongDlf}) {
            write(file.path);
            const auto all = messagesIn(*CaptureReader::open(file.path));
            const auto compress = compressor + " -c " + file.path + " > " + file.path + ".packed";
            ASSERT_EQ(std::system(compress.c_str()), 0); // NOLINT(cert-env33-c,concurrency-mt-unsafe)
            Bytes bytes = bytesIn(file.path + ".packed");
            std::filesystem::remove(file.path + ".packed");
            bytes.resize(bytes.size() * 3 / 4);
            const auto cut = CaptureReader::open(writeFile(file.path, bytes));
            const auto whole = messagesIn(*cut);
            EXPECT_NE(cut->error(), "");
            EXPECT_EQ(cut->error().find("dump file"), std::string::npos) << "the pcap reader has no reason";
            EXPECT_GT(whole, compressor == "gzip" ? all / 2 : 0);
            EXPECT_LT(whole, all);
            bytes.resize(8);
            const auto start = CaptureReader::open(writeFile(file.path, bytes));
            EXPECT_EQ(messagesIn(*start), 0U);
            EXPECT_NE(start->error(), "");
        }
    }
}

} // namespace
} // namespace orvex::test
