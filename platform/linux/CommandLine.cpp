#include "CommandLine.h"

#include "Process.h"
#include "VisibleText.h"

#include <QCoreApplication>

#include <cstdio>
#include <cstdlib>
#include <utility>

namespace orvex {

namespace {

std::vector<std::string> bytesOf(const QStringList& texts)
{
    std::vector<std::string> result;
    for (const QString& text : texts)
        result.push_back(argumentBytes(text));
    return result;
}

} // namespace

CommandLine::CommandLine(Program program)
    : _program(std::move(program))
{
    _parser.setApplicationDescription(_program.summary);
    for (const Option& option : _program.options)
        _parser.addOption({option.name, option.description, option.valueName});
    _parser.addOptions(
        {{{"h", "help"}, "Print this help and exit."}, {{"v", "version"}, "Print the version and exit."}});
    if (_program.argumentsSyntax)
        _parser.addPositionalArgument(
            _program.argumentsSyntax, _program.argumentsDescription, _program.argumentsSyntax);
}

std::optional<CommandLine::EarlyExit> CommandLine::parse(int count, const char* const* arguments)
{
    // Not process(), which would end the program in its own way.
    if (!_parser.parse(argumentTexts(count, arguments)))
        return wrongUsage(argumentBytes(_parser.errorText()));
    if (isSet("help"))
        return EarlyExit{EXIT_SUCCESS, help()};
    if (isSet("version"))
        return EarlyExit{EXIT_SUCCESS, std::string(_program.name) + " " ORVEX_VERSION "\n"};
    if (const std::string error = fault(); !error.empty())
        return wrongUsage(error);
    return std::nullopt;
}

std::string CommandLine::fault() const
{
    const auto dashed = [](const char* option) { return std::string("--") + option; };
    for (const auto& [option, other] : _program.exclusions) {
        if (isSet(option) && isSet(other))
            return dashed(option) + " cannot be combined with " + dashed(other) + ".";
    }
    for (const auto& [option, other] : _program.dependencies) {
        if (isSet(option) && !isSet(other))
            return dashed(option) + " goes with " + dashed(other) + ".";
    }
    for (const Option& option : _program.options) {
        if (!option.isRepeatable && values(option.name).size() > 1)
            return dashed(option.name) + " is given more than once.";
    }
    if (!_program.argumentsSyntax && !arguments().empty())
        return "Unexpected argument '" + arguments().front() + "'.";
    return {};
}

CommandLine::EarlyExit CommandLine::wrongUsage(const std::string& error) const
{
    const std::string name = _program.name;
    return {kWrongUsage, name + ": " + visibleText(error) + "\nTry '" + name + " --help'.\n"};
}

std::string CommandLine::help() const
{
    // The parser takes the program's name from the application object, which may not exist yet.
    int count = 1;
    std::string name = _program.name;
    char* const arguments[] = {name.data(), nullptr};
    std::optional<QCoreApplication> application;
    if (!QCoreApplication::instance())
        application.emplace(count, const_cast<char**>(arguments));
    return _parser.helpText().toStdString();
}

std::optional<std::string> CommandLine::value(const char* option) const
{
    return isSet(option) ? std::optional(argumentBytes(_parser.value(QLatin1String(option)))) : std::nullopt;
}

std::vector<std::string> CommandLine::values(const char* option) const
{
    return bytesOf(_parser.values(QLatin1String(option)));
}

std::vector<std::string> CommandLine::arguments() const
{
    return bytesOf(_parser.positionalArguments());
}

int CommandLine::EarlyExit::print() const
{
    std::fputs(text.c_str(), status == EXIT_SUCCESS ? stdout : stderr);
    return status;
}

} // namespace orvex
