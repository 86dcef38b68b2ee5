#pragma once

#include "PcapWriter.h"
#include "Programs.h"

#include <fstream>
#include <iterator>

namespace orvex::test {

// Runs orvex-decode on files in a folder of its own.
class DecodeProgram : public testing::Test {
protected:
    static Result decode(const QStringList& arguments) { return run(ORVEX_DECODE, arguments); }

    QString capture(const char* file, const std::vector<Bytes>& messages) const
    {
        PcapWriter writer(path(file));
        for (const Bytes& message : messages)
            writer.write(message, kTime);
        return name(file);
    }
    std::string path(const char* name) const { return folder.path(name); }
    QString name(const char* file) const { return folder.name(file); }
    std::string contentsOf(const char* name) const
    {
        std::ifstream stream(path(name), std::ios::binary);
        return {std::istreambuf_iterator<char>(stream), {}};
    }

    static constexpr std::chrono::microseconds kTime{1'700'000'000'654'321};

    const ProgramFolder folder{};
};

} // namespace orvex::test
