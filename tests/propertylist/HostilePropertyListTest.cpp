#include "PropertyList.h"

#include "PropertyListForms.h"

#include <gmock/gmock.h>

#include <algorithm>
#include <iterator>

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

TEST(HostilePropertyList, XMLIsRefusedWithTheReason)
{
    const struct {
        const char* reason;
        std::vector<std::string> values; // in a list
        std::vector<std::string> lists = {};
    } cases[] = {
        {"nested deeper than 256",
            {repeated("<array>", 257) + repeated("</array>", 257),
                repeated("<dict><key>k</key>", 257) + repeated("</dict>", 257)}},
        {"more than 2000000 values", {"<array>" + repeated("<true/>", 2'000'000) + "</array>"}},
        {"longer than", {}, {std::string((std::size_t{64} << 20) + 1, ' ')}},
        {"no data", {}, {""}},
        {"no value", {""}},
        {"more than one value", {"<true/><true/>"}},
        {"tags mismatch",
            {"<array><true/></dict>",
                // Quotes matter in a tag, not in an instruction.
                "<array><?a \" ?></array><?b \" ?></array>"}},
        {"a malformed tag", {"<array a=\">\"></array>"}},
        {"processing instruction", {"<?><array/><?a?>"}},
        {"text outside", {"<array>text</array>", "<array><![CDATA[ ]]></array>"},
            {xmlList("<array/>") + "x", "<plist><array/></plist>>"}},
        {"an element outside", {}, {xmlList("<true/>") + "<plist/>", "<array/>"}},
        {"an element inside of <string>", {"<string>a<array/></string>", "<string>a<?b?></string>"}},
        {"an unknown element", {"<lamp/>"}},
        {"a key without a value", {"<dict><key>a</key></dict>"}},
        {"a value without a key", {"<dict><true/></dict>"}},
        {"a key in the place", {"<array><key>a</key></array>"}},
        {"the content of <integer>",
            {"<integer>12x</integer>", "<integer>18446744073709551616</integer>", "<integer>--5</integer>"}},
        {"the content of <real>", {"<real>1,5</real>", "<real>--5</real>"}},
        {"the content of <date>",
            {"<date>2026-02-30T00:00:00Z</date>", "<date>2026-02-03T24:00:01Z</date>",
                "<date>0000-02-03T00:00:00Z</date>"}},
        {"the content of <data>", {"<data>A*</data>", "<data>AAAA=</data>", "<data>AA==A</data>"}},
        {"the content of <true>", {"<true>no</true>"}},
        {"markup inside of <integer>", {"<integer>1<!-- 2 --></integer>"}},
        {"malformed", {"<dict><key>a&#x00;</key><true/></dict>", "<string>&#xD800;</string>"}},
        {"a zero byte", {std::string("<string>\0</string>", 18)}},
        {"no <plist>", {}, {" <!-- no list -->"}},
        {"after the start", {}, {"<plist><true/></plist><!DOCTYPE plist>"}},
        {"with declarations", {},
            {"<!DOCTYPE plist PUBLIC \">\"><plist><true/></plist>",
                "<!DOCTYPE plist [<!ENTITY a \"&b;\">]><plist><true/></plist>"}},
    };
    for (auto [reason, values, lists] : cases) {
        std::ranges::transform(values, std::back_inserter(lists), xmlList);
        for (const std::string& list : lists) {
            const auto result = propertyListFromData(bytesOf(list));
            EXPECT_FALSE(result.value) << list.substr(0, 200);
            EXPECT_THAT(result.error, HasSubstr(reason)) << list.substr(0, 200);
        }
    }
}

TEST(HostilePropertyList, BinaryIsRefusedWithTheReason)
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
        {"cycle", binaryList({{0xA1, 0}}), "more values than the list has bytes"},
        {"shared arrays multiply", binaryList(laughs), "more values than the list has bytes"},
        {"shared text multiplies", binaryList(shared), "more of the list than it has room for"},
        {"deeper than the limit", binaryList(nested), "nested deeper than 256"},
        {"root not there", binaryList({}), "not there"},
        {"reference not there", binaryList({{0xA1, 9}}), "not there"},
        {"array longer than the list",
            binaryList({{0xAF, 0x13, 0xFF, 0xFF, 0xFF, 0xFF, 0xFF, 0xFF, 0xFF, 0xFF}}),
            "outside of the list"},
        {"text longer than the list", binaryList({{0x5F, 0x12, 0x7F, 0xFF, 0xFF, 0xFF}}),
            "outside of the list"},
        {"UTF-16 half outside", binaryList({{0x62, 0, 'a', 0}}), "outside of the list"},
        {"size is no number", binaryList({{0x5F, 0x51, 'a'}}), "malformed object"},
        {"malformed key", binaryList({{0xD1, 1, 2}, {0x15}, {0x08}}), "malformed object"},
        {"malformed value under a number", binaryList({{0xD1, 1, 2}, {0x10, 1}, {0x15}}), "malformed object"},
        {"zero in a key", binaryList({{0xD1, 1, 1}, {0x52, 'a', 0}}), "zero character"},
        {"unknown kind", binaryList({{0x70}}), "unknown kind"},
        {"integer of 128 bits", binaryList({{0x14, 1, 0, 0, 0, 0, 0, 0, 0, 0, 0, 0, 0, 0, 0, 0, 0}}),
            "malformed"},
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
