#include "Snapshot.h"

#include "SnapshotTree.h"

#include <gtest/gtest.h>

#include <filesystem>
#include <fstream>
#include <unistd.h>

namespace orvex::test {
namespace {

class SnapshotTest : public testing::Test {
public:
    SnapshotTest()
    {
        std::string pattern = testing::TempDir() + "snapshotXXXXXX";
        directory = ::mkdtemp(pattern.data());
    }
    ~SnapshotTest() override { std::filesystem::remove_all(directory); }

    std::string directory;
};

Snapshot someSnapshot()
{
    return {"2024-03-05 14:07:09 +0000",
        Array::make({Dictionary::make(
            {{"Description", "Snapshot (x)"}, {"Display", Dictionary::make({{"A", Array::make({"b"})}})},
                {"DisplayState", std::make_shared<Bytes>(Bytes{1, 0, 255})}})}),
        "words"};
}

TEST_F(SnapshotTest, IsReadAsItWasWritten)
{
    const std::string path = snapshotPath(directory, Date{1'709'647'629.9});
    EXPECT_EQ(path, directory + "/OrvexSnapshot-1709647629.orvex");
    const Snapshot written = someSnapshot();
    std::ofstream(path) << std::string(100'000, 'x'); // a longer one, which it takes the place of
    ASSERT_EQ(writeSnapshot(written, path), "");
    const auto [read, error] = readSnapshot(path);
    ASSERT_TRUE(read) << error;
    EXPECT_EQ(read->timestamp, written.timestamp);
    EXPECT_EQ(read->description, written.description);
    EXPECT_TRUE(*read->data == *written.data);

    std::filesystem::resize_file(path, 300); // as on a full disk
    const std::string reason = readSnapshot(path).error;
    EXPECT_TRUE(reason.starts_with(path + ": not a snapshot: ")) << reason;
    EXPECT_EQ(reason.find('\n'), std::string::npos);
}

// A session takes property lists of 64 MiB, nested in 256 containers, and any number of raw messages.
TEST_F(SnapshotTest, LargeAndDeepOnesAreReadAsTheyWereWritten)
{
    Value deepest = UID{7};
    for (int i = 0; i < 256; ++i)
        deepest = Array::make({deepest});
    Snapshot written = someSnapshot();
    written.data->append(Dictionary::make({{"DisplayState", deepest}}));
    written.description.resize(std::size_t{65} << 20, 'x');
    const std::string path = directory + "/large.orvex";
    ASSERT_EQ(writeSnapshot(written, path), "");
    const auto [read, error] = readSnapshot(path);
    ASSERT_TRUE(read) << error;
    EXPECT_EQ(read->data->size(), 2U);
    EXPECT_TRUE(read->description == written.description);
}

TEST_F(SnapshotTest, SaysWhyItCouldNotBeWritten)
{
    Snapshot unwritable = someSnapshot();
    unwritable.data->append(Dictionary::make({{"Display", Value()}}));
    std::ofstream(directory + "/old.orvex") << "kept";
    EXPECT_EQ(writeSnapshot(unwritable, directory + "/old.orvex"),
        directory + "/old.orvex: the value at /Data/1/Display is null");
    EXPECT_EQ(std::filesystem::file_size(directory + "/old.orvex"), 4U);
    EXPECT_EQ(writeSnapshot(someSnapshot(), directory + "/gone/x.orvex"),
        directory + "/gone/x.orvex: No such file or directory");
    EXPECT_EQ(writeSnapshot(someSnapshot(), "/dev/full"), "/dev/full: No space left on device");
}

TEST(NumberedRows, NoRowHidesAnother)
{
    NumberedRows rows{{"A", 0}};
    for (const char* name : {"A (3)", "A", "A", "B", "A (3)"})
        rows.add(name, name);
    std::string names;
    for (const auto& [name, value] : *rows.dictionary())
        names += name + ";";
    EXPECT_EQ(names, "A;A (3);A (2);A (4);B;A (3) (2);");
}

TEST(NumberedRows, ManyRowsOfOneNameTakeLinearTime)
{
    NumberedRows rows;
    constexpr std::size_t kMany =
        100'000; // in well under a second; minutes if each looked for its number anew
    for (std::size_t i = 0; i < kMany; ++i)
        rows.add("A", "");
    EXPECT_EQ(rows.dictionary()->size(), kMany);
    EXPECT_TRUE(rows.dictionary()->contains("A (100000)"));
}

} // namespace
} // namespace orvex::test
