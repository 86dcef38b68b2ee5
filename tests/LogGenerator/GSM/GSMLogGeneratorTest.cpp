#include "GSM/GSMLogGenerator.h"

#include "AssertionFailure.h"

#include "GeneratorFixture.h"
#include "TextFormat.h"

namespace orvex::test {
namespace {

class GSMLogGeneratorTest : public GeneratorFixture {
public:
    static Bytes message(const std::string& inner)
    {
        const std::string list = "<plist version=\"1.0\">" + inner + "</plist>";
        return {list.begin(), list.end()};
    }
    Value displayAfter(const std::string& inner)
    {
        generator.updateState(state, message(inner));
        return generator.generateLogUsingState(state);
    }

    GSMLogGenerator generator{environment()};
};

std::string dict(const std::vector<std::pair<const char*, std::string>>& entries)
{
    std::string result = "<dict>";
    for (const auto& [key, value] : entries)
        result += std::string("<key>") + key + "</key>" + value;
    return result + "</dict>";
}
std::string string(const std::string& text)
{
    return "<string>" + text + "</string>";
}
std::string array(const std::string& elements)
{
    return "<array>" + elements + "</array>";
}

TEST_F(GSMLogGeneratorTest, SimplifiesTheNesting)
{
    const auto x = string("x");
    const auto y = string("y");
    const auto h = string("h");
    const auto only = [](const Value& value) { return Value(Dictionary::make({{"A", value}})); };
    const struct {
        const char* name;
        std::string message;
        Value display;
    } cases[] = {
        {"text alone", x, "x"},
        {"top level stays", dict({{"A", x}}), only("x")},
        {"one entry collapses", dict({{"A", dict({{"B", x}})}}), only("x")},
        {"so does a chain", dict({{"A", dict({{"B", dict({{"C", dict({{"D", x}})}})}})}}), only("x")},
        {"two entries do not", dict({{"A", dict({{"B", x}, {"C", y}})}}),
            only(Dictionary::make({{"B", "x"}, {"C", "y"}}))},
        {"two entries under one", dict({{"A", dict({{"B", dict({{"C", x}, {"D", y}})}})}}),
            only(Dictionary::make({{"C", "x"}, {"D", "y"}}))},
        {"none does not", dict({{"A", dict({})}}), only(Dictionary::make())},
        {"array loses its first", dict({{"A", array(h + x + y)}}), only(Array::make({"x", "y"}))},
        {"and its only one", dict({{"A", array(h)}}), only(Array::make())},
        {"empty array", dict({{"A", array("")}}), only(Array::make())},
        {"entry within an array", dict({{"A", array(h + dict({{"B", x}}))}}), only(Array::make({"x"}))},
        {"array within an entry", dict({{"A", dict({{"B", array(h + x)}})}}), only(Array::make({"x"}))},
        {"array within an array", array(h + array(h + x)), Array::make({Array::make({"x"})})},
        {"what is left out counts", dict({{"A", dict({{"B", array(h)}, {"C", x}})}}),
            only(Dictionary::make({{"B", Array::make()}, {"C", "x"}}))},
    };
    for (const auto& [name, message, display] : cases)
        EXPECT_EQ(displayAfter(message), display) << name;
    EXPECT_EQ(generator.canCollapse(only("x")), Value("x"));
    EXPECT_TRUE(generator.canCollapse("x").isNull());
}

TEST_F(GSMLogGeneratorTest, EachMessageReplacesTheDisplay)
{
    EXPECT_TRUE(generator.generateLogUsingState(state).isNull());
    generator.updateState(state, message(dict({{"A", string("first")}})));
    state.set("ExtraInfo", Dictionary::make({{"of", "another"}}));
    EXPECT_EQ(displayAfter(dict({{"B", array(string("h") + string("x"))}})),
        Value(Dictionary::make({{"B", Array::make({"x"})}})));
    EXPECT_EQ(state["DisplayState"], Value(Dictionary::make({{"B", Array::make({"h", "x"})}})))
        << "as it came";
    EXPECT_EQ(state["ExtraInfo"], Value(Dictionary::make()));

    const auto saved = generator.getSaveContentsFromState(state);
    ASSERT_EQ(saved->size(), 2U);
    EXPECT_EQ((*(*saved)[1].dictionary())["Display"], state["Display"]);
    EXPECT_NE(saved, state["History"].array()) << "a list of its own";
    EXPECT_TRUE(generator.getSaveContentsFromState({})->isEmpty());
}

TEST_F(GSMLogGeneratorTest, OtherMessagesAreFatal)
{
    const char* unreadable = "Could not deserialize the object";
    std::string deep;
    for (int level = 0; level < 100'000; ++level)
        deep += "<array>";
    const struct {
        std::string message;
        std::string text;
        int line;
    } cases[] = {
        {"<integer>1</integer>", "Unknown object of type integer encountered", 78},
        {dict({{"A", dict({{"B", "<real>1</real>"}})}}), "Unknown object of type real encountered", 78},
        {array(string("h") + "<true/>"), "Unknown object of type boolean encountered", 78},
        {dict({{"A", "<data>AAAA</data>"}}), "Unknown object of type data encountered", 78},
        {dict({{"A", "<date>2020-01-01T00:00:00Z</date>"}}), "Unknown object of type date encountered", 78},
        {"<dict>", unreadable, 90},
        {deep, unreadable, 90},
    };
    for (const auto& [inner, text, line] : cases) {
        try {
            generator.updateState(state, message(inner));
            ADD_FAILURE() << text;
        } catch (const AssertionFailure& failure) {
            const char* method = line == 78 ? "processObject:" : "updateState:withData:";
            EXPECT_EQ(failure.what(),
                orvex::text(
                    "%s (%s, LogGenerator/GSM/GSMLogGenerator, line %d)", text.c_str(), method, line));
            EXPECT_STREQ(failure.file(), "LogGenerator/GSM/GSMLogGenerator");
            EXPECT_EQ(failure.line(), line);
        }
    }
    EXPECT_THROW(generator.updateState(state, {}), AssertionFailure);
    EXPECT_NO_THROW(generator.updateState(state, message(array("<true/>"))))
        << "nobody looks at a first element";
    EXPECT_EQ(*generator.getStartCommand(), Dictionary({{"SetState", "Streaming"}}));
}

} // namespace
} // namespace orvex::test
