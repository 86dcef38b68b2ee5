#include "GSM/GSMLogGenerator.h"

#include "CaseLines.h"
#include "GeneratorFixture.h"
#include "PropertyListForms.h"

namespace orvex::test {
namespace {

class GSMLogGeneratorTest : public GeneratorFixture {
public:
    static Bytes message(const std::string& inner) { return bytesOf(xmlList(inner)); }

    GSMLogGenerator generator{environment()};
};

TEST_F(GSMLogGeneratorTest, SimplifiesTheNestingOrEndsTheProcess)
{
    const auto outcomeOf = [this](const Bytes& bytes) {
        try {
            generator.updateState(state, bytes);
            return " -> " + shown(generator.generateLogUsingState(state));
        } catch (const AssertionFailure& failure) {
            return std::string(" !! ") + failure.what();
        }
    };
    for (const std::string& line : caseLines("LogGenerator/cases/IFX.txt")) {
        const std::string list = divided(divided(line, " -> ").first, " !! ").first;
        EXPECT_EQ(list + outcomeOf(message(list)), line);
    }
    for (const auto& [name, element] : {std::pair("UID", Bytes{0x80, 7}), {"set", Bytes{0xC1, 1}}}) {
        const Bytes list = binaryList({{0xD1, 1, 2}, {0x51, 'A'}, element});
        EXPECT_TRUE(outcomeOf(list).starts_with(std::string(" !! Unknown object of type ") + name)) << name;
    }
    EXPECT_EQ(*generator.getStartCommand(), Dictionary({{"SetState", "Streaming"}}));
    EXPECT_EQ(generator.canCollapse(Dictionary::make({{"A", "x"}})), Value("x"));
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

} // namespace
} // namespace orvex::test
