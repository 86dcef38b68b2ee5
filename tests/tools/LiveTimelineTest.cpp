// A live session recorded by the monitor and by koratd, and what a decoder makes of the latter.

#include "CaptureReader.h"
#include "Programs.h"

#include <QDateTime>

#include <cstdlib>
#include <fstream>
#include <map>
#include <sstream>

namespace orvex::test {
namespace {

// The last text of each row.
std::map<std::string, std::string> lastTexts(const std::string& csv)
{
    std::map<std::string, std::string> result;
    std::istringstream lines(csv.substr(csv.find('\n') + 1));
    for (std::string line; std::getline(lines, line);) {
        const auto text = line.find(line.find(",\"") < line.find(",,") ? "\"," : ",,") + 2;
        EXPECT_TRUE(line.ends_with('\r')) << line;
        result[line.substr(25, text - 25)] = line.substr(text);
    }
    return result;
}

TEST(LiveTimeline, IsTheSameFromTheMonitorAndTheDecoder)
{
    const ProgramFolder folder;
    const KoratProgram korat(folder,
        {"--technology", "MRL_LTE", "--rate", "1000", "--count", "500", "--record", folder.name("live")});
    Program monitor(
        folder, ORVEX_PATH, {"--console", "--timeline", folder.name("live.csv"), "--every", "0.2"});
    const auto recordsAll = [&folder] {
        const auto reader = CaptureReader::open(folder.path("live"));
        std::size_t count = 0;
        while (reader->next() == CaptureReader::Status::message)
            ++count;
        return count == 500;
    };
    EXPECT_TRUE(waitUntil(recordsAll, std::chrono::seconds(30)));
    turnFor(std::chrono::milliseconds(700));
    monitor.kill(); // what was recorded stays
    const auto read = [&folder](const char* name) {
        std::ifstream stream(folder.path(name), std::ios::binary);
        return std::string(std::istreambuf_iterator<char>(stream), {});
    };
    const std::string live = read("live.csv");
    EXPECT_EQ(run(ORVEX_DECODE, {"--timeline", folder.name("offline.csv"), folder.name("live")}).status, 0);
    const auto rows = lastTexts(live);
    const auto decoded = lastTexts(read("offline.csv"));
    EXPECT_GT(rows.size(), 80U);
    for (const auto& [row, text] : rows)
        EXPECT_EQ(text, decoded.contains(row) ? decoded.at(row) : ",,\r") << row;

    // By the clock on the wall.
    const auto now = QDateTime::currentDateTimeUtc();
    const auto last = QDateTime::fromString(
        QString::fromStdString(live.substr(live.rfind('\n', live.size() - 2) + 1, 24)), Qt::ISODateWithMs);
    EXPECT_LT(std::abs(last.secsTo(now)), 20);
}

} // namespace
} // namespace orvex::test
