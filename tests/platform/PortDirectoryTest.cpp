#include "PortTest.h"

#include "Environment.h"

#include <cstdlib>
#include <filesystem>

#include <unistd.h>

namespace orvex {
namespace {

using namespace std::string_literals;
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
    const std::pair<const char*, std::string> cases[] = {
        // why, and what makes the directory
        {"open to other users", "mkdir -m 770 "},
        {"open to other users", "mkdir -m 701 "},
        {"symbolic link", "ln -s /tmp "},
        {"no directory", "touch "},
        {"another user", "install -d -m 700 -o 65534 "},
    };
    for (const auto& [reason, command] : cases) {
        const auto shell = "rm -rf " + directory() + " && " + command + directory();
        // Only root can give a directory away.
        if (std::system(shell.c_str()) != 0 && geteuid() != 0) // NOLINT(cert-env33-c,concurrency-mt-unsafe)
            continue;
        EXPECT_FALSE(ports.createLocalPort("a", collector()).port) << command;
        EXPECT_FALSE(ports.createRemotePort("a")) << command;
        EXPECT_THAT(log.take(), AllOf(SizeIs(2), Each(HasSubstr(reason)))) << command;
    }
    EXPECT_FALSE(SocketMessagePorts(directory() + "/no/where").createRemotePort("a"));
    EXPECT_THAT(log.take(), testing::ElementsAre(HasSubstr("No such file")));
}

TEST_F(PortDirectoryTest, NamesThatLeadElsewhereAreRefused)
{
    for (const std::string& name : {""s, "."s, ".."s, "a/b"s, "a\0b"s, std::string(108, 'x')}) {
        EXPECT_FALSE(ports.createLocalPort(name, collector()).port) << name;
        EXPECT_FALSE(ports.createRemotePort(name)) << name;
        EXPECT_THAT(log.take(), SizeIs(2)) << name;
    }
}

TEST_F(PortDirectoryTest, EnvironmentNamesThePlace)
{
    setEnvironment("ORVEX_PORT_DIR", "/chosen");
    setEnvironment("XDG_RUNTIME_DIR", "/run/user/7");
    EXPECT_EQ(PortDirectory().path(), "/chosen");
    setEnvironment("ORVEX_PORT_DIR", "");
    EXPECT_EQ(PortDirectory().path(), "/run/user/7/orvex");
    setEnvironment("XDG_RUNTIME_DIR", nullptr);
    EXPECT_EQ(PortDirectory().path(), "/tmp/orvex-" + std::to_string(geteuid()));
}

} // namespace
} // namespace orvex
