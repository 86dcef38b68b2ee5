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

    GSMLogGenerator generator{environment()};
};

// A property list of a tree as text: "{A=x, B=[h, y]}".
std::string listOf(std::string_view& tree)
{
    const bool isDictionary = tree.starts_with('{');
    if (!isDictionary && !tree.starts_with('[')) {
        const std::string_view word = tree.substr(0, tree.find_first_of(",]}"));
        tree.remove_prefix(word.size());
        return "<string>" + std::string(word) + "</string>";
    }
    std::string result;
    tree.remove_prefix(1);
    while (!tree.starts_with('}') && !tree.starts_with(']')) {
        if (tree.starts_with(", "))
            tree.remove_prefix(2);
        if (isDictionary) {
            result += "<key>" + std::string(1, tree[0]) + "</key>";
            tree.remove_prefix(2);
        }
        result += listOf(tree);
    }
    tree.remove_prefix(1);
    return isDictionary ? "<dict>" + result + "</dict>" : "<array>" + result + "</array>";
}

TEST_F(GSMLogGeneratorTest, SimplifiesTheNesting)
{
    const struct {
        std::string_view message;
        const char* display;
    } cases[] = {
        {"x", "x"}, {"{A=x}", "{A=x}"}, // the top level stays
        {"{A={B=x}}", "{A=x}"}, {"{A={B={C={D=x}}}}", "{A=x}"}, {"{A={B=x, C=y}}", "{A={B=x, C=y}}"},
        {"{A={B={C=x, D=y}}}", "{A={C=x, D=y}}"}, {"{A={}}", "{A={}}"},
        {"{A=[h, x, y]}", "{A=[x | y]}"}, // without its first
        {"{A=[h]}", "{A=[]}"}, {"{A=[]}", "{A=[]}"}, {"{A=[h, {B=x}]}", "{A=[x]}"},
        {"{A={B=[h, x]}}", "{A=[x]}"}, {"[h, [h, x]]", "[[x]]"},
        {"{A={B=[h], C=x}}", "{A={B=[], C=x}}"}, // what is left out counts
    };
    for (auto [tree, expected] : cases) {
        generator.updateState(state, message(listOf(tree)));
        EXPECT_EQ(shown(generator.generateLogUsingState(state)), expected);
    }
    const Value only = Dictionary::make({{"A", "x"}});
    EXPECT_EQ(generator.canCollapse(only), Value("x"));
    EXPECT_TRUE(generator.canCollapse("x").isNull());
}

TEST_F(GSMLogGeneratorTest, EachMessageReplacesTheDisplay)
{
    EXPECT_TRUE(generator.generateLogUsingState(state).isNull());
    generator.updateState(state, message("<dict><key>A</key><string>first</string></dict>"));
    state.set("ExtraInfo", Dictionary::make({{"of", "another"}}));
    std::string_view second = "{B=[h, x]}";
    generator.updateState(state, message(listOf(second)));
    EXPECT_EQ(shown(generator.generateLogUsingState(state)), "{B=[x]}");
    EXPECT_EQ(shown(state["DisplayState"]), "{B=[h | x]}") << "as it came";
    EXPECT_EQ(shown(state["ExtraInfo"]), "{}");

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
        {"<dict><key>A</key><real>1</real></dict>", "Unknown object of type real encountered", 78},
        {"<array><string>h</string><true/></array>", "Unknown object of type boolean encountered", 78},
        {"<array><true/><data>AAAA</data></array>", "Unknown object of type data encountered", 78},
        {"<array><true/><date>2020-01-01T00:00:00Z</date></array>", "Unknown object of type date encountered",
            78},
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
    EXPECT_NO_THROW(generator.updateState(state, message("<array><true/></array>")))
        << "nobody looks at a first element";
    EXPECT_EQ(*generator.getStartCommand(), Dictionary({{"SetState", "Streaming"}}));
}

} // namespace
} // namespace orvex::test
