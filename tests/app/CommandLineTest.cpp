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
        {{"--open", "a", "--open", "b"}, Action::wrongUsage},
        {{"--resources", "/a b", "--resources", "/a b"}, Action::window, Mode::system, "/a b"},
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

} // namespace
} // namespace orvex::test
