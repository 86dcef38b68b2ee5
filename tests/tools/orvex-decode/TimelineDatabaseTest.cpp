// orvex-decode --timeline FILE.sqlite: databases that hold the timelines of many captures.

#include "Captures.h"
#include "DecodeProgram.h"

#include <gmock/gmock.h>
#include <sqlite3.h>

#include <array>
#include <filesystem>
#include <memory>

namespace orvex::test {
namespace {

using testing::HasSubstr;

// The rows as lines of columns.
std::string query(const std::string& path, const std::string& sql)
{
    sqlite3* database = nullptr;
    EXPECT_EQ(sqlite3_open_v2(path.c_str(), &database, SQLITE_OPEN_READWRITE, nullptr), SQLITE_OK);
    const auto append = [](void* result, int count, char** columns, char** /*names*/) {
        auto& text = *static_cast<std::string*>(result);
        for (int i = 0; i < count; ++i)
            (text += i > 0 ? "|" : "") += columns[i] != nullptr ? columns[i] : "NULL";
        text += '\n';
        return 0;
    };
    std::string rows;
    EXPECT_EQ(sqlite3_exec(database, sql.c_str(), append, &rows, nullptr), SQLITE_OK)
        << sqlite3_errmsg(database);
    sqlite3_close(database);
    return rows;
}

class TimelineDatabaseTest : public DecodeProgram {
protected:
    TimelineDatabaseTest()
    {
        for (const char* technology : kTechnologies) {
            const QString copy = QString(technology) + ".pcap";
            std::filesystem::copy(capturePath(technology), path(copy.toUtf8()));
            captures << name(copy.toUtf8());
        }
    }

    Result add(const QStringList& inputs, const char* file = "all.sqlite") const
    {
        return decode(QStringList{"--resources", ORVEX_RESOURCES, "--timeline", name(file)} + inputs);
    }
    std::string all(const std::string& sql) const { return query(path("all.sqlite"), sql); }
    // The file names in the folder that begin with the text.
    std::vector<std::string> files(const std::string& beginning) const
    {
        std::vector<std::string> found;
        for (const auto& entry : std::filesystem::directory_iterator(path("")))
            if (entry.path().filename().string().starts_with(beginning))
                found.push_back(entry.path().filename());
        return found;
    }

