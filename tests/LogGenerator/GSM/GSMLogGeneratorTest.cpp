#include "GSM/GSMLogGenerator.h"

#include "GeneratorFixture.h"
#include "PropertyListForms.h"

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
        {"{A={B={C={D=x}}}}", "{A=x}"}, {"{A={B={C=x, D=y}}}", "{A={C=x, D=y}}"}, {"{A={}}", "{A={}}"},
        {"{A=[h, x, y]}", "{A=[x | y]}"}, // without its first
        {"{A=[]}", "{A=[]}"}, {"{A=[h, {B=x}]}", "{A=[x]}"}, {"[h, [h, x]]", "[[x]]"},
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
    generator.updateState(state, message("<string>first</string>"));
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
    const std::string place = "LogGenerator/GSM/GSMLogGenerator, line ";
    const std::string unknown = " encountered (processObject:, " + place + "78)";
    const std::pair<Bytes, std::string> cases[] = {
        {message("<integer>1</integer>"), "Unknown object of type integer" + unknown},
        {message("<dict><key>A</key><real>1</real></dict>"), "Unknown object of type real" + unknown},
        {message("<array><string>h</string><true/></array>"), "Unknown object of type boolean" + unknown},
        {message("<array><true/><data>AAAA</data></array>"), "Unknown object of type data" + unknown},
        {binaryList({{0xD1, 1, 2}, {0x51, 'A'}, {0x80, 7}}), "Unknown object of type UID" + unknown},
        {binaryList({{0xD1, 1, 2}, {0x51, 'A'}, {0xC1, 1}}), "Unknown object of type set" + unknown},
        {message("<dict>"), "Could not deserialize the object (updateState:withData:, " + place + "90)"},
    };
    for (const auto& [bytes, text] : cases) {
        try {
            generator.updateState(state, bytes);
            ADD_FAILURE() << text;
        } catch (const AssertionFailure& failure) {
            EXPECT_EQ(failure.what(), text);
        }
    }
    EXPECT_NO_THROW(generator.updateState(state, message("<array><true/></array>")))
        << "nobody looks at a first element";
    EXPECT_EQ(*generator.getStartCommand(), Dictionary({{"SetState", "Streaming"}}));
}

} // namespace
} // namespace orvex::test
