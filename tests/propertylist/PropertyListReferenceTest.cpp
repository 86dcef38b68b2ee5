// Holds both forms against libplist, which knows nothing of ours.

#include "PropertyList.h"

#include "Array.h"
#include "Dictionary.h"
#include "RegularFile.h"

#include <plist/plist.h>

#include <gtest/gtest.h>

#include <string>
#include <vector>

namespace orvex {
namespace {

// What libplist makes of a list in either form: the same in both.
std::vector<Bytes> rewritten(const Bytes& list)
{
    const auto written = [&list](auto write) {
        plist_t node = nullptr;
        plist_from_memory(
            reinterpret_cast<const char*>(list.data()), static_cast<std::uint32_t>(list.size()), &node);
        char* text = nullptr;
        std::uint32_t length = 0;
        write(node, &text, &length);
        plist_free(node);
        const Bytes result(text, text + length);
        plist_to_bin_free(text);
        return result;
    };
    return {written(plist_to_xml), written(plist_to_bin)};
}

void expectAgreement(const Value& list, const std::string& name)
{
    for (const Bytes& ours : {propertyListXML(list).value(), propertyListBinary(list).value()}) {
        for (const Bytes& theirs : rewritten(ours))
            EXPECT_EQ(propertyListFromData(theirs).value, list) << name;
    }
}

TEST(PropertyListReference, ReadsAndWritesWhatWeDo)
{
    expectAgreement(
        Dictionary::make(
            {{"texts", Array::make({"", "a<&>", "\u00e4\u20ac\U0001F600", std::string(300, 'x')})},
                {"numbers", Array::make({0, 1, 255, 256, 65536, 4294967296, 0.25, -1e300})},
                {"flags", Array::make({true, false})}, {"data", std::make_shared<Bytes>(Bytes{0, 255, 1, 2})},
                {"date", Date{1794808471}}, {"empty", Array::make({Array::make(), Dictionary::make()})}}),
        "each kind");
    for (const char* file :
        {"resources/C2KTemplate.plist", "resources/MRL_GSM.plist", "fuzz/corpus/Snapshot/IFX"}) {
        const std::string path = std::string(ORVEX_TESTS "/../") + file;
        const Bytes bytes = readFile(path, 1 << 20).bytes;
        const auto list = propertyListFromData(bytes);
        expectAgreement(list.value.value(), path);
        for (const Bytes& theirs : rewritten(bytes))
            EXPECT_EQ(propertyListFromData(theirs).value, list.value) << path;
    }
}

} // namespace
} // namespace orvex
