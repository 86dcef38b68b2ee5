#include "OpenedFile.h"

#include "Captures.h"
#include "FixedClock.h"
#include "TemporaryFile.h"

#include "FileStorage.h"
#include "Snapshot.h"

#include <gmock/gmock.h>

#include <fstream>

namespace orvex::test {
namespace {

struct OpenedFileTest : testing::Test {
    OpenedFile open(const std::string& path) const
    {
        return openFile(path, {.resources = resources, .clock = clock, .buildVersion = {}});
    }

    const FileResources resources{ORVEX_RESOURCES};
    const FixedClock clock{};
};

TEST_F(OpenedFileTest, GuessesTheTechnologyOfEachCapture)
{
    for (const char* technology : kTechnologies) {
        const OpenedFile opened = open(capturePath(technology));
        ASSERT_TRUE(opened.tree) << opened.error;
        EXPECT_THAT(
            opened.status, testing::MatchesRegex(std::string("[1-9][0-9]+ messages of ") + technology));
        EXPECT_TRUE(opened.tree->childNodes());
    }
}

TEST_F(OpenedFileTest, OpensASnapshotAndRefusesTheRest)
{
    const TemporaryFile file;
    writeSnapshot({"2024-03-05 14:07:09 +0000", Array::make(), "words"}, file.path);
    const OpenedFile opened = open(file.path);
    ASSERT_TRUE(opened.tree) << opened.error;
    EXPECT_EQ(opened.status, "Saved 2024-03-05 14:07:09 +0000");

    const std::pair<std::string, const char*> cases[] = {
        {"plain text", ": neither a pcap nor a DLF file"},
        {std::string("\xd4\xc3\xb2\xa1\2\0\4\0\0\0\0\0\0\0\0\0\xff\xff\0\0\x93\0\0\0", 24),
            ": a capture without a message"},
        {std::string("\x10\0\x34\x12", 4) + std::string(12, '\0'),
            ": its messages are of no technology that Orvex knows"},
    };
    for (const auto& [content, error] : cases) {
        std::ofstream(file.path, std::ios::binary) << content;
        EXPECT_EQ(open(file.path).error, file.path + error);
    }
}

} // namespace
} // namespace orvex::test