    QStringList captures;
    static constexpr const char* kCounts = "SELECT count(*), count(DISTINCT capture) FROM samples";
};

TEST_F(TimelineDatabaseTest, HasEachCaptureOnce)
{
    ASSERT_EQ(add(captures).status, 0);
    const std::string before = contentsOf("all.sqlite");
    const std::string counts = all(kCounts);
    EXPECT_EQ(std::filesystem::status(path("all.sqlite")).permissions(), std::filesystem::perms(0600));
    const Result again = add(captures);
    EXPECT_EQ(again.status, 0);
    EXPECT_THAT(again.errors, HasSubstr("MRL_LTE.pcap: is in " + path("all.sqlite") + " already\n"));
    EXPECT_EQ(contentsOf("all.sqlite"), before);

    EXPECT_EQ(run("/bin/sh", {"-c", "xz <" + name("MRL_LTE.pcap") + " >" + name("other")}).status, 0);
    EXPECT_THAT(add({name("other")}).errors, HasSubstr("already"));
    EXPECT_EQ(contentsOf("all.sqlite"), before);

    const Result replaced = add({"--every", "10", name("other")});
    EXPECT_EQ(replaced.status, 0);
    EXPECT_THAT(replaced.errors, HasSubstr("other: replaces"));
    EXPECT_EQ(all("SELECT count(*), count(DISTINCT technology) FROM captures"), "5|5\n");
    EXPECT_EQ(all("SELECT every FROM captures WHERE technology = 'MRL_LTE'"), "10.0\n");
    ASSERT_EQ(add({name("other")}).status, 0);
    EXPECT_EQ(all(kCounts), counts);
}

TEST_F(TimelineDatabaseTest, MergesDatabases)
{
    ASSERT_EQ(add(captures.first(3), "one.sqlite").status, 0);
    ASSERT_EQ(add(captures.last(3), "two?%.sqlite").status, 0);
    const Result merged = add({name("one.sqlite"), name("two?%.sqlite")});
    EXPECT_EQ(merged.status, 0);
    EXPECT_THAT(merged.errors,
        HasSubstr("two?%.sqlite: 1 of 3 captures are in " + path("all.sqlite") + " already\n"));
    ASSERT_EQ(add(captures, "together.sqlite").status, 0);
    for (const char* table :
        {"captures ORDER BY id", "paths ORDER BY id", "samples ORDER BY path, capture, n"}) {
        const std::string sql = std::string("SELECT * FROM ") + table;
        EXPECT_EQ(all(sql), query(path("together.sqlite"), sql));
    }
}

// Each makes the file or finds that another has made it.
TEST_F(TimelineDatabaseTest, TakesCapturesFromSeveralProcessesAtOnce)
{
    std::vector<std::unique_ptr<Program>> programs;
    for (const QString& capture : captures + captures)
        programs.push_back(std::make_unique<Program>(folder, ORVEX_DECODE,
            QStringList{"--resources", ORVEX_RESOURCES, "--timeline", name("all.sqlite"), capture}));
    for (const auto& program : programs)
        EXPECT_EQ(program->waitForEnd(), 0) << program->errors();
    EXPECT_EQ(all("SELECT count(*), count(DISTINCT technology) FROM captures"), "5|5\n");
    EXPECT_EQ(all("PRAGMA integrity_check"), "ok\n");
    EXPECT_EQ(files("all."), std::vector<std::string>{"all.sqlite"});
}

TEST_F(TimelineDatabaseTest, LeavesTheFileAsItWasAfterAFault)
{
    const QString lte = QString::fromStdString(path("MRL_LTE.pcap"));
    ASSERT_EQ(add({lte}, "good.sqlite").status, 0);
    std::filesystem::copy(path("good.sqlite"), path("newer.sqlite"));
    query(path("newer.sqlite"), "PRAGMA user_version = 2");
    std::filesystem::copy(path("good.sqlite"), path("half.sqlite"));
    std::filesystem::resize_file(path("half.sqlite"), std::filesystem::file_size(path("half.sqlite")) / 2);
    std::filesystem::copy(path("good.sqlite"), path("damaged.sqlite"));
    std::fstream damaged(path("damaged.sqlite"), std::ios::in | std::ios::out | std::ios::binary);
    damaged.seekp(100'000);
    damaged << std::string(200'000, 'x') << std::flush;
    std::ofstream(path("none.sqlite")) << std::string(5000, 'x');
    std::ofstream(path("other.sqlite"));
    query(path("other.sqlite"), "CREATE TABLE captures (x)");
    std::ofstream(path("broken.pcap")) << std::string(5000, 'x');

    const struct {
        const char* file;
        QString input;
        const char* error;
    } cases[] = {
        {"newer.sqlite", lte,
            "newer.sqlite: has version 2 of the tables; this orvex-decode knows version 1\n"},
        {"none.sqlite", lte, "none.sqlite: file is not a database\n"},
        {"other.sqlite", lte, "other.sqlite: is not a database of timelines\n"},
        {"half.sqlite", name("MRL_GSM.pcap"), "half.sqlite: database disk image is malformed\n"},
        {"nowhere/new.sqlite", lte, "nowhere/new.sqlite: No such file or directory\n"},
        {"good.sqlite", name("broken.pcap"), "broken.pcap: "},
        {"new.sqlite", name("broken.pcap"), "broken.pcap: "},
        {"good.sqlite", name("other.sqlite"), "other.sqlite: is not a database of timelines\n"},
        {"good.sqlite", name("missing.sqlite"), "missing.sqlite: unable to open database file: No such file"},
        {"new.sqlite", name("damaged.sqlite"), "damaged.sqlite: not added to "},
        {"new.sqlite", name("none.sqlite"), "none.sqlite: file is not a database\n"},
    };
    for (const auto& [file, input, error] : cases) {
        const std::string before = contentsOf(file);
        const Result result = add({input}, file);
        EXPECT_EQ(result.status, 1) << file;
        EXPECT_THAT(result.errors, HasSubstr(error));
        EXPECT_EQ(std::ranges::count(result.errors, '\n'), 1) << result.errors;
        EXPECT_EQ(contentsOf(file), before) << error;
    }
    const Result result = decode({"--resources", name("nowhere"), "--timeline", name("new.sqlite"), lte});
    EXPECT_EQ(result.status, 1);
    EXPECT_THAT(result.errors, HasSubstr("nowhere/LTE.plist: No such file or directory\n"));
    EXPECT_EQ(files("new"), std::vector<std::string>{"newer.sqlite"});
}

TEST_F(TimelineDatabaseTest, AddsNothingWhenTheDiskIsFull)
{
    ASSERT_EQ(add({captures.first()}, "old.sqlite").status, 0);
    const std::string old = contentsOf("old.sqlite");
    for (const char* file : {"old.sqlite", "new.sqlite"}) {
        // The limit is in KiB.
        const std::string command = "trap '' XFSZ; ulimit -f " + std::to_string(old.size() / 1024 + 4)
            + "; exec '" ORVEX_DECODE "' --resources '" ORVEX_RESOURCES "' --timeline '" + path(file) + "' '"
            + path("MRL_GSM.pcap") + "'";
        const Result result = run("/bin/bash", {"-c", QString::fromStdString(command)});
        EXPECT_EQ(result.status, 1);
        EXPECT_THAT(result.errors, HasSubstr(": disk I/O error\n"));
        EXPECT_EQ(std::ranges::count(result.errors, '\n'), 1) << result.errors;
    }
    EXPECT_EQ(contentsOf("old.sqlite"), old);
    EXPECT_THAT(files("new"), testing::IsEmpty());
}

TEST_F(TimelineDatabaseTest, KeepsWhatACutCaptureHolds)
{
    std::filesystem::resize_file(path("MRL_GSM.pcap"), 200'000);
    const Result result = add(captures);
    EXPECT_EQ(result.status, 1);
    EXPECT_THAT(result.errors, HasSubstr("whole messages)"));
    EXPECT_EQ(all("SELECT count(*) FROM captures"), "5\n");
    EXPECT_EQ(
        all("SELECT messages < 1263 AND messages > 100, EXISTS (SELECT 1 FROM samples WHERE capture = id) "
            "FROM captures WHERE technology = 'MRL_GSM'"),
        "1|1\n");
}

} // namespace
} // namespace orvex::test
