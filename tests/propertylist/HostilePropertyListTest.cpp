#include "PropertyList.h"

#include "PropertyListForms.h"

#include <gmock/gmock.h>

namespace orvex {
namespace {

using test::binaryList;
using test::bytesOf;
using test::xmlList;
using testing::HasSubstr;

std::string repeated(std::string_view text, std::size_t count)
{
    std::string result;
    for (std::size_t i = 0; i < count; ++i)
        result += text;
    return result;
}

TEST(HostilePropertyList, XMLBeyondTheLimitsIsRefusedWithTheReason)
{
    const std::pair<const char*, std::string> cases[] = {
        {"nested deeper than 256", xmlList(repeated("<array>", 257) + repeated("</array>", 257))},
        {"nested deeper than 256", xmlList(repeated("<dict><key>k</key>", 257) + repeated("</dict>", 257))},
        {"more than 2000000 values", xmlList("<array>" + repeated("<true/>", 2'000'000) + "</array>")},
        {"longer than", std::string((std::size_t{64} << 20) + 1, ' ')},
        {"no data", ""},
        {"no value", xmlList("")},
        {"a zero byte", xmlList(std::string("<string>\0</string>", 18))},
    };
    for (const auto& [reason, list] : cases)
        EXPECT_THAT(propertyListFromData(bytesOf(list)).error, HasSubstr(reason));
}

TEST(HostilePropertyList, BinaryThatMultipliesIsRefusedWithTheReason)
{
    std::vector<Bytes> laughs;
    for (std::uint8_t next = 1; next < 40; ++next)
        laughs.push_back({0xA2, next, next});
    laughs.push_back({0x09});
    // 255 x 255 references to one text of 4096 bytes.
    std::vector<Bytes> shared{{0xAF, 0x10, 0xFF}, {0xAF, 0x10, 0xFF}, {0x5F, 0x11, 0x10, 0x00}};
    shared[0].resize(3 + 255, 1);
    shared[1].resize(3 + 255, 2);
    shared[2].resize(4 + 4096, 'x');

    std::vector<Bytes> nested; // in a circle, as references have one byte here
    for (std::uint8_t next = 1; next != 0; ++next)
        nested.push_back({0xA1, next});
    nested.push_back({0xA1, 0});

    const struct {
        const char* name;
        Bytes list;
        const char* reason;
    } cases[] = {
        {"another version", bytesOf("bplist15" + std::string(40, '\0')), "unknown version"},
        {"shared arrays multiply", binaryList(laughs), "more values than the list has bytes"},
        {"shared text multiplies", binaryList(shared), "more of the list than it has room for"},
        {"deeper than the limit", binaryList(nested), "nested deeper than 256"},
        {"root not there", binaryList({}), "not there"},
    };
    for (const auto& test : cases) {
        const auto result = propertyListFromData(test.list);
        EXPECT_FALSE(result.value) << test.name;
        EXPECT_THAT(result.error, HasSubstr(test.reason)) << test.name;
    }
}

TEST(HostilePropertyList, LimitsAreExact)
{
    for (const Bytes& list : {bytesOf(xmlList("<array><array><array/></array></array>")),
             binaryList({{0xA1, 1}, {0xA1, 2}, {0xA0}})}) {
        EXPECT_EQ(propertyListFromData(list, {.maximumDepth = 3, .maximumNodes = 3}).error, "");
        EXPECT_THAT(propertyListFromData(list, {.maximumDepth = 2}).error, HasSubstr("nested deeper than 2"));
        EXPECT_THAT(propertyListFromData(list, {.maximumNodes = 2}).error, HasSubstr("more than 2 values"));
    }
}

TEST(HostilePropertyList, EveryTruncationIsAnError)
{
    // Every kind of value, in both forms.
    const Bytes xml =
        bytesOf("<?xml version=\"1.0\"?><!DOCTYPE plist PUBLIC \"-//A\" \"b\"><plist version=\"1.0\">"
                "<dict><key>a &amp;</key><array><integer>-5</integer><real>1.5</real><true/>"
                "<data>AAEC</data></array><key>\u00e4</key><date>2026-11-16T05:54:31Z</date><!-- c -->"
                "<key>d</key><string>x<![CDATA[<y>]]>z</string><key>e</key><dict/></dict></plist>");
    for (const Bytes& list : {xml, propertyListBinary(propertyListFromData(xml).value.value()).value()}) {
        ASSERT_EQ(propertyListFromData(list).error, "");
        for (std::size_t length = 0; length < list.size(); ++length) {
            const Bytes cut(list.begin(), list.begin() + static_cast<std::ptrdiff_t>(length));
            EXPECT_FALSE(propertyListFromData(cut).value) << length;
        }
    }
}

} // namespace
} // namespace orvex
