// Resources, preferences, fixed paths and the clock.

#include "FileResources.h"
#include "FixedPaths.h"
#include "IniPreferences.h"
#include "SystemClock.h"

#include "Array.h"
#include "Dictionary.h"
#include "Environment.h"
#include "EventLoop.h"
#include "PropertyListForms.h"
#include "RecordingLog.h"

#include <gmock/gmock.h>

#include <QProcess>
#include <QStandardPaths>
#include <QTemporaryDir>

#include <filesystem>
#include <fstream>

namespace orvex {
namespace {

using test::Environment;
using test::RecordingLog;
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
    static std::string contentOf(const std::string& path)
    {
        std::ifstream file(path);
        return {std::istreambuf_iterator<char>(file), {}};
    }

    QTemporaryDir _directory;
    RecordingLog log;
};

TEST_F(SystemFilesTest, ResourcesAreReadFromTheirDirectoryEachTime)
{
    write("b.plist", test::xmlList("<dict><key>k</key><integer>1</integer></dict>"));
    write("a.plist", test::xmlList("<dict/>"));
    write("c.txt", "");
    const FileResources resources(_directory.path().toStdString());
    EXPECT_THAT(resources.propertyListPaths(), ElementsAre("a.plist", "b.plist"));
    EXPECT_TRUE(*resources.dictionaryNamed("b") == Dictionary({{"k", 1}}));
    write("b.plist", test::xmlList("<dict><key>k</key><integer>2</integer></dict>"));
    EXPECT_TRUE(*resources.dictionaryNamed("b") == Dictionary({{"k", 2}}));
    EXPECT_THAT(log.take(), IsEmpty());
}

TEST_F(SystemFilesTest, ResourcesThatCannotBeReadAreToldInOneLine)
{
    write("array.plist", test::xmlList("<array/>"));
    write("cut.plist", "<plist><dict>");
    write("empty.plist", "");
    std::filesystem::create_directory(path("folder.plist"));
    const FileResources resources(_directory.path().toStdString());
    const struct {
        const char* name;
        const char* reason;
    } cases[] = {
        {"missing", "No such file"},
        {"array", "no dictionary but: array"},
        {"cut", "<dict> is not closed"},
        {"empty", "no data"},
        {"folder", "directory"},
    };
    for (const auto& test : cases) {
        EXPECT_FALSE(resources.dictionaryNamed(test.name));
        EXPECT_THAT(log.take(),
            ElementsAre(testing::AllOf(
                HasSubstr("<3>"), HasSubstr(path(test.name) + ".plist"), HasSubstr(test.reason))));
    }
    EXPECT_THAT(FileResources(path("nowhere")).propertyListPaths(), IsEmpty());
    EXPECT_THAT(log.take(), ElementsAre(HasSubstr("No such file")));
}

TEST_F(SystemFilesTest, ResourcesOfTheSourceTreeServeProgramsOfTheBuildTreeAlone)
{
    {
        const Environment chosen("ORVEX_RESOURCES", "/chosen");
        EXPECT_EQ(FileResources::defaultDirectory(), "/chosen");
    }
    const Environment none("ORVEX_RESOURCES", nullptr);
    const auto sources = FileResources::defaultDirectory(); // of this test, in the build tree
    EXPECT_TRUE(std::filesystem::exists(sources + "/CMakeLists.txt")) << sources;

    // The same program, copied elsewhere as an installation would.
    const auto program = path("installed");
    std::filesystem::copy_file("/proc/self/exe", program);
    QProcess installed;
    installed.start(QString::fromStdString(program),
        {QStringLiteral("--gtest_filter=*DefaultResourceDirectoryIsAbsolute")});
    ASSERT_TRUE(installed.waitForFinished());
    EXPECT_EQ(installed.exitCode(), 0);
    const auto output = installed.readAllStandardOutput().toStdString();
    EXPECT_THAT(output, HasSubstr("default directory: /"));
    EXPECT_THAT(output, testing::Not(HasSubstr("default directory: " + sources + '\n')));
    EXPECT_THAT(output, HasSubstr("/orvex\n"));
}

// The test above runs this one in another place too, and reads what it prints.
TEST_F(SystemFilesTest, DefaultResourceDirectoryIsAbsolute)
{
    const auto directory = FileResources::defaultDirectory();
    std::printf("default directory: %s\n", directory.c_str());
    EXPECT_TRUE(directory.starts_with('/')) << directory;
}

TEST_F(SystemFilesTest, PathsStandUnderTheirPrefixes)
{
    const Environment home("HOME", "/home/u");
    const struct {
        const char* root;
        const char* state;
        const char* config;
        const char* marker;
        const char* reports;
        const char* preferences;
    } cases[] = {
        {nullptr, nullptr, nullptr, "/usr/lib/orvex/internal/Carrier Settings.bundle",
            "/home/u/.local/state/orvex/diagnostic-reports", "/home/u/.config"},
        {"/r", "/s", "/c", "/r/usr/lib/orvex/internal/Carrier Settings.bundle",
            "/r/s/orvex/diagnostic-reports", "/r/c"},
        {"", "relative", "", "/usr/lib/orvex/internal/Carrier Settings.bundle",
            "/home/u/.local/state/orvex/diagnostic-reports", "/home/u/.config"},
    };
    for (const auto& test : cases) {
        const Environment root("ORVEX_ROOT", test.root);
        const Environment state("XDG_STATE_HOME", test.state);
        const Environment config("XDG_CONFIG_HOME", test.config);
        EXPECT_EQ(paths::internalBuildMarker(), test.marker);
        EXPECT_EQ(paths::diagnosticReports(), test.reports);
        EXPECT_EQ(paths::preferences(), test.preferences);
    }
}

TEST_F(SystemFilesTest, PreferencesAreKeptInOneFilePerDomain)
{
    const Environment root("ORVEX_ROOT", nullptr);
    const Environment config("XDG_CONFIG_HOME", path("config").c_str());
    write("before", "");
    std::filesystem::create_directory(path("config"));
    write("config/org.orvex.Home.ini", "[General]\nkept=7\n");
    IniPreferences preferences;
    preferences.setValue("org.orvex.Home", "HXShowGSMRSSI", false);
    preferences.setValue("org.orvex.Home", "text", "a b");
    preferences.setValue("org.orvex.Other", "number", -5);
    preferences.synchronize("org.orvex.Home");
    preferences.synchronize("org.orvex.Other");
    EXPECT_THAT(contentOf(path("config/org.orvex.Home.ini")),
        testing::AllOf(HasSubstr("HXShowGSMRSSI=false\n"), HasSubstr("text=a b\n"), HasSubstr("kept=7\n")));
    EXPECT_THAT(contentOf(path("config/org.orvex.Other.ini")), HasSubstr("number=-5\n"));
    EXPECT_THAT(log.take(), IsEmpty());

    preferences.setValue("org.orvex.Home", "list", Array::make());
    EXPECT_THAT(log.take(), ElementsAre(HasSubstr("kind array")));
    preferences.setValue("../elsewhere", "x", 1);
    EXPECT_THAT(log.take(), ElementsAre(HasSubstr("cannot be the name")));
}

TEST_F(SystemFilesTest, ChangeOfAPreferenceIsToldOnTheSessionBus)
{
    {
        // Without a bus nothing happens, at once.
        const Environment address("DBUS_SESSION_BUS_ADDRESS", nullptr);
        const Environment runtime("XDG_RUNTIME_DIR", path("").c_str());
        IniPreferences().postChanged("org.orvex.Home", "key");
    }
    QProcess bus;
    bus.start(QStringLiteral("dbus-daemon"),
        {QStringLiteral("--session"), QStringLiteral("--nofork"), QStringLiteral("--print-address")});
    if (!bus.waitForStarted() || !bus.waitForReadyRead())
        GTEST_SKIP() << "there is no dbus-daemon";
    const QByteArray busAddress = bus.readLine().trimmed();
    const Environment address("DBUS_SESSION_BUS_ADDRESS", busAddress.constData());
    QProcess monitor;
    monitor.start(QStringLiteral("dbus-monitor"),
        {QStringLiteral("--address"), QString::fromLatin1(busAddress), QStringLiteral("type='signal'")});
    if (!monitor.waitForStarted())
        GTEST_SKIP() << "there is no dbus-monitor";
    std::string seen;
    const auto sees = [&](std::string_view text) {
        return test::waitUntil([&] {
            seen += monitor.readAllStandardOutput().toStdString();
            return seen.find(text) != std::string::npos;
        });
    };
    ASSERT_TRUE(sees("member=NameAcquired")) << seen;
    IniPreferences().postChanged("org.orvex.Home", "HXShowGSMRSSI");
    EXPECT_TRUE(sees("string \"HXShowGSMRSSI\"")) << seen;
    EXPECT_THAT(seen,
        HasSubstr("path=/org/orvex/Preferences; interface=org.orvex.Preferences; member=Changed\n"
                  "   string \"org.orvex.Home\"\n"));
    monitor.kill();
    monitor.waitForFinished();
    bus.kill();
    bus.waitForFinished();
}

TEST_F(SystemFilesTest, ZoneIsThatOfTheMoment)
{
    // Zones written out, so that none need be installed.
    const struct {
        const char* zone;
        double moment;
        int seconds;
        bool isDaylightSaving;
    } cases[] = {
        {"UTC0", 1794808471, 0, false},
        {"CET-1CEST,M3.5.0,M10.5.0/3", 1794808471, 3600, false},   // November
        {"CET-1CEST,M3.5.0,M10.5.0/3", 1784000000, 7200, true},    // July
        {"CET-1CEST,M3.5.0,M10.5.0/3", 1774745999.9, 3600, false}, // 2026-03-29 00:59:59.9 UTC
        {"CET-1CEST,M3.5.0,M10.5.0/3", 1774746000, 7200, true},    // 01:00:00
        {"NST3:30NDT,M3.2.0,M11.1.0", 1794808471, -12600, false},
        {"NST3:30NDT,M3.2.0,M11.1.0", 1784000000, -9000, true},
        {"<+0545>-5:45", 1794808471, 20700, false},
        {"AEST-10AEDT,M10.1.0,M4.1.0/3", 1794808471, 39600, true},
        {"UTC0", -1e300, 0, false},
    };
    const SystemClock clock;
    for (const auto& test : cases) {
        const Environment zone("TZ", test.zone);
        const auto result = clock.zoneAt({test.moment});
        EXPECT_EQ(result.secondsEastOfUTC, test.seconds) << test.zone << ' ' << test.moment;
        EXPECT_EQ(result.isDaylightSaving, test.isDaylightSaving) << test.zone << ' ' << test.moment;
    }
    const auto before = static_cast<double>(std::time(nullptr));
    const double now = clock.now().secondsSince1970;
    EXPECT_GE(now, before);
    EXPECT_LT(now, before + 60);
}

} // namespace
} // namespace orvex
