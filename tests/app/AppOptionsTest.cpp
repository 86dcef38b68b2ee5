#include "AppOptions.h"

#include <gtest/gtest.h>

namespace orvex::test {
namespace {

AppOptions parse(std::vector<const char*> arguments)
{
    arguments.insert(arguments.begin(), "orvex");
    return AppOptions::parse(static_cast<int>(arguments.size()), arguments.data());
}

TEST(AppOptions, ReadsEachOption)
{
    AppOptions options = parse({});
    EXPECT_FALSE(options.earlyExit || options.usesConsole || options.printsStatus || options.endsWhenPainted);
    EXPECT_EQ(options.theme, Theme::Mode::system);
    options = parse({"--resources", "/\xff b", "--dark", "--print-status", "--until-painted"});
    EXPECT_EQ(options.resources, "/\xff b");
    EXPECT_EQ(options.theme, Theme::Mode::dark);
    EXPECT_TRUE(options.printsStatus && options.endsWhenPainted);
    options = parse({"--open", "a", "--console"});
    EXPECT_EQ(options.file, "a");
    EXPECT_TRUE(options.usesConsole);
    options = parse({"--console", "--path", "/A//", "--timeout", "1.5", "--save", "s", "--json"});
    EXPECT_EQ(options.console.path, "/A");
    EXPECT_EQ(options.console.timeout, std::chrono::milliseconds(1500));
    EXPECT_EQ(options.console.saveFile, "s");
    EXPECT_TRUE(options.console.json);
    EXPECT_EQ(parse({"--console", "--path", "//", "\xff"}).console.path, "/");
    EXPECT_EQ(parse({"--light", "--", "-\xff"}).file, "-\xff");
}

TEST(AppOptions, OpensTheWindowAtTheSizeAskedFor)
{
    constexpr QSize kDesktops[] = {{1280, 800}, {601, 900}};
    for (const QSize& desktop : kDesktops) {
        EXPECT_EQ(parse({"--size", "handset"}).windowSizeOn(desktop), QSize(375, 667));
        EXPECT_EQ(parse({"--size", "9999x1"}).windowSizeOn(desktop), QSize(9999, 1));
        EXPECT_EQ(parse({}).windowSizeOn(desktop), std::nullopt);
    }
    EXPECT_EQ(parse({"--size", "handset"}).windowSizeOn({600, 960}), std::nullopt);
}

} // namespace
} // namespace orvex::test
