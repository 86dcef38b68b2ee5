#pragma once

#include "PcapWriter.h"
#include "Programs.h"

#include <fstream>
#include <iterator>
#include <optional>
#include <utility>

namespace orvex::test {

// The records of a table after its first line. An empty field without quotes is null.
inline std::vector<std::vector<std::optional<std::string>>> recordsOf(const std::string& csv)
{
    std::vector<std::vector<std::optional<std::string>>> records(1);
    std::optional<std::string> field;
    for (std::size_t i = csv.find('\n') + 1; i < csv.size(); ++i) {
        const bool ends = csv[i] == ',' || csv[i] == '\r';
        if (csv[i] == '"') {
            field.emplace();
            while (csv[++i] != '"' || csv[++i] == '"') // two are one
                *field += csv[i];
            --i;
        } else if (ends) {
            records.back().push_back(std::exchange(field, std::nullopt));
        } else if (csv[i] == '\n') {
            records.emplace_back();
        } else {
            field = field.value_or("") + csv[i];
        }
    }
    records.pop_back();
    return records;
}

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
