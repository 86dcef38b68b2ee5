// Holds both forms against libplist, which knows nothing of ours.

#include "PropertyList.h"

#include "Array.h"
#include "Dictionary.h"
#include "RegularFile.h"

#include <plist/plist.h>

#include <gtest/gtest.h>

#include <cstdint>
#include <filesystem>
#include <memory>
#include <string>
#include <string_view>
#include <vector>

namespace orvex {
namespace {

using Node = std::unique_ptr<void, decltype(&plist_free)>;

Node nodeFrom(const Bytes& list)
{
    plist_t node = nullptr;
    plist_from_memory(
        reinterpret_cast<const char*>(list.data()), static_cast<std::uint32_t>(list.size()), &node);
    return {node, &plist_free};
}

// Why our value is not what libplist has; empty when it is.
std::string differenceOf(const Value& value, plist_t node, const std::string& path)
{
    const auto sameIf = [&path](bool isSame) { return isSame ? std::string() : path; };
    switch (plist_get_node_type(node)) {
    case PLIST_BOOLEAN: {
        std::uint8_t flag = 0;
        plist_get_bool_val(node, &flag);
        return sameIf(value == Value(flag != 0));
    }
    case PLIST_UINT: {
        std::uint64_t number = 0;
        plist_get_uint_val(node, &number);
        return sameIf(value == Value(number));
    }
    case PLIST_REAL: {
        double number = 0;
        plist_get_real_val(node, &number);
        return sameIf(value == Value(number));
    }
    case PLIST_STRING: {
        std::uint64_t length = 0;
        const char* text = plist_get_string_ptr(node, &length);
        return sameIf(value == Value(std::string_view(text, length)));
    }
    case PLIST_DATA: {
        std::uint64_t length = 0;
        const char* bytes = plist_get_data_ptr(node, &length);
        return sameIf(value == Value(std::make_shared<Bytes>(bytes, bytes + length)));
    }
    case PLIST_DATE: {
        constexpr double kEpoch = 978'307'200; // 2001-01-01
        std::int32_t seconds = 0;
        std::int32_t microseconds = 0;
        plist_get_date_val(node, &seconds, &microseconds);
        return sameIf(value == Value(Date{kEpoch + seconds + microseconds / 1e6}));
    }
    case PLIST_ARRAY: {
        const Array* array = value.heldArray();
        if (!array || array->size() != plist_array_get_size(node))
            return path;
        for (std::uint32_t i = 0; i < array->size(); ++i) {
            if (auto fault =
                    differenceOf((*array)[i], plist_array_get_item(node, i), path + '/' + std::to_string(i));
                !fault.empty())
                return fault;
        }
        return {};
    }
    case PLIST_DICT: {
        const Dictionary* dictionary = value.heldDictionary();
        if (!dictionary || dictionary->size() != plist_dict_get_size(node))
            return path;
        for (const auto& [key, entry] : *dictionary) {
            plist_t item = plist_dict_get_item(node, key.c_str());
            if (auto fault = differenceOf(entry, item, path + '/' + key); !fault.empty())
                return fault;
        }
        return {};
    }
    default: return path + ": a kind of its own";
    }
}

std::vector<std::filesystem::path> realLists()
{
    std::vector<std::filesystem::path> paths;
    const std::filesystem::path root = ORVEX_SOURCE_DIR;
    for (const char* folder : {"resources", "fuzz/corpus/Template", "fuzz/corpus/Snapshot"}) {
        for (const auto& entry : std::filesystem::directory_iterator(root / folder)) {
            if (entry.is_regular_file())
                paths.push_back(entry.path());
        }
    }
    return paths;
}

TEST(PropertyListReference, ReadsAndWritesBothFormsAsLibplistDoes)
{
    int lists = 0;
    for (const auto& path : realLists()) {
        const auto [bytes, error] = readFile(path, 1 << 20);
        const auto ours = propertyListFromData(bytes);
        if (!ours.value)
            continue; // damaged on purpose, or no list
        ++lists;
        EXPECT_EQ(differenceOf(*ours.value, nodeFrom(bytes).get(), ""), "") << path;
        for (const Bytes& form :
            {propertyListXML(*ours.value).value(), propertyListBinary(*ours.value).value()})
            EXPECT_EQ(differenceOf(*ours.value, nodeFrom(form).get(), ""), "") << path;

        char* text = nullptr;
        std::uint32_t length = 0;
        plist_to_bin(nodeFrom(bytes).get(), &text, &length);
        EXPECT_EQ(propertyListFromData(Bytes(text, text + length)).value, ours.value) << path;
        plist_to_bin_free(text);
    }
    EXPECT_GE(lists, 6) << "the templates and some snapshots";
}

TEST(PropertyListReference, AgreesOnEachKind)
{
    const Value list = Dictionary::make(
        {{"texts", Array::make({"", "a<&>", "\u00e4\u20ac\U0001F600", std::string(300, 'x')})},
            {"numbers", Array::make({0, 1, 255, 256, 65536, 4294967296, 0.25, -1e300})},
            {"flags", Array::make({true, false})}, {"data", std::make_shared<Bytes>(Bytes{0, 255, 1, 2})},
            {"date", Date{1794808471}}, {"empty", Array::make({Array::make(), Dictionary::make()})}});
    for (const Bytes& form : {propertyListXML(list).value(), propertyListBinary(list).value()})
        EXPECT_EQ(differenceOf(list, nodeFrom(form).get(), ""), "");
}

} // namespace
} // namespace orvex
