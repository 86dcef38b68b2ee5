#pragma once

#include <QCommandLineParser>

#include <optional>
#include <string>
#include <vector>

namespace orvex {

// Reads what a program was called with, by the program's table of options. Adds --help, which is made from
// that table, and --version.
//
// Arguments and values are bytes, whatever the locale: file names have any encoding or none.
class CommandLine {
public:
    struct Option {
        const char* name; // without the dashes
        const char* description;
        const char* valueName = nullptr; // in the help; null for an option without a value
        bool isRepeatable = false;       // else a second value is an error
    };
    struct Pair {
        const char* option;
        const char* other;
    };
    struct Program {
        const char* name;
        const char* summary; // one sentence or a few
        std::vector<Option> options;
        std::vector<Pair> exclusions = {};     // of each pair, one option would be ignored
        std::vector<Pair> dependencies = {};   // the first does nothing without the other
        const char* argumentsSyntax = nullptr; // "FILE..." in the help; null takes no arguments but options
        const char* argumentsDescription = nullptr;
    };
    // What to print instead of running, and the exit status.
    struct EarlyExit {
        // Prints the text, on standard error if it is an error. Returns the status.
        int print() const;

        int status;
        std::string text;
    };

    static constexpr int kWrongUsage = 2;

    explicit CommandLine(Program program);

    // Reads the arguments, the name of the program first. Returns an exit for --help, --version and whatever
    // the table does not allow.
    std::optional<EarlyExit> parse(int count, const char* const* arguments);
    EarlyExit wrongUsage(const std::string& error) const;

    bool isSet(const char* option) const { return _parser.isSet(QLatin1String(option)); }
    // Absent when the option is.
    std::optional<std::string> value(const char* option) const;
    std::vector<std::string> values(const char* option) const;
    std::vector<std::string> arguments() const;

private:
    std::string help() const;
    // Returns the rule of the table that the arguments break; empty if none.
    std::string fault() const;

    Program _program;
    QCommandLineParser _parser;
};

} // namespace orvex
