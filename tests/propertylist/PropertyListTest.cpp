#include "PropertyList.h"

#include "Array.h"
#include "Dictionary.h"
#include "PropertyListForms.h"

#include <gmock/gmock.h>

#include <algorithm>
#include <cmath>
#include <limits>
#include <numeric>

namespace orvex {
namespace {

using test::binaryList;
using test::bytesOf;
using test::xmlList;
using testing::HasSubstr;

Value data(Bytes bytes)
{
    return std::make_shared<Bytes>(std::move(bytes));
}
constexpr std::int64_t kLowest = std::numeric_limits<std::int64_t>::min();
constexpr std::int64_t kHighest = std::numeric_limits<std::int64_t>::max();

TEST(PropertyList, ReadsEachKindOfXMLValue)
{
    const std::pair<const char*, Value> cases[] = {
        {"<string>a&lt;b&amp;c &#228;</string>", "a<b&c \u00e4"},
        {"<string>a<!-- <array> -->b<![CDATA[<c>]]></string>", "ab<c>"},
        {"<string> &quot;&#xFEFF;&#x1F600;&apos;&#65;&#228;&gt; </string>", " \"\uFEFF\U0001F600'A\u00e4> "},
        {"<string>  \n</string>", "  \n"},
        {"<string/>", ""},
        {"<integer> 0xFF </integer>", 255},
        {"<integer>-9223372036854775808</integer>", kLowest},
        {"<integer>18446744073709551615</integer>", 18446744073709551615.0},
        {"<real>6.02e23</real>", 6.02e23},
        {"<real>-1e400</real>", -std::numeric_limits<double>::infinity()},
        {"<true/>", true},
        {"<false></false>", false},
        {"<date>2150-01-02T03:04:05Z</date>", Date{5680379045}},
        {"<date> 2026-12-31T24:00:00Z </date>", Date{1798761600}},
        {"<data>AAH/\n\tfg==</data>", data({0, 1, 255, 126})},
        {"<data>AAH/fg</data>", data({0, 1, 255, 126})},
        {"<array><integer>1</integer><array><true/></array></array>", Array::make({1, Array::make({true})})},
        {"<dict><key>b</key><integer>1</integer><key></key><dict/></dict>",
            Dictionary::make({{"b", 1}, {"", Dictionary::make()}})},
        {"<dict><key>b</key><false/><key>a&amp;<!-- c --></key><true/><key>b</key><true/></dict>",
            Dictionary::make({{"b", true}, {"a&", true}})},
        {"<!-- <array> --><array\n></array ><?note <array> ?>", Array::make()},
    };
    for (const auto& [xml, value] : cases) {
        const auto result = propertyListFromData(bytesOf(xmlList(xml)));
        EXPECT_TRUE(result.value == value) << xml << ": " << result.error;
    }
    EXPECT_TRUE(propertyListFromData(bytesOf("\xEF\xBB\xBF <plist><true/></plist>")).value);
}

TEST(PropertyList, ReadsEachKindOfBinaryValue)
{
    const struct {
        const char* name;
        std::vector<Bytes> objects;
        Value value;
    } cases[] = {
        {"ascii", {{0x52, 'h', 'i'}}, "hi"},
        {"utf-16", {{0x62, 0x00, 0xE4, 0x20, 0xAC}}, "\u00e4\u20ac"},
        {"utf-16 beyond", {{0x64, 0xFE, 0xFF, 0xD8, 0x3D, 0xDE, 0x00, 0xDE, 0x00}}, "\uFEFF\U0001F600\uFFFD"},
        {"long text", {{0x5F, 0x11, 0x00, 0x02, 'h', 'i'}}, "hi"},
        {"one byte is never negative", {{0x10, 0xFF}}, 255},
        {"lowest", {{0x13, 0x80, 0, 0, 0, 0, 0, 0, 0}}, kLowest},
        {"too large for a sign", {{0x14, 0, 0, 0, 0, 0, 0, 0, 0, 0x80, 0, 0, 0, 0, 0, 0, 0}},
            9223372036854775808.0},
        {"float", {{0x22, 0x3F, 0xC0, 0, 0}}, 1.5},
        {"double", {{0x23, 0xBF, 0xD0, 0, 0, 0, 0, 0, 0}}, -0.25},
        {"date with a fraction", {{0x33, 0x3F, 0xF8, 0, 0, 0, 0, 0, 0}}, Date{978307201.5}},
        {"data", {{0x42, 0, 0xFF}}, data({0, 255})},
        {"UID", {{0x81, 5, 7}}, UID{0x0507}},
        {"set", {{0xC2, 1, 2}, {0x08}, {0x51, 'a'}}, Set{Array::make({"a", false})}},
        {"shared element", {{0xA2, 1, 1}, {0x09}}, Array::make({true, true})},
        {"dictionary", {{0xD2, 1, 2, 3, 4}, {0x51, 'z'}, {0x51, 'a'}, {0x08}, {0xA0}},
            Dictionary::make({{"z", false}, {"a", Array::make()}})},
        {"keys that are no texts", {{0xD3, 1, 2, 3, 3, 4, 2}, {0x10, 1}, {0x51, 'a'}, {0xA0}, {0x08}},
            Dictionary::make({{"a", false}})},
    };
    for (const auto& test : cases) {
        const auto result = propertyListFromData(binaryList(test.objects));
        EXPECT_TRUE(result.value == test.value) << test.name << ": " << result.error;
        const auto dictionary = result.value.value_or(Value()).dictionary();
        EXPECT_TRUE(!dictionary || dictionary->leftOut() == (test.objects[0][0] & 0xFU) - dictionary->size())
            << test.name;
    }
}

TEST(PropertyList, WritesEachKindAsXML)
{
    const std::pair<Value, const char*> cases[] = {
        {"a<b>&\u00e4", "<string>a&lt;b&gt;&amp;\u00e4</string>"},
        {std::string("\x01q\0\xFFq\xED\xA0\x80", 8),
            "<string>\uFFFDq\uFFFD\uFFFDq\uFFFD\uFFFD\uFFFD</string>"},
        {kLowest, "<integer>-9223372036854775808</integer>"},
        {Date{1794808471.9}, "<date>2026-11-16T05:54:31Z</date>"},
        {Date{-62'135'596'800}, "<date>0001-01-01T00:00:00Z</date>"},
        {Date{253'402'300'799.5}, "<date>9999-12-31T23:59:59Z</date>"},
        {1e-5, "<real>1.0000000000000001e-05</real>"},
        {-0.0, "<real>0.0</real>"},
        {-std::numeric_limits<double>::infinity(), "<real>-infinity</real>"},
        {std::nan(""), "<real>nan</real>"},
        {Dictionary::make({{"a\x02", 1}, {"b", 2}, {"a\x03", 3}}),
            "<dict>\n\t<key>a\uFFFD</key>\n\t<integer>3</integer>\n\t<key>b</key>"},
        {Array::make({data(Bytes(52, 0)), data({})}),
            "\t<data>\n\tAAAAAAAAAAAAAAAAAAAAAAAAAAAAAAAAAAAAAAAAAAAAAAAAAAAAAAAAAAAAAAAAAAAA\n\tAA==\n\t</"
            "data>\n"
            "\t<data>\n\t</data>\n"},
        {UID{7}, "<dict>\n\t<key>CF$UID</key>\n\t<integer>7</integer>\n</dict>"},
        {Set{Array::make({"a"})}, "<array>\n\t<string>a</string>\n</array>"},
    };
    for (const auto& [value, expected] : cases) {
        const Bytes xml = propertyListXML(value).value();
        EXPECT_THAT(std::string(xml.begin(), xml.end()), HasSubstr(expected));
        EXPECT_EQ(propertyListFromData(xml).error, "");
    }
    // Reals come back exactly.
    for (const double number : {0.1, 1.7976931348623157e308, -3.0})
        EXPECT_EQ(propertyListFromData(propertyListXML(number).value()).value, Value(number));
}

// Pieces end inside of base64 groups, at their ends, at those of a line, and hold nothing.
TEST(PropertyList, DataInPiecesIsWrittenAsIfItWereWhole)
{
    for (const std::size_t length : {0U, 1U, 2U, 50U, 51U, 52U, 150U}) {
        PiecedBytes pieced;
        Bytes whole;
        for (const std::size_t size : {length, std::size_t{0}, std::size_t{1}, length}) {
            const auto piece = std::make_shared<Bytes>(3 + size);
            std::iota(piece->begin(), piece->end(), static_cast<std::uint8_t>(whole.size()));
            pieced.append(piece, 3); // whose first bytes are not part of it
            whole.insert(whole.end(), piece->begin() + 3, piece->end());
        }
        const Value value = std::move(pieced);
        EXPECT_EQ(propertyListXML(Array::make({value})), propertyListXML(Array::make({data(whole)})))
            << length;
        EXPECT_EQ(value, data(whole)) << length;
    }
}

TEST(PropertyList, WritesBinaryListsThatAreReadAsTheyWere)
{
    const auto list = Dictionary::make({{"z", Array::make({"\uFEFF\u00e4", "", Array::make()})},
        {"a",
            Array::make({kLowest, -1, 255, 70'000, kHighest, -0.25, true, Date{1794808471.5}, data({0, 255}),
                Set{Array::make({false})}, UID{300}, std::string(300, 'x'), Date{1e300}})}});
    const auto read = propertyListFromData(propertyListBinary(list).value());
    EXPECT_TRUE(read.value == Value(list)) << read.error;
    EXPECT_EQ(read.value->dictionary()->begin()->key, "z");
    EXPECT_FALSE(propertyListBinary(Array::make({Value()})));
    Bytes longText{0x5F, 0x11, 0x01, 0x2C};
    longText.resize(4 + 300, 'x');
    EXPECT_EQ(
        propertyListBinary(Dictionary::make({{"b", Array::make({"b", UID{7}, std::string(300, 'x')})}})),
        binaryList({{0xD1, 1, 2}, {0x51, 'b'}, {0xA3, 1, 3, 4}, {0x80, 7}, longText}))
        << "equal texts are one object";
}

TEST(PropertyList, NamesTheValueThatHasNoXMLForm)
{
    const auto holder = Dictionary::make();
    const auto inSet = Array::make();
    holder->set("a", Array::make({1, Set{Array::make({inSet})}}));
    inSet->append(holder);
    const std::string date = "the value at /0 is a date outside of the years 1 to 9999";
    const std::pair<Value, std::string> cases[] = {
        {Value(), "the value at / is null"},
        {Array::make({1, Dictionary::make({{"a\n", Value()}})}), "the value at /1/a\\n is null"},
        {holder, "the value at /a/1/0/0 holds itself"},
        {Array::make({Date{253'402'300'800}}), date},
        {Array::make({Date{-62'135'596'801}}), date},
        {Array::make({Date{std::nan("")}}), date},
    };
    for (const auto& [value, fault] : cases) {
        EXPECT_EQ(writePropertyListXML(value, [](std::string_view) {}), fault);
        EXPECT_FALSE(propertyListXML(value)) << fault;
    }
    EXPECT_FALSE(propertyListBinary(holder));
    inSet->removeAll(); // so that it goes
}

TEST(PropertyList, WritesWithoutBoundsInSmallPieces)
{
    Value list = Array::make();
    for (int i = 1; i < 1000; ++i)
        list = Array::make({list});
    for (int i = 0; i < 64; ++i)
        list.array()->append(std::make_shared<Bytes>(1 << 20));
    std::size_t size = 0;
    std::size_t largestPiece = 0;
    const auto take = [&](std::string_view piece) {
        size += piece.size();
        largestPiece = std::max(largestPiece, piece.size());
    };
    EXPECT_EQ(writePropertyListXML(list, take), "");
    EXPECT_GT(size, (std::size_t{64} << 20) / 3 * 4);
    EXPECT_LT(largestPiece, std::size_t{1} << 20);
}

// Searching directly would take minutes.
TEST(PropertyList, ManyKeysKeepTheirOrderBothWaysInGoodTime)
{
    const auto dictionary = Dictionary::make();
    for (int i = 100'000; i > 0; --i)
        dictionary->set(std::to_string(i), i);
    const auto read = propertyListFromData(propertyListXML(dictionary).value());
    EXPECT_TRUE(std::ranges::equal(*read.value.value().dictionary(), *dictionary));
}

} // namespace
} // namespace orvex
