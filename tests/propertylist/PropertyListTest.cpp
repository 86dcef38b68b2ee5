#include "PropertyList.h"

#include "Array.h"
#include "ByteText.h"
#include "CaseLines.h"
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
using testing::StartsWith;

Value data(Bytes bytes)
{
    return std::make_shared<Bytes>(std::move(bytes));
}
constexpr std::int64_t kLowest = std::numeric_limits<std::int64_t>::min();
constexpr std::int64_t kHighest = std::numeric_limits<std::int64_t>::max();

// How the value of a list is written in XML, in one line, or why the list is refused, after "!! ".
std::string rewritten(const Bytes& list)
{
    const auto [value, error] = propertyListFromData(list);
    if (!value)
        return "!! " + error;
    const Bytes xml = propertyListXML(*value).value();
    const std::string text =
        std::regex_replace(std::string(xml.begin(), xml.end()), std::regex("\n\t*(?=<)|(<data>)\n\t*"), "$1");
    const auto start = text.find("<plist version=\"1.0\">") + 21;
    return text.substr(start, text.rfind("</plist>") - start);
}

// A line "LIST -> WRITTEN" or "LIST !! REASON" of a case file.
void expectCase(const std::string& line, const Bytes& list)
{
    const std::string outcome = rewritten(list);
    if (const auto written = test::divided(line, " -> ").second; !written.empty()) {
        EXPECT_EQ(outcome, written) << line;
    } else {
        EXPECT_THAT(outcome, StartsWith("!! ")) << line;
        EXPECT_THAT(outcome, HasSubstr(test::divided(line, " !! ").second)) << line;
    }
}

TEST(PropertyList, ReadsXMLOrSaysWhyNot)
{
    for (const std::string& line : test::caseLines("propertylist/xml.txt")) {
        const std::string list = test::divided(test::divided(line, " -> ").first, " !! ").first;
        expectCase(line, bytesOf(list.starts_with("list ") ? list.substr(5) : xmlList(list)));
    }
}

TEST(PropertyList, ReadsBinaryListsOrSaysWhyNot)
{
    for (const std::string& line : test::caseLines("propertylist/binary.txt")) {
        std::istringstream objects(test::divided(test::divided(line, " -> ").first, " !! ").first);
        std::vector<Bytes> list;
        for (std::string words; std::getline(objects, words, ';');)
            list.push_back(test::bytesOfWords(words));
        expectCase(line, binaryList(list));
    }
    const auto leftOut = propertyListFromData(binaryList({{0xD2, 1, 1, 2, 2}, {0x10, 1}, {0x08}})).value;
    EXPECT_EQ(leftOut.value().dictionary()->leftOut(), 2U) << "keys that are no texts are counted";
}

TEST(PropertyList, WritesEachKindAsXML)
{
    const std::pair<Value, const char*> cases[] = {
        {std::string("\x01q\0\xFFq\xED\xA0\x80", 8),
            "<string>\uFFFDq\uFFFD\uFFFDq\uFFFD\uFFFD\uFFFD</string>"},
        {Date{1794808471.9}, "<date>2026-11-16T05:54:31Z</date>"},
        {Date{253'402'300'799.5}, "<date>9999-12-31T23:59:59Z</date>"},
        {Dictionary::make({{"a\x02", 1}, {"b", 2}, {"a\x03", 3}}),
            "<dict>\n\t<key>a\uFFFD</key>\n\t<integer>3</integer>\n\t<key>b</key>"},
        {Array::make({data(Bytes(52, 0)), data({})}),
            "\t<data>\n\tAAAAAAAAAAAAAAAAAAAAAAAAAAAAAAAAAAAAAAAAAAAAAAAAAAAAAAAAAAAAAAAAAAAA\n\tAA==\n\t</"
            "data>\n"
            "\t<data>\n\t</data>\n"},
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
