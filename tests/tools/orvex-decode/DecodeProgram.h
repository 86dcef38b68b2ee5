#pragma once

#include "PcapFile.h"
#include "Program.h"

#include <fstream>
#include <iterator>

namespace orvex::test {

// Runs orvex-decode on files in a folder of its own.
class DecodeProgram {
public:
    struct Result {
        int status;
        std::string output;
        std::string errors;
    };

    static Result decode(const QStringList& arguments)
    {
        const ProgramFolder folder;
        Program program(folder, ORVEX_DECODE, arguments);
        const int status = program.waitForEnd();
        return {status, program.output(), program.errors()};
    }

    std::string path(const char* name) const { return _folder.path(name); }
    QString name(const char* file) const { return QString::fromStdString(path(file)); }
    QString write(const char* file, const Bytes& bytes) const
    {
        return QString::fromStdString(writeFile(path(file), bytes));
    }

    static std::string contentsOf(const std::string& path)
    {
        std::ifstream stream(path, std::ios::binary);
        return {std::istreambuf_iterator<char>(stream), {}};
    }

private:
    ProgramFolder _folder;
};

} // namespace orvex::test
