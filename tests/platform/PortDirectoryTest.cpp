#include "PortTest.h"

#include <cstdlib>
#include <filesystem>
#include <fstream>

#include <sys/stat.h>

namespace orvex {
namespace {

using testing::ElementsAre;
using testing::HasSubstr;
using testing::IsEmpty;

class PortDirectoryTest : public test::PortTest { };

TEST_F(PortDirectoryTest, IsMadeForTheOwnerAlone)
{
    ASSERT_TRUE(PortDirectory(directory()).isUsable());
    struct stat status { };
    ASSERT_EQ(stat(directory().c_str(), &status), 0);
    EXPECT_EQ(status.st_mode & 07777U, 0700U);
    EXPECT_TRUE(PortDirectory(directory()).isUsable()) << "the second time it is there";
    EXPECT_THAT(log.take(), IsEmpty());
}

TEST_F(PortDirectoryTest, IsRefusedWhenOthersCouldWriteThere)
{
    const std::string path = directory();
    const auto mode = [&](mode_t bits) {
        return mkdir(path.c_str(), 0700) == 0 && chmod(path.c_str(), bits) == 0;
    };
    const struct {
        const char* reason;
        std::function<bool()> make;
    } cases[] = {
        {"open to other users", [&] { return mode(0770); }},
        {"open to other users", [&] { return mode(0701); }},
        {"symbolic link",
            [&] { return symlink(_directory.path().toStdString().c_str(), path.c_str()) == 0; }},
        {"no directory", [&] { return std::ofstream(path).good(); }},
        {"another user",
            [&] { return geteuid() != 0 || (mode(0700) && chown(path.c_str(), 65534, 65534) == 0); }},
    };
    for (const auto& test : cases) {
        std::filesystem::remove_all(path);
        ASSERT_TRUE(test.make()) << test.reason;
        if (!std::filesystem::exists(std::filesystem::symlink_status(path)))
            continue; // only root can give a directory away
        EXPECT_FALSE(ports.createLocalPort("a", collector()).port) << test.reason;
        EXPECT_THAT(
            log.take(), ElementsAre(testing::AllOf(HasSubstr("<3>Port directory"), HasSubstr(test.reason))));
        EXPECT_FALSE(ports.createRemotePort("a"));
        EXPECT_THAT(log.take(), ElementsAre(HasSubstr(test.reason)));
    }
    EXPECT_FALSE(SocketMessagePorts(_directory.path().toStdString() + "/no/where").createRemotePort("a"));
    EXPECT_THAT(log.take(), ElementsAre(HasSubstr("No such file")));
}

TEST_F(PortDirectoryTest, NamesThatLeadElsewhereAreRefused)
{
    for (const std::string& name : {std::string(), std::string("."), std::string(".."), std::string("a/b"),
             std::string("/tmp/x"), std::string("a\0b", 3), std::string(108, 'x')}) {
        EXPECT_FALSE(ports.createLocalPort(name, collector()).port) << name;
        EXPECT_FALSE(ports.createRemotePort(name)) << name;
        EXPECT_EQ(log.take().size(), 2U) << name;
    }
}

TEST_F(PortDirectoryTest, EnvironmentNamesThePlace)
{
    const auto set = [](const char* name, const char* value) {
        value ? setenv(name, value, 1) : unsetenv(name); // NOLINT(concurrency-mt-unsafe)
    };
    const struct {
        const char* chosen;
        const char* runtime;
        std::string path;
    } cases[] = {
        {"/chosen", "/run/user/7", "/chosen"},
        {nullptr, "/run/user/7", "/run/user/7/orvex"},
        {"", "/run/user/7", "/run/user/7/orvex"},
        {nullptr, nullptr, "/tmp/orvex-" + std::to_string(geteuid())},
    };
    for (const auto& test : cases) {
        set("ORVEX_PORT_DIR", test.chosen);
        set("XDG_RUNTIME_DIR", test.runtime);
        EXPECT_EQ(PortDirectory().path(), test.path);
    }
}

} // namespace
} // namespace orvex
