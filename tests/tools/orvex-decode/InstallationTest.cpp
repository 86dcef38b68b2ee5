#include "Programs.h"

#include <filesystem>
#include <fstream>

namespace orvex::test {
namespace {

// An installation depends neither on the source and build trees nor on the place of the first install.
TEST(Installation, ProgramsFindTemplatesAndCapturesBesideThem)
{
    const ProgramFolder folder;
    const std::string moved = folder.path("moved");
    ASSERT_EQ(
        run(CMAKE_COMMAND, {"--install", ORVEX_BUILD_DIRECTORY, "--prefix", folder.name("first")}).status, 0);
    std::filesystem::rename(folder.path("first"), moved);
    EXPECT_NE(run(moved + "/bin/orvex", {"--version"}).output, "");
    EXPECT_TRUE(std::filesystem::exists(moved + "/share/orvex/orvex-decode.schema.json"));

    const std::string played = moved + "/share/orvex/captures/MRL_LTE.pcap";
    const auto decoded = [&] {
        return run(moved + "/bin/orvex-decode", {"--technology", "MRL_LTE", QString::fromStdString(played)})
            .output;
    };
    EXPECT_NE(decoded().find("Num Tx Antennas: "), std::string::npos);
    std::ofstream(moved + "/share/orvex/LTE.plist")
        << "<plist version=\"1.0\"><dict><key>Place</key><string>moved</string></dict></plist>";
    EXPECT_EQ(decoded(), "Orvex\n  Place: moved\n");

    EXPECT_TRUE(std::filesystem::remove(played));
    const Result korat = run(moved + "/bin/koratd", {});
    EXPECT_EQ(korat.status, 1);
    EXPECT_EQ(korat.errors, "koratd: " + played + ": No such file or directory\n");
}

} // namespace
} // namespace orvex::test
