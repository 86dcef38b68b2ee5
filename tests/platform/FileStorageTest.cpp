// Resources, preferences and well-known paths.

#include "FileStorage.h"

#include "Array.h"
#include "Dictionary.h"
#include "Environment.h"
#include "EventLoop.h"
#include "PrivateBus.h"
#include "PropertyListForms.h"
#include "RecordingLog.h"

#include <gmock/gmock.h>

#include <QTemporaryDir>

#include <fstream>

namespace orvex::test {
namespace {

using namespace std::literals;
using namespace testing;

class FileStorageTest : public testing::Test {
protected:
    std::string path(const std::string& name) const { return _directory.path().toStdString() + '/' + name; }
    void write(const std::string& name, const std::string& content) const
    {
        std::ofstream(path(name)) << content;
    }
    std::string contentOf(const std::string& name) const
    {
        std::ifstream file(path(name));
        return {std::istreambuf_iterator<char>(file), {}};
    }

    QTemporaryDir _directory;
    RecordingLog log;
};

TEST_F(FileStorageTest, ResourcesAreReadEachTimeAndTheCallerLearnsOfFaults)
{
    write("good.plist", xmlList("<dict/>"));
    write("array.plist", xmlList("<array/>"));
    write("cut.plist", "<plist><dict>");
    write("c.txt", "");
    const FileResources resources(path(""));
    EXPECT_THAT(resources.propertyListPaths(), ElementsAre("array.plist", "cut.plist", "good.plist"));
    EXPECT_EQ(*resources.dictionaryNamed("good").dictionary, Dictionary());
    write("good.plist", xmlList("<dict><key>k</key><integer>2</integer></dict>"));
    EXPECT_EQ(*resources.dictionaryNamed("good").dictionary, Dictionary({{"k", 2}}));
    const std::pair<const char*, const char*> faults[] = {{"missing", ": No such file"},
        {"array", ": it holds no dictionary but: array"}, {"cut", "malformed XML"}};
    for (const auto& [name, why] : faults) {
        const auto [dictionary, error] = resources.dictionaryNamed(name);
        EXPECT_FALSE(dictionary);
        EXPECT_THAT(error, AllOf(StartsWith(path(name) + ".plist: "), HasSubstr(why)));
    }
    EXPECT_THAT(FileResources(path("nowhere")).propertyListPaths(), IsEmpty());
    EXPECT_THAT(log.take(), IsEmpty()) << "the caller logs";
}

TEST_F(FileStorageTest, PathsFollowTheEnvironment)
{
    const auto all = [](const char* home, const char* root, const char* state, const char* config) {
        setEnvironment("HOME", home);
        setEnvironment("ORVEX_ROOT", root);
        setEnvironment("XDG_STATE_HOME", state);
        setEnvironment("XDG_CONFIG_HOME", config);
        return paths::internalBuildMarker() + ' ' + paths::diagnosticReports() + ' ' + paths::preferences();
    };
    const std::string marker = "/usr/lib/orvex/internal/Carrier Settings.bundle ";
    EXPECT_EQ(all("/home/u", "/r", "/s", "/c"), "/r" + marker + "/r/s/orvex/diagnostic-reports /r/c");
    EXPECT_EQ(all("/home/u", nullptr, "relative", nullptr),
        marker + "/home/u/.local/state/orvex/diagnostic-reports /home/u/.config");
    EXPECT_EQ(all(nullptr, nullptr, nullptr, nullptr), marker + " ");
    setEnvironment("ORVEX_RESOURCES", "/chosen");
    EXPECT_EQ(FileResources::defaultDirectory(), "/chosen");
    IniPreferences preferences;
    preferences.setValue("org.orvex.Home", "key", 1);
    preferences.synchronize("org.orvex.Home");
    EXPECT_THAT(log.take(), ElementsAre(HasSubstr("org.orvex.Home are not kept: $HOME is not set")));
}

TEST_F(FileStorageTest, PreferencesAreKeptInOneFilePerDomain)
{
    setEnvironment("ORVEX_ROOT", nullptr);
    setEnvironment("XDG_CONFIG_HOME", path("").c_str());
    write("org.orvex.Home.ini", "[General]\nkept=7\n");
    IniPreferences preferences;
    preferences.setValue("org.orvex.Home", "HXShowGSMRSSI", false);
    preferences.setValue("org.orvex.Home", "text", "a b");
    preferences.setValue("org.orvex.Other", "number", -5);
    preferences.synchronize("org.orvex.Home");
    preferences.synchronize("org.orvex.Other");
    EXPECT_EQ(contentOf("org.orvex.Home.ini"), "[General]\nHXShowGSMRSSI=false\nkept=7\ntext=a b\n");
    EXPECT_EQ(contentOf("org.orvex.Other.ini"), "[General]\nnumber=-5\n");
    preferences.setValue("org.orvex.Home", "list", Array::make());
    preferences.setValue("../elsewhere", "x", 1);
    EXPECT_THAT(log.take(), ElementsAre(HasSubstr("kind array"), HasSubstr("cannot be the name")));
}

TEST_F(FileStorageTest, ChangedPreferencesAreAnnouncedOnTheSessionBus)
{
    setEnvironment("DBUS_SESSION_BUS_ADDRESS", nullptr);
    setEnvironment("XDG_RUNTIME_DIR", path("").c_str());
    IniPreferences().postChanged("org.orvex.Home", "key"); // returns at once without a bus
    const PrivateBus bus;
    setEnvironment("DBUS_SESSION_BUS_ADDRESS", bus.address().c_str());
    QProcess monitor;
    monitor.start("dbus-monitor", {"--session", "type='signal'"});
    std::string seen;
    const auto sees = [&](std::string_view text) {
        return waitUntil([&] {
            seen += monitor.readAllStandardOutput().toStdString();
            return seen.find(text) != std::string::npos;
        });
    };
    ASSERT_TRUE(sees("member=NameAcquired"));
    IniPreferences().postChanged("org.orvex.Home", "HXShowGSMRSSI");
    EXPECT_TRUE(sees("path=/org/orvex/Preferences; interface=org.orvex.Preferences; member=Changed\n"
                     "   string \"org.orvex.Home\"\n   string \"HXShowGSMRSSI\""))
        << seen;
    monitor.kill();
    monitor.waitForFinished();
}

} // namespace
} // namespace orvex::test
