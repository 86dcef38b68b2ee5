#include "DecodeProgram.h"
#include "PacketText.h"

#include <gtest/gtest.h>

#include <filesystem>

namespace orvex::test {
namespace {

// An installation depends neither on the source and build trees nor on the place of the first install.
TEST(InstallationTest, ProgramsFindTemplatesAndCapturesBesideThem)
{
    const ProgramFolder folder;
    const auto run = [&folder](const std::string& program, const QStringList& arguments) {
        Program process(folder, program.c_str(), arguments);
        const int status = process.waitForEnd();
        EXPECT_EQ(status, 0) << program << ": " << process.errors();
        return process.output();
    };
    const std::string first = folder.path("first");
    const std::string moved = folder.path("moved");
    run(CMAKE_COMMAND, {"--install", ORVEX_BUILD_DIRECTORY, "--prefix", QString::fromStdString(first)});
    std::filesystem::rename(first, moved);
    for (const char* program : {"/bin/orvex", "/bin/koratd"})
        EXPECT_NE(run(moved + program, {"--version"}), "");

    const Bytes message = PcapFile().add(packet(0xB0C1, {0, 1, 2, 3, 4, 5, 6, 4, 8})).bytes();
    const QString capture = QString::fromStdString(writeFile(folder.path("capture"), message));
    const auto decoded = [&] {
        return run(moved + "/bin/orvex-decode", {"--technology", "MRL_LTE", capture});
    };
    EXPECT_NE(decoded().find("Num Tx Antennas: 4"), std::string::npos);
    const std::string list =
        "<plist version=\"1.0\"><dict><key>Place</key><string>moved</string></dict></plist>";
    writeFile(moved + "/share/orvex/LTE.plist", Bytes(list.begin(), list.end()));
    EXPECT_EQ(decoded(), "Orvex\n  Place: moved\n");

    const std::string played = moved + "/share/orvex/captures/MRL_LTE.pcap";
    EXPECT_TRUE(std::filesystem::remove(played));
    Program korat(folder, (moved + "/bin/koratd").c_str(), {});
    EXPECT_EQ(korat.waitForEnd(), 1);
    EXPECT_EQ(korat.errors(), "koratd: " + played + ": No such file or directory\n");
}

} // namespace
} // namespace orvex::test
