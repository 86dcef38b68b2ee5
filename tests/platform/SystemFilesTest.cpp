// Resources, preferences, well-known paths and output files.

#include "FileStorage.h"
#include "OutputFile.h"

#include "Array.h"
#include "Dictionary.h"
#include "Environment.h"
#include "EventLoop.h"
#include "PropertyListForms.h"
#include "RecordingLog.h"

#include <gmock/gmock.h>

#include <QProcess>
#include <QTemporaryDir>

#include <filesystem>
#include <fstream>

#include <unistd.h>

namespace orvex {
namespace {

namespace fs = std::filesystem;
using test::setEnvironment;
using testing::ElementsAre;
using testing::HasSubstr;
using testing::IsEmpty;

class SystemFilesTest : public testing::Test {
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
    test::RecordingLog log;
};

TEST_F(SystemFilesTest, ResourcesAreReadEachTimeAndTheCallerLearnsOfFaults)
{
    write("good.plist", test::xmlList("<dict/>"));
    write("array.plist", test::xmlList("<array/>"));
    write("cut.plist", "<plist><dict>");
    write("c.txt", "");
    const FileResources resources(path(""));
    EXPECT_THAT(resources.propertyListPaths(), ElementsAre("array.plist", "cut.plist", "good.plist"));
    EXPECT_EQ(*resources.dictionaryNamed("good").dictionary, Dictionary());
    write("good.plist", test::xmlList("<dict><key>k</key><integer>2</integer></dict>"));
    EXPECT_EQ(*resources.dictionaryNamed("good").dictionary, Dictionary({{"k", 2}}));
    EXPECT_EQ(resources.dictionaryNamed("good").error, "");
    const std::pair<const char*, const char*> faults[] = {{"missing", ": No such file"},
        {"array", ": it holds no dictionary but: array"}, {"cut", "malformed XML"}};
    for (const auto& [name, why] : faults) {
        const auto [dictionary, error] = resources.dictionaryNamed(name);
        EXPECT_FALSE(dictionary);
        EXPECT_THAT(error, testing::StartsWith(path(name) + ".plist: "));
        EXPECT_THAT(error, HasSubstr(why));
    }
    EXPECT_THAT(FileResources(path("nowhere")).propertyListPaths(), IsEmpty());
    EXPECT_THAT(log.take(), IsEmpty()) << "the caller logs";
}

// Runs itself again from elsewhere, as an installed program would.
TEST_F(SystemFilesTest, OnlyProgramsOfTheBuildTreeUseTheSourceTreesResources)
{
    constexpr int kAsInstalled = 77;
    setEnvironment("ORVEX_RESOURCES", nullptr);
    const auto directory = FileResources::defaultDirectory();
    if (std::getenv("ORVEX_TEST_INSTALLED"))
        std::_Exit(directory.starts_with('/') && directory.ends_with("/orvex") ? kAsInstalled : 1);
    EXPECT_TRUE(fs::exists(directory + "/CMakeLists.txt")) << directory;
    setEnvironment("ORVEX_TEST_INSTALLED", "1");
    fs::copy_file("/proc/self/exe", path("installed"));
    EXPECT_EQ(
        QProcess::execute(QString::fromStdString(path("installed")), {"--gtest_filter=*OfTheBuildTree*"}),
        kAsInstalled);
    setEnvironment("ORVEX_RESOURCES", "/chosen");
    EXPECT_EQ(FileResources::defaultDirectory(), "/chosen");
}

TEST_F(SystemFilesTest, PathsFollowTheEnvironment)
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
    IniPreferences preferences;
    preferences.setValue("org.orvex.Home", "key", 1);
    preferences.synchronize("org.orvex.Home");
    EXPECT_THAT(log.take(), ElementsAre(HasSubstr("org.orvex.Home are not kept: $HOME is not set")));
}

TEST_F(SystemFilesTest, OutputFilesAreTheirUsersAlone)
{
    constexpr uid_t kStranger = 65534;
    for (const char* name : {"old", "kept", "stranger's"})
        write(name, "a longer content");
    fs::permissions(path("old"), fs::perms::all);
    fs::create_directory(path("folder"));
    const std::pair<const char*, const char*> links[] = {{"kept", "foreign link"},
        {"foreign link", "link to it"}, {"old", "link"}, {"../link", "folder/link"}, {"new too", "dangling"},
        {"circle", "circle"}};
    for (const auto& [target, name] : links)
        fs::create_symlink(target, path(name));
    const bool isRoot = ::geteuid() == 0;
    for (const char* name : {"foreign link", "stranger's"})
        ASSERT_TRUE(!isRoot || ::lchown(path(name).c_str(), kStranger, kStranger) == 0);
    const struct {
        const char* name;
        const char* error;
        const char* written;
        bool takesRoot = false;
    } cases[] = {
        {"new", "", "new"},
        {"old", "", "old"},
        {"link", "", "old"},
        {"folder/link", "", "old"},
        {"dangling", "", "new too"},
        {"circle", "Too many levels of symbolic links", nullptr},
        {"folder", "Is a directory", nullptr},
        {"nowhere/file", "No such file or directory", nullptr},
        {"foreign link", "a link that belongs to another user", nullptr, true},
        {"link to it", "a link that belongs to another user", nullptr, true},
        {"stranger's", "belongs to another user", nullptr, true},
    };
    for (const auto& test : cases) {
        if (test.takesRoot && !isRoot)
            continue;
        auto [file, error] = openOutputFile(path(test.name));
        EXPECT_EQ(error, test.error) << test.name;
        EXPECT_EQ(file != nullptr, error.empty()) << test.name;
        if (!file || !test.written)
            continue;
        std::fputs(test.name, file.get());
        file.reset(); // closes it, which writes
        EXPECT_EQ(contentOf(test.written), test.name);
        EXPECT_EQ(fs::status(path(test.written)).permissions(), fs::perms(0600)) << test.name;
    }
    EXPECT_EQ(contentOf("kept") + contentOf("stranger's"), "a longer contenta longer content");
}

TEST_F(SystemFilesTest, PreferencesAreKeptInOneFilePerDomain)
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

TEST_F(SystemFilesTest, ChangedPreferencesAreAnnouncedOnTheSessionBus)
{
    setEnvironment("DBUS_SESSION_BUS_ADDRESS", nullptr);
    setEnvironment("XDG_RUNTIME_DIR", path("").c_str());
    IniPreferences().postChanged("org.orvex.Home", "key"); // returns at once without a bus
    QProcess bus;
    bus.start("dbus-daemon", {"--session", "--nofork", "--print-address"});
    if (!bus.waitForStarted() || !bus.waitForReadyRead())
        GTEST_SKIP() << "there is no dbus-daemon";
    setEnvironment("DBUS_SESSION_BUS_ADDRESS", bus.readLine().trimmed().constData());
    QProcess monitor;
    monitor.start("dbus-monitor", {"--session", "type='signal'"});
    std::string seen;
    const auto sees = [&](std::string_view text) {
        return test::waitUntil([&] {
            seen += monitor.readAllStandardOutput().toStdString();
            return seen.find(text) != std::string::npos;
        });
    };
    ASSERT_TRUE(sees("member=NameAcquired")) << seen;
    IniPreferences().postChanged("org.orvex.Home", "HXShowGSMRSSI");
    EXPECT_TRUE(sees("path=/org/orvex/Preferences; interface=org.orvex.Preferences; member=Changed\n"
                     "   string \"org.orvex.Home\"\n   string \"HXShowGSMRSSI\""))
        << seen;
    for (QProcess* process : {&monitor, &bus}) {
        process->kill();
        process->waitForFinished();
    }
}

} // namespace
} // namespace orvex
