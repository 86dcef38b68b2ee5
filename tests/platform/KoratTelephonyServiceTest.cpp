#include "KoratTelephonyService.h"

#include "PropertyList.h"
#include "TelephonyConstants.h"

#include "Dictionary.h"
#include "PortTest.h"
#include "PropertyListForms.h"

#include <cerrno>

namespace orvex {
namespace {

using test::bytesOf;
using test::ServedPort;
using test::xmlList;
using testing::ElementsAre;
using testing::HasSubstr;
using testing::IsEmpty;

class KoratTelephonyServiceTest : public test::PortTest { };

TEST_F(KoratTelephonyServiceTest, AsksForTheLogChannel)
{
    KoratTelephonyService telephony(ports);
    EXPECT_FALSE(telephony.connect({})) << "nobody is there";

    std::int32_t askedId = 0;
    std::string asked;
    ServedPort service(directory(), telephony::kServicePortName,
        [&](std::int32_t messageId, ByteView data) -> std::optional<Bytes> {
            askedId = messageId;
            asked.assign(data.begin(), data.end());
            return bytesOf(xmlList("<dict><key>ErrorDomain</key><integer>1</integer><key>ErrorCode</key>"
                                   "<integer>0</integer><key>RemotePortName</key><string>b</string></dict>"));
        });
    const auto reply = telephony.connect({})->createNetworkMonitorLogChannel("my.port");
    EXPECT_EQ(reply.errorDomain, 1);
    EXPECT_EQ(reply.errorCode, 0);
    EXPECT_EQ(reply.remotePortName, "b");
    EXPECT_EQ(askedId, 1);
    EXPECT_THAT(asked,
        HasSubstr("<key>Request</key>\n\t<string>NetworkMonitorCreateLogChannel</string>\n"
                  "\t<key>PortName</key>\n\t<string>my.port</string>"));
    EXPECT_THAT(log.take(), IsEmpty());
}

TEST_F(KoratTelephonyServiceTest, TellsWhyThereIsNoChannel)
{
    const struct {
        const char* name;
        std::optional<Bytes> reply;
        long code;
        const char* line; // null when the service itself refused
    } cases[] = {
        {"refused", bytesOf(xmlList("<dict><key>ErrorCode</key><integer>-16</integer></dict>")), -16,
            nullptr},
        {"no reply", std::nullopt, ETIMEDOUT, "no reply in time"},
        {"no list", bytesOf("huh"), EPROTO, "text outside of an element"},
        {"no dictionary", bytesOf(xmlList("<array/>")), EPROTO, "no error code"},
        {"no code", bytesOf(xmlList("<dict><key>RemotePortName</key><string>b</string></dict>")), EPROTO,
            "no error code"},
        {"code of wrong kind", bytesOf(xmlList("<dict><key>ErrorCode</key><string>0</string></dict>")),
            EPROTO, "no error code"},
    };
    for (const auto& test : cases) {
        ServedPort service(directory(), telephony::kServicePortName, [&](auto, auto) { return test.reply; });
        KoratTelephonyService telephony(ports);
        const auto reply = telephony.connect({})->createNetworkMonitorLogChannel("my.port");
        EXPECT_EQ(reply.errorCode, test.code) << test.name;
        EXPECT_FALSE(reply.remotePortName) << test.name;
        if (test.line)
            EXPECT_THAT(log.take(), ElementsAre(HasSubstr(test.line))) << test.name;
        else
            EXPECT_THAT(log.take(), IsEmpty()) << test.name;
    }
}

} // namespace
} // namespace orvex
