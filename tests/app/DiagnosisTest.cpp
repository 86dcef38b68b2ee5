#include "Diagnosis.h"

#include "SessionFixture.h"

#include <gtest/gtest.h>

#include <cerrno>
#include <filesystem>
#include <sys/stat.h>

namespace orvex::test {
namespace {

struct DiagnosisTest : testing::Test, SessionFixture {
    // The last finding, after the number of those before it: "2 fault: ...".
    std::string lastFinding()
    {
        const auto findings = Diagnosis(platform().session, directory).run();
        return std::to_string(findings.size() - 1) + (findings.back().isFault ? " fault: " : " ok: ")
            + findings.back().text;
    }

    const std::string path = testing::TempDir() + "orvex-diagnosis-" + std::to_string(::getpid());
    const PortDirectory directory{path};
};

TEST_F(DiagnosisTest, NamesTheFirstFault)
{
    const struct {
        TelephonyFaults faults;
        const char* finding;
    } cases[] = {
        {{}, "5 ok: Its template can be read. A session comes up."},
        {{.localPortFails = true},
            "1 fault: The socket of the log channel cannot be created; the system log says why."},
        {{.localPortExists = true}, "1 fault: Another monitor is running and has the log channel."},
        {{.serviceIsAbsent = true},
            "2 fault: The telephony service is not running: nobody listens at org.orvex.Korat."},
        {{.channelError = 35}, "3 fault: The telephony service refuses a log channel: error 35."},
        {{.remotePortName = std::nullopt},
            "3 fault: The telephony service grants a log channel but names no port for it."},
        {{.remotePortFails = true},
            "3 fault: Nobody listens at the port that the telephony service names, org.orvex.Korat.Test."},
        {{.requestStatus = RemotePort::Status::sendTimeout},
            "4 fault: The telephony service does not take the question for its technology."},
        {{.rawReply = ""}, "4 fault: The telephony service does not answer the question for its technology."},
        {{.rawReply = "xyz"},
            "4 fault: The telephony service gives a strange answer to the question for its technology."},
        {{.technology = "MRL\n5G"},
            "4 fault: The telephony service names the technology MRL\\n5G, which Orvex does not know. It "
            "knows "
            "IFX, MRL_GSM, MRL_CDMA, MRL_LTE, MRL_UTRAN2."},
    };
    for (const auto& [faults, finding] : cases) {
        static_cast<TelephonyFaults&>(telephony) = faults;
        EXPECT_EQ(lastFinding(), finding);
    }
    static_cast<TelephonyFaults&>(telephony) = {};
    resources.templates.clear();
    EXPECT_EQ(lastFinding().substr(0, 8), "5 fault:");
    EXPECT_NE(lastFinding().find("LTE"), std::string::npos);
}

TEST_F(DiagnosisTest, LooksAtThePortDirectoryFirst)
{
    std::filesystem::create_directory(path);
    ::chmod(path.c_str(), 0755);
    EXPECT_EQ(lastFinding(),
        "0 fault: The port directory " + path + " cannot be used: refused, it is open to other users.");
    std::filesystem::remove(path);
}

} // namespace
} // namespace orvex::test
