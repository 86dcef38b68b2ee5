// What each capture logs and shows, message by message, against captures/TECHNOLOGY.txt: the first ten texts
// of each row, and the first ten of log lines that differ in their numbers alone. To record the files anew,
// after a change that is meant to show, run this test with ORVEX_RECORD=1 and review the difference.

#include "Captures.h"
#include "GeneratorFixture.h"

#include "FileStorage.h"

#include <cstdlib>
#include <cstring>
#include <fstream>
#include <map>
#include <regex>
#include <set>
#include <sstream>

namespace orvex::test {
namespace {

// What is looked at of a list: its length, its first two records and its last.
DictionaryRef endsOf(const Array& list)
{
    auto rows = Dictionary::make({{"count", std::to_string(list.size())}});
    for (std::size_t i = 0; i < list.size(); ++i) {
        if (i < 2 || i + 1 == list.size())
            rows->set(i < 2 ? std::to_string(i) : "last", list[i]);
    }
    return rows;
}

class CaptureTrees : public GeneratorFixture, public testing::WithParamInterface<const char*> {
protected:
    // A line for this container and for each one in it that shows something new: the new texts, or all of
    // them when its rows, or their order, are new.
    std::string newTexts(const std::string& path, const Dictionary& rows)
    {
        std::string names;
        std::string all;
        std::string changed;
        std::string inside;
        for (const auto& [name, value] : rows) {
            names += name + ",";
            const auto list = value.array();
            if (const auto container = list ? endsOf(*list) : value.dictionary()) {
                inside += newTexts(path + "/" + name, *container);
                continue;
            }
            const std::string entry = name + "=" + shown(value);
            all += (all.empty() ? " " : ", ") + entry;
            if (isNew(path + "/" + name, entry))
                changed += (changed.empty() ? " " : ", ") + entry;
        }
        const std::string& line = isNew(path, names) ? all : changed;
        return (line.empty() ? "" : path + ":" + line + "\n") + inside;
    }

    // The log lines since the last call that are new.
    std::string newLines()
    {
        static const std::regex kAddress("0x[0-9a-f]{6,}");
        std::string result;
        Lines lines = log.take();
        for (std::string& line : lines) {
            if (line.find("0x") != std::string::npos)
                line = std::regex_replace(line, kAddress, "0x...");
            std::string pattern = line;
            std::erase_if(pattern, [](char each) { return std::strchr("0123456789.-", each) != nullptr; });
            if (isNew(pattern, line))
                result += line + (line.ends_with('\n') ? "" : "\n");
        }
        return result;
    }

    RecordingLog log;
    const ConsoleLines console{&log.lines};

private:
    bool isNew(const std::string& place, const std::string& text)
    {
        std::set<std::string>& texts = _known[place];
        return texts.size() < 10 && texts.insert(text).second;
    }

    std::map<std::string, std::set<std::string>> _known;
};

INSTANTIATE_TEST_SUITE_P(, CaptureTrees, testing::ValuesIn(kTechnologies),
    [](const auto& each) { return std::string(each.param); });

TEST_P(CaptureTrees, ShowWhatTheyShowed)
{
    const FileResources templates(ORVEX_RESOURCES);
    auto generator = LogGenerator::generatorFromTechnology(GetParam(), {templates, clock, {}});
    std::string all = newLines();
    const DictionaryRef command = generator->getStartCommand();
    for (const auto& [key, value] : *command) {
        all += key + ":" + (value.string() ? " " + *value.string() : "");
        if (const auto codes = value.array()) {
            for (const Value& code : *codes)
                all += text(" %04X", static_cast<unsigned>(*code.integer()));
        }
        all += "\n";
    }
    int number = 0;
    for (const Bytes& message : captureOf(GetParam())) {
        generator->updateState(state, message);
        ++number;
        const std::string lines = newLines() + newTexts("", *state["Display"].dictionary());
        all += lines.empty() ? "" : text("message %d\n", number) + lines;
    }
    generator.reset();
    all += "end\n" + newLines();

    const std::string path = text(ORVEX_TESTS "/LogGenerator/captures/%s.txt", GetParam());
    if (std::getenv("ORVEX_RECORD"))
        std::ofstream(path) << all;
    std::stringstream expected;
    expected << std::ifstream(path).rdbuf();
    EXPECT_EQ(all, expected.str());
}

} // namespace
} // namespace orvex::test
