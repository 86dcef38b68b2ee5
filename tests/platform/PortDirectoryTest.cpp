#include "PortTest.h"

#include "Environment.h"

#include <cstdlib>
#include <filesystem>

#include <unistd.h>

namespace orvex {
namespace {

using test::setEnvironment;
using testing::AllOf;
using testing::Each;
using testing::HasSubstr;
using testing::SizeIs;

class PortDirectoryTest : public test::PortTest { };

TEST_F(PortDirectoryTest, IsMadeForTheOwnerAloneAndRefusedWhenOthersCouldWriteThere)
{
    ASSERT_TRUE(PortDirectory(directory()).isUsable());
    EXPECT_EQ(std::filesystem::status(directory()).permissions(), std::filesystem::perms::owner_all);
    EXPECT_TRUE(PortDirectory(directory()).isUsable()) << "the second time it is there";
    const struct {
        const char* reason;
        const char* command; // that makes the directory
    } cases[] = {
        {"open to other users", "mkdir -m 770 "},
        {"open to other users", "mkdir -m 701 "},
        {"symbolic link", "ln -s /tmp "},
        {"no directory", "touch "},
        {"another user", "install -d -m 700 -o 65534 "},
    };
    for (const auto& test : cases) {
        const auto shell = "rm -rf " + directory() + " && " + test.command + directory();
        // Only root can give a directory away.
        if (std::system(shell.c_str()) != 0 && geteuid() != 0) // NOLINT(cert-env33-c,concurrency-mt-unsafe)
            continue;
        EXPECT_FALSE(ports.createLocalPort("a", collector()).port) << test.command;
        EXPECT_FALSE(ports.createRemotePort("a")) << test.command;
        EXPECT_THAT(log.take(), AllOf(SizeIs(2), Each(HasSubstr(test.reason)))) << test.command;
    }
    EXPECT_FALSE(SocketMessagePorts(directory() + "/no/where").createRemotePort("a"));
    EXPECT_THAT(log.take(), testing::ElementsAre(HasSubstr("No such file")));
}

TEST_F(PortDirectoryTest, NamesThatLeadElsewhereAreRefused)
{
    for (const std::string& name : {std::string(), std::string("."), std::string(".."), std::string("a/b"),
             std::string("/tmp/x"), std::string("a\0b", 3), std::string(108, 'x')}) {
        EXPECT_FALSE(ports.createLocalPort(name, collector()).port) << name;
        EXPECT_FALSE(ports.createRemotePort(name)) << name;
        EXPECT_THAT(log.take(), SizeIs(2)) << name;
    }
}

TEST_F(PortDirectoryTest, EnvironmentNamesThePlace)
{
    const struct {
        const char* chosen;
        const char* runtime;
        std::string path;
    } cases[] = {
        {"/chosen", "/run/user/7", "/chosen"},
        {"", "/run/user/7", "/run/user/7/orvex"},
        {nullptr, nullptr, "/tmp/orvex-" + std::to_string(geteuid())},
    };
    for (const auto& test : cases) {
        setEnvironment("ORVEX_PORT_DIR", test.chosen);
        setEnvironment("XDG_RUNTIME_DIR", test.runtime);
        EXPECT_EQ(PortDirectory().path(), test.path);
    }
}

} // namespace
} // namespace orvex
