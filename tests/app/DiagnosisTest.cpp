#include "Diagnosis.h"

#include "SessionFixture.h"

#include <gtest/gtest.h>

namespace orvex::test {
namespace {

struct DiagnosisTest : testing::Test, SessionFixture { };

// What koratd has no fault for; tests/tools/transcripts/sessions.txt has the others.
TEST_F(DiagnosisTest, NamesTheFirstFault)
{
    const std::pair<TelephonyFaults, const char*> cases[] = {
        {{.remotePortFails = true},
            "Nobody listens at the port that the telephony service names, org.orvex.Korat.Test."},
        {{.requestStatus = RemotePort::Status::sendTimeout},
            "The telephony service does not take the question for its technology."},
        {{.technology = "MRL\n5G"},
            "The telephony service names the technology MRL\\n5G, which Orvex does not know. It knows IFX, "
            "MRL_GSM, MRL_CDMA, MRL_LTE, MRL_UTRAN2."},
    };
    const PortDirectory directory(testing::TempDir() + "orvex-diagnosis");
    for (const auto& [faults, finding] : cases) {
        static_cast<TelephonyFaults&>(telephony) = faults;
        const auto findings = Diagnosis(platform().session, directory).run();
        EXPECT_TRUE(findings.back().isFault);
        EXPECT_EQ(findings.back().text, finding);
    }
}

} // namespace
} // namespace orvex::test
