#include "CaptureReader.h"

#include "CaptureBytes.h"
#include "TemporaryFile.h"

#include <archive.h>
#include <archive_entry.h>

#include <gtest/gtest.h>

namespace orvex::test {
namespace {

enum class Filter { gzip, xz };

Bytes compressed(const Bytes& bytes, Filter filter)
{
    Bytes result(bytes.size() + 65'536);
    std::size_t length = 0;
    archive* writer = archive_write_new();
    filter == Filter::gzip ? archive_write_add_filter_gzip(writer) : archive_write_add_filter_xz(writer);
    archive_write_set_format_raw(writer);
    archive_write_set_bytes_in_last_block(writer, 1);
    archive_write_open_memory(writer, result.data(), result.size(), &length);
    archive_entry* entry = archive_entry_new();
    archive_entry_set_filetype(entry, AE_IFREG);
    archive_write_header(writer, entry);
    archive_write_data(writer, bytes.data(), bytes.size());
    archive_write_close(writer);
    archive_entry_free(entry);
    archive_write_free(writer);
    result.resize(length);
    return result;
}

struct Content {
    std::vector<Bytes> messages;
    std::string error; // without the path
};

Content contentOf(const std::string& path)
{
    Content content;
    const auto reader = CaptureReader::open(path);
    while (reader->next() == CaptureReader::Status::message)
        content.messages.emplace_back(reader->message().begin(), reader->message().end());
    if (!reader->error().empty())
        content.error = reader->error().substr(path.size());
    return content;
}

// Longer than what is read ahead to tell the kind of file.
Bytes longPcap()
{
    PcapFile file;
    for (std::size_t i = 0; i < 3'000; ++i)
        file.add(Bytes(1 + i % 1'500, static_cast<std::uint8_t>(i * i)));
    return file.bytes;
}

Bytes longDlf()
{
    Bytes dlf;
    for (std::size_t i = 0; dlf.size() < std::size_t{3} << 20; ++i)
        dlf += dlfRecord(12 + i % 1'000, static_cast<std::uint8_t>(i), 0);
    return dlf += Bytes(5); // makes no record
}

TEST(CompressedCapture, HoldsWhatTheFileHeldBefore)
{
    const TemporaryFile file;
    for (const Bytes& plain : {longPcap(), longDlf(), PcapFile().bytes, Bytes(100, 'x'), Bytes()}) {
        const Content expected = contentOf(writeFile(file.path, plain));
        for (const Filter filter : {Filter::gzip, Filter::xz}) {
            const Content content = contentOf(writeFile(file.path, compressed(plain, filter)));
            EXPECT_TRUE(content.messages == expected.messages) << plain.size();
            EXPECT_EQ(content.error, expected.error);
        }
    }
    const Bytes plain = longPcap();
    const auto middle = plain.begin() + 100'000;
    Bytes members = compressed(Bytes(plain.begin(), middle), Filter::gzip);
    members += compressed(Bytes(middle, plain.end()), Filter::gzip);
    EXPECT_EQ(contentOf(writeFile(file.path, members)).messages.size(), 3'000U);
}

TEST(CompressedCapture, GivesWhatIsWholeBeforeItBreaks)
{
    const TemporaryFile file;
    for (const Filter filter : {Filter::gzip, Filter::xz}) {
        for (const Bytes& plain : {longPcap(), longDlf()}) {
            Bytes bytes = compressed(plain, filter);
            const std::size_t all = contentOf(writeFile(file.path, bytes)).messages.size();
            bytes.resize(bytes.size() * 3 / 4);
            const Content cut = contentOf(writeFile(file.path, bytes));
            EXPECT_NE(cut.error, "");
            EXPECT_EQ(cut.error.find("dump file"), std::string::npos) << "the pcap reader has no reason";
            EXPECT_GT(cut.messages.size(), filter == Filter::gzip ? all / 2 : 0);
            EXPECT_LT(cut.messages.size(), all);
            bytes.resize(8);
            EXPECT_NE(contentOf(writeFile(file.path, bytes)).error, "");
        }
    }
}

} // namespace
} // namespace orvex::test
