#include "KoratTelephonyService.h"

#include "TelephonyConstants.h"

#include "PortTest.h"

#include <cerrno>

namespace orvex {
namespace {

using testing::ElementsAre;
using testing::HasSubstr;

class KoratTelephonyServiceTest : public test::PortTest { };

TEST_F(KoratTelephonyServiceTest, TellsWhyThereIsNoChannel)
{
    KoratTelephonyService telephony(ports);
    EXPECT_FALSE(telephony.connect({})) << "nobody is there";
    const std::string name = "<key>RemotePortName</key><string>b</string>";
    const struct {
        std::optional<std::string> reply;
        long code;
        const char* line;
    } cases[] = {
        {std::nullopt, ETIMEDOUT, "no reply in time"},
        {"huh", EPROTO, "text outside of an element"},
        {test::xmlList("<array/>"), EPROTO, "no error code"},
        {test::xmlList("<dict><key>ErrorCode</key><string>0</string>" + name + "</dict>"), EPROTO,
            "no error code"},
    };
    for (const auto& each : cases) {
        test::ServedPort service(directory(), telephony::kServicePortName, [&](auto, auto) {
            return each.reply ? std::optional(test::bytesOf(*each.reply)) : std::nullopt;
        });
        const auto reply = telephony.connect({})->createNetworkMonitorLogChannel("my.port");
        EXPECT_EQ(reply.errorCode, each.code) << each.line;
        EXPECT_FALSE(reply.remotePortName) << each.line;
        EXPECT_THAT(log.take(), ElementsAre(HasSubstr(each.line)));
    }
}

} // namespace
} // namespace orvex
