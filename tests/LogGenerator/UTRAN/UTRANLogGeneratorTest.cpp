#include "UTRAN/UTRANLogGenerator.h"

#include "GeneratorFixture.h"
#include "PacketText.h"

#include <gmock/gmock.h>

namespace orvex::test {
namespace {

class UTRANLogGeneratorTest : public GeneratorFixture {
public:
    RecordingLog log;
};

TEST_F(UTRANLogGeneratorTest, TakesTheFirstTemplateThatMentionsUTRAN)
{
    resources.templates["A_utrANx"] = Dictionary::make({{"RRC Info", Dictionary::make()}});
    resources.templates["B_UTRAN"] = Dictionary::make();
    resources.templates["AAA"] = Dictionary::make();
    const auto generator = UTRANLogGenerator::generator(environment());
    EXPECT_EQ(log.lines.back(), "<3>Created UTRANLogGenerator object");
    generator->updateState(state, packet(0xD0E0, {1, 3}));
    EXPECT_EQ(*state["Display"].dictionary(),
        Dictionary({{"RRC Info", Dictionary::make({{"State", "Cell DCH"}})}}));
    EXPECT_EQ(*generator->getStartCommand(),
        Dictionary({{"SetState", "Streaming"},
            {"SetMarlinLogCodes", Array::make({0xD0E0, 0xD0E2, 0xD00A, 0xD00E, 0xD00C})},
            {"SetKoratExtraCodes", Array::make({1, 2, 0})}}));
}

TEST_F(UTRANLogGeneratorTest, WithoutATemplateItWantsNothingAndShowsNothing)
{
    resources.templates["LTE"] = Dictionary::make({{"RRC Info", Dictionary::make()}});
    const auto generator = UTRANLogGenerator::generator(environment());
    EXPECT_TRUE(log.take().empty()) << "nothing was set up";
    EXPECT_EQ(*generator->getStartCommand(),
        Dictionary({{"SetState", "Streaming"}, {"SetMarlinLogCodes", Array::make()},
            {"SetKoratExtraCodes", Array::make()}}));
    generator->updateState(state, packet(0xD0E0, {1, 3}));
    EXPECT_TRUE(generator->generateLogUsingState(state).isNull());
    EXPECT_THAT(log.take(), testing::Each("<3>Cannot load template for display"));
    EXPECT_TRUE(state["DisplayState"].isNull());
}

} // namespace
} // namespace orvex::test
