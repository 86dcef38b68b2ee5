#include "GSM/GSMLogGenerator.h"

#include "GeneratorFixture.h"
#include "PropertyList.h"
#include "PropertyListForms.h"

namespace orvex::test {
namespace {

class GSMLogGeneratorTest : public GeneratorFixture {
public:
    static Bytes message(const std::string& inner) { return bytesOf(xmlList(inner)); }

    GSMLogGenerator generator{environment()};
};

TEST_F(GSMLogGeneratorTest, SimplifiesTheNesting)
{
    const auto only = [](const char* key, const Value& value) { return Dictionary::make({{key, value}}); };
    const struct {
        Value message;
        const char* display;
    } cases[] = {
        {"x", "x"}, {only("A", "x"), "{A=x}"}, // the top level stays
        {only("A", only("B", only("C", "x"))), "{A=x}"},
        {only("A", only("B", Dictionary::make({{"C", "x"}, {"D", "y"}}))), "{A={C=x, D=y}}"},
        {only("A", Dictionary::make()), "{A={}}"},
        {only("A", Array::make({"h", "x", "y"})), "{A=[x | y]}"}, // without its first
        {only("A", Array::make()), "{A=[]}"}, {only("A", Array::make({"h", only("B", "x")})), "{A=[x]}"},
        {Array::make({"h", Array::make({"h", "x"})}), "[[x]]"},
        {only("A", Dictionary::make({{"B", Array::make({"h"})}, {"C", "x"}})),
            "{A={B=[], C=x}}"}, // what is left out counts
    };
    for (const auto& [message, expected] : cases) {
        generator.updateState(state, propertyListXML(message).value());
        EXPECT_EQ(shown(generator.generateLogUsingState(state)), expected);
    }
    EXPECT_EQ(generator.canCollapse(only("A", "x")), Value("x"));
    EXPECT_TRUE(generator.canCollapse("x").isNull());
}

TEST_F(GSMLogGeneratorTest, EachMessageReplacesTheDisplay)
{
    EXPECT_TRUE(generator.generateLogUsingState(state).isNull());
    generator.updateState(state, message("<string>first</string>"));
    state.set("ExtraInfo", Dictionary::make({{"of", "another"}}));
    generator.updateState(
        state, message("<dict><key>B</key><array><string>h</string><string>x</string></array></dict>"));
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
