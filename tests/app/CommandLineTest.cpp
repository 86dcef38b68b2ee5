#include "CommandLine.h"

#include <gtest/gtest.h>

namespace orvex::test {
namespace {

TEST(CommandLine, UnderstandsItsOptionsAndNothingElse)
{
    using Action = CommandLine::Action;
    using Mode = Theme::Mode;
    const struct {
        QStringList arguments;
        Action action;
        Mode theme = Mode::system;
        std::optional<std::string> resources = {};
    } cases[] = {
        {{}, Action::window},
        {{"-h"}, Action::help},
        {{"--version", "--console"}, Action::version},
        {{"--resources", "/a b", "--dark"}, Action::window, Mode::dark, "/a b"},
        {{"--resources", "/\u00ff"}, Action::window, Mode::system, "/\xff"},
        {{"--light"}, Action::window, Mode::light},
        {{"--print-status", "--console"}, Action::wrongUsage},
        {{"--print-status", "--open", "a"}, Action::wrongUsage},
        {{"--no-such"}, Action::wrongUsage},
        {{"file"}, Action::wrongUsage},
        {{"--light", "--dark"}, Action::wrongUsage},
        {{"--light", "--dark", "--help"}, Action::help},
        {{"--console", "--light"}, Action::wrongUsage},
        {{"--console", "--until-painted"}, Action::wrongUsage},
        {{"--open", "a", "--console"}, Action::console},
        {{"--open", "a", "--resources", "/r"}, Action::wrongUsage},
        {{"--open", "a", "--until-painted"}, Action::wrongUsage},
        {{"--open", "a", "--open", "a"}, Action::wrongUsage},
        {{"--console", "--size", "1x1"}, Action::wrongUsage},
    };
    for (const auto& test : cases) {
        SCOPED_TRACE(test.arguments.join(' ').toStdString());
        const CommandLine result = CommandLine::parse(QStringList{"orvex"} + test.arguments);
        EXPECT_EQ(result.action, test.action);
        EXPECT_EQ(result.theme, test.theme);
        EXPECT_EQ(result.resources, test.resources);
        EXPECT_EQ(result.error.empty(), test.action != Action::wrongUsage);
    }
}

TEST(CommandLine, OpensTheWindowWithTheSizeAskedFor)
{
    constexpr QSize screens[] = {{1280, 800}, {601, 900}, {600, 960}};
    const struct {
        const char* value;
        std::optional<QSize> sizes[3]; // on each of the screens
    } cases[] = {
        {"300x500", {{{300, 500}}, {{300, 500}}, {{300, 500}}}},
        {"9999x1", {{{9999, 1}}, {{9999, 1}}, {{9999, 1}}}},
        {"handset", {{{375, 667}}, {{375, 667}}, std::nullopt}},
    };
    for (const auto& [value, sizes] : cases) {
        const CommandLine result = CommandLine::parse({"orvex", "--size", value});
        for (int i = 0; i < 3; ++i)
            EXPECT_EQ(result.windowSizeOn(screens[i]), sizes[i]) << value;
    }
    EXPECT_EQ(CommandLine::parse({"orvex"}).windowSizeOn({1280, 800}), std::nullopt);
    for (const char* malformed : {"", "375", "375x", "x667", "375X667", "0x667", "-1x5", " 1x1", "1x1\n",
             "10000x1", "1x1x1", "phone"}) {
        const CommandLine result = CommandLine::parse({"orvex", "--size", malformed});
        EXPECT_EQ(result.action, CommandLine::Action::wrongUsage) << malformed;
    }
}

} // namespace
} // namespace orvex::test
