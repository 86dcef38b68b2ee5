#include "Timeline.h"

#include "Array.h"
#include "Dictionary.h"
#include "TimelineCsv.h"

#include <gtest/gtest.h>

#include <sstream>

namespace orvex::test {
namespace {

// What a timeline says of displays in turn: "path|key=text", "path|key gone", a line for each sample.
std::string followed(const std::vector<Value>& displays, const std::vector<std::string>& paths = {})
{
    class Lines final : public TimelineSink {
    public:
        void sample(Date) override { text += text.empty() ? "" : "\n"; }
        void addRow(std::size_t number, const TimelineRow& row) override
        {
            EXPECT_EQ(number, _rows.size());
            _rows.push_back(row.path + '|' + row.key);
        }
        void set(std::size_t number, const std::string& value) override
        {
            text += ' ' + _rows.at(number) + '=' + value;
        }
        void clear(std::size_t number) override { text += ' ' + _rows.at(number) + " gone"; }

        std::string text;

    private:
        std::vector<std::string> _rows;
    };
    TimelineFields fields(paths);
    Lines lines;
    Timeline timeline(fields, lines);
    for (const Value& display : displays)
        timeline.sample({}, display);
    return lines.text;
}

Value cell(const char* id, const char* level)
{
    return Dictionary::make({{"Physical Cell ID", id}, {"RSRP", level}});
}
Value cells(const char* channel, std::initializer_list<Value> list)
{
    return Dictionary::make({{"Neighbor Measurements", Dictionary::make({{"E-ARFCN", channel}})},
        {"Neighbor Cells List", Array::make(list)}});
}

TEST(Timeline, SaysWhatChanged)
{
    const auto rows = [](std::initializer_list<Dictionary::Entry> entries) {
        return Value(Dictionary::make({{"S", Dictionary::make(entries)}}));
    };
    const Value sorted = Dictionary::make({{"_sorted", ""}, {"2;b", "x"}, {"1;b", "y"}, {"0;a", "z"}});
    const struct {
        const char* name;
        std::vector<Value> displays;
        const char* changes;
    } cases[] = {
        {"rows come, change and stay",
            {rows({{"a", "1"}, {"b", ""}}), rows({{"a", "2"}, {"b", ""}}), rows({{"a", "2"}, {"b", "3"}})},
            " /S/a|=1 /S/b|=\n /S/a|=2\n /S/b|=3"},
        {"rows go and come again with their number",
            {rows({{"a", "1"}, {"b", "2"}}), rows({{"b", "2"}}), rows({{"b", Value()}, {"a", "1"}}), Value()},
            " /S/a|=1 /S/b|=2\n /S/a| gone\n /S/b| gone /S/a|=1\n /S/a| gone"},
        {"a text becomes a container and back",
            {Dictionary::make({{"S", "none"}}), rows({{"a", "1"}}), Dictionary::make({{"S", "none"}})},
            " /S|=none\n /S| gone /S/a|=1\n /S/a| gone /S|=none"},
        {"other values are unknown", {rows({{"a", 1}})}, " /S/a|=(unknown)"},
        {"names of a sorted dictionary, in its order", {sorted}, " /b (2)|=x /b|=y /a|=z"},
        {"one path, two rows", {Dictionary::make({{"a/b", "1"}, {"a", Dictionary::make({{"b", "2"}})}})},
            " /a/b|=1 /a/b|(2)=2"},
    };
    for (const auto& [name, displays, changes] : cases)
        EXPECT_EQ(followed(displays), changes) << name;
}

TEST(Timeline, FollowsElementsByWhatTheyShow)
{
    const auto context = [](const char* id, const char* state) {
        return Value(Dictionary::make({{"Context", Dictionary::make({{"State", state}, {"Context ID", id}})},
            {"Name Servers", Array::make({"192.0.2.1"})}}));
    };
    const auto pilots = [](std::initializer_list<Dictionary::Entry> entries) {
        return Value(
            Dictionary::make({{"1x Active Set", Dictionary::make({{"Pilots", Dictionary::make(entries)}})}}));
    };
    const struct {
        const char* name;
        std::vector<Value> displays;
        const char* changes;
    } cases[] = {
        {"a cell at another place",
            {cells("", {cell("7", "-80"), cell("9", "-90")}), cells("", {cell("9", "-89"), cell("7", "-80")}),
                cells("", {cell("9", "-89")})},
            " /Neighbor Measurements/E-ARFCN|="
            " /Neighbor Cells List/*/Physical Cell ID|Physical Cell ID 7=7"
            " /Neighbor Cells List/*/RSRP|Physical Cell ID 7=-80"
            " /Neighbor Cells List/*/Physical Cell ID|Physical Cell ID 9=9"
            " /Neighbor Cells List/*/RSRP|Physical Cell ID 9=-90\n"
            " /Neighbor Cells List/*/RSRP|Physical Cell ID 9=-89\n"
            " /Neighbor Cells List/*/Physical Cell ID|Physical Cell ID 7 gone"
            " /Neighbor Cells List/*/RSRP|Physical Cell ID 7 gone"},
        {"elements without identity", {Array::make({"a", Array::make({"b"})})}, " /*|0=a /*/*|1; 0=b"},
        {"identity in an inner dictionary",
            {Array::make({context("5", "on")}), Array::make({context("6", "on")})},
            " /*/Context/State|Context ID 5=on /*/Context/Context ID|Context ID 5=5"
            " /*/Name Servers/*|Context ID 5; 0=192.0.2.1\n"
            " /*/Context/State|Context ID 5 gone /*/Context/Context ID|Context ID 5 gone"
            " /*/Name Servers/*|Context ID 5; 0 gone"
            " /*/Context/State|Context ID 6=on /*/Context/Context ID|Context ID 6=6"
            " /*/Name Servers/*|Context ID 6; 0=192.0.2.1"},
        {"one cell under several names",
            {Array::make({Dictionary::make({{"U ARFCN", "10588"}, {"PSC", "57"}})}),
                Array::make(
                    {Dictionary::make({{"Downlink Frequency", "10588"}, {"Scrambling Code", "57"}})})},
            " /*/U ARFCN|Scrambling Code 57, UARFCN 10588=10588 /*/PSC|Scrambling Code 57, UARFCN 10588=57\n"
            " /*/U ARFCN|Scrambling Code 57, UARFCN 10588 gone /*/PSC|Scrambling Code 57, UARFCN 10588 gone"
            " /*/Downlink Frequency|Scrambling Code 57, UARFCN 10588=10588"
            " /*/Scrambling Code|Scrambling Code 57, UARFCN 10588=57"},
        {"a cell whose identity is decoded later",
            {Array::make({Dictionary::make({{"ARFCN", "24"}})}),
                Array::make({Dictionary::make({{"ARFCN", "24"}, {"BSIC", "11"}})})},
            " /*/ARFCN|ARFCN 24=24\n /*/ARFCN|ARFCN 24 gone"
            " /*/ARFCN|BSIC 11, ARFCN 24=24 /*/BSIC|BSIC 11, ARFCN 24=11"},
        {"pilots, and their fingers",
            {pilots({{"_sorted", ""}, {"0;12", "a"}}),
                pilots({{"_sorted", ""}, {"0;44", "b"}, {"1;12", "a"}, {"2;44", "c"}})},
            " /1x Active Set/Pilots/*|Pilot 12=a\n"
            " /1x Active Set/Pilots/*|Pilot 44=b /1x Active Set/Pilots/*|Pilot 44 (2)=c"},
    };
    for (const auto& [name, displays, changes] : cases)
        EXPECT_EQ(followed(displays), changes) << name;

    // The same cell number on another channel is another cell, and twins are told apart.
    EXPECT_EQ(followed({cells("1300", {cell("7", "-80")}), cells("6300", {cell("7", "-80")}),
                           cells("6300", {cell("7", "-80"), cell("7", "-75")})},
                  {"/Neighbor Cells List/*/RSRP"}),
        " /Neighbor Cells List/*/RSRP|Physical Cell ID 7, E-ARFCN 1300=-80\n"
        " /Neighbor Cells List/*/RSRP|Physical Cell ID 7, E-ARFCN 1300 gone"
        " /Neighbor Cells List/*/RSRP|Physical Cell ID 7, E-ARFCN 6300=-80\n"
        " /Neighbor Cells List/*/RSRP|Physical Cell ID 7, E-ARFCN 6300 (2)=-75");
}

TEST(Timeline, FollowsTheFieldsAlone)
{
    const Value display = Dictionary::make({{"A", Dictionary::make({{"x/y", "1"}, {"z", "2"}})},
        {"L", Array::make({cell("7", "a"), cell("9", "b")})}});
    const struct {
        std::vector<std::string> paths;
        const char* changes;
    } cases[] = {
        {{"/"},
            " /A/x/y|=1 /A/z|=2 /L/*/Physical Cell ID|Physical Cell ID 7=7 /L/*/RSRP|Physical Cell ID 7=a"
            " /L/*/Physical Cell ID|Physical Cell ID 9=9 /L/*/RSRP|Physical Cell ID 9=b"},
        {{"/A/x/y", "/A/x/*"}, " /A/x/y|=1"},
        {{"/*/z", "/A/"}, " /A/x/y|=1 /A/z|=2"},
        {{"/L/1/RSRP"}, " /L/*/RSRP|Physical Cell ID 9=b"},
        {{"/L/RSRP", "/A/x", "/AA", "A/zz", "/*/*/*/*"}, ""},
    };
    for (const auto& [paths, changes] : cases)
        EXPECT_EQ(followed({display}, paths), changes) << paths.front();

    // What is wanted of a place goes with the place, not with the cell.
    EXPECT_EQ(followed({Array::make({cell("7", "a"), cell("9", "b")}),
                           Array::make({cell("9", "c"), cell("7", "d")})},
                  {"/0/RSRP", "/1/Physical Cell ID"}),
        " /*/RSRP|Physical Cell ID 7=a /*/Physical Cell ID|Physical Cell ID 9=9\n"
        " /*/Physical Cell ID|Physical Cell ID 9 gone /*/RSRP|Physical Cell ID 9=c"
        " /*/RSRP|Physical Cell ID 7 gone /*/Physical Cell ID|Physical Cell ID 7=7");

    TimelineFields fields({"/A", "/L/*/RSRQ", "/B"});
    std::ostringstream stream;
    TimelineCsv sink(stream);
    Timeline(fields, sink).sample({}, display);
    EXPECT_EQ(fields.missing(), (std::vector<std::string>{"/L/*/RSRQ", "/B"}));
}

TEST(TimelineCsv, QuotesWhatTheFormatNeeds)
{
    std::ostringstream stream;
    TimelineCsv csv(stream);
    csv.sample({1'795'356'871.9996}); // rounds up to a whole second
    csv.addRow(0, {"/Cell, serving/Level", ""});
    csv.addRow(1, {"/L/*", "Name \"x\""});
    csv.set(0, "-75.50 dBm");
    csv.set(1, "a\nb");
    csv.sample({1'795'356'874.05});
    csv.clear(0);
    csv.set(1, "");
    EXPECT_EQ(stream.str(),
        "time,path,key,text,number,unit\r\n"
        "2026-11-22T14:14:32.000Z,\"/Cell, serving/Level\",,-75.50 dBm,-75.5,dBm\r\n"
        "2026-11-22T14:14:32.000Z,/L/*,\"Name \"\"x\"\"\",\"a\nb\",,\r\n"
        "2026-11-22T14:14:34.050Z,\"/Cell, serving/Level\",,,,\r\n"
        "2026-11-22T14:14:34.050Z,/L/*,\"Name \"\"x\"\"\",\"\",,\r\n");
}

} // namespace
} // namespace orvex::test
