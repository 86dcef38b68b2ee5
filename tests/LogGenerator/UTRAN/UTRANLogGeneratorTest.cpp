#include "UTRAN/UTRANLogGenerator.h"

#include "GeneratorFixture.h"
#include "PacketText.h"

namespace orvex::test {
namespace {

class UTRANLogGeneratorTest : public GeneratorFixture { };

TEST_F(UTRANLogGeneratorTest, TakesTheFirstTemplateThatMentionsUTRAN)
{
    RecordingLog log;
    resources.templates["LTE"] = Dictionary::make({{"RRC Info", Dictionary::make()}});
    const auto without = UTRANLogGenerator::generator(environment());
    EXPECT_EQ(without->templateError(state), "MRL_UTRAN2.plist: missing");
    EXPECT_TRUE(log.take().empty()) << "nothing was set up";
    EXPECT_EQ(shown(*without->getStartCommand()),
        "SetState=Streaming, SetMarlinLogCodes=[], SetKoratExtraCodes=[]");
    without->updateState(state, packet(0xD0E0, {1, 3}));
    EXPECT_TRUE(state["Display"].isNull());
    EXPECT_EQ(log.take(), Lines{"<3>Cannot load template for display"});

    resources.templates["A_utrANx"] = resources.templates["LTE"];
    resources.templates["B_UTRAN"] = Dictionary::make();
    const auto generator = UTRANLogGenerator::generator(environment());
    EXPECT_EQ(log.lines.back(), "<3>Created UTRANLogGenerator object");
    EXPECT_EQ(generator->templateError(state), "");
    generator->updateState(state, packet(0xD0E0, {1, 3}));
    EXPECT_EQ(display(), "RRC Info={State=Cell DCH}");
}

} // namespace
} // namespace orvex::test
