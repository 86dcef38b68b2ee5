#include "NodesByPath.h"

#include "Array.h"
#include "Dictionary.h"

#include <gtest/gtest.h>

namespace orvex::test {
namespace {

// " /path=value" for a leaf, " /path" for a branch, in the order of the tree.
std::string described(const OrvexModelNode& node, const std::string& path)
{
    std::string result = " " + path + (node.value() ? "=" + *node.value() : "");
    if (node.childNodes()) {
        for (const auto& child : *node.childNodes())
            result += described(*child, pathByAppending(path, child->displayName()));
    }
    return result;
}

DictionaryRef nested(const Value& value)
{
    return Dictionary::make({{"x", value}});
}

TEST(OrvexModelNode, ShowsEveryKindOfObject)
{
    const struct {
        const char* name;
        Value display;
        const char* tree;
    } cases[] = {
        {"an unsorted dictionary keeps its order and its keys",
            Dictionary::make({{"02;B", "x"}, {"01;A", "y"}}), " / /02;B=x /01;A=y"},
        {"a sorted dictionary is in string order, without prefixes",
            Dictionary::make({{"2;B", "x"}, {"_sorted", ""}, {"10;A", Dictionary::make()}}), " / /A /B=x"},
        {"only one separator makes a prefix",
            Dictionary::make({{"_sorted", "no"}, {"a;b;c", "1"}, {"plain", "2"}, {"z;", "3"}}),
            " / /a;b;c=1 /plain=2 /=3"},
        {"a null value is left out", Dictionary::make({{"A", Value()}, {"B", "b"}}), " / /B=b"},
        {"array elements are numbered", nested(Array::make({"a", "b"})), " / /x /x/0=a /x/1=b"},
        {"arrays in arrays", Array::make({Array::make(), Array::make({"a"})}), " / /0 /1 /1/0=a"},
        {"other values are unknown",
            Array::make({1, 1.5, true, Date(), std::make_shared<Bytes>(), UID(), Set{Array::make({"a"})}}),
            " / /0=(unknown) /1=(unknown) /2=(unknown) /3=(unknown) /4=(unknown) /5=(unknown) /6=(unknown)"},
        {"only the top dictionary is sorted",
            Dictionary::make({{"_sorted", ""}, {"1;S", Dictionary::make({{"2;b", ""}, {"1;a", ""}})}}),
            " / /S /S/2;b= /S/1;a="},
        {"an absent display", Value(), " /=(unknown)"},
        {"a display that is a text", "text", " /=text"},
    };
    for (const auto& [name, display, tree] : cases) {
        NodesByPath nodes;
        const auto root = OrvexModelNode::makeTreeFromObject(display, nodes);
        EXPECT_EQ(described(*root, "/"), tree) << name;
        EXPECT_EQ(root->displayName(), "Orvex");
        EXPECT_EQ(nodes["/"], root);
    }
}

TEST(OrvexModelNode, PathDictionaryKeepsTheLaterOfTwoNodes)
{
    NodesByPath nodes;
    OrvexModelNode::makeTreeFromObject(
        Dictionary::make({{"_sorted", ""}, {"1;Cell", "first"}, {"2;Cell", "second"},
            {"3;a/b", nested("deep")}, {"4;//", nested("of no name")}, {"5;c/", nested("trimmed")}}),
        nodes);
    EXPECT_EQ(*nodes["/Cell"]->value(), "second");
    EXPECT_EQ(*nodes["/a/b/x"]->value(), "deep");
    EXPECT_EQ(*nodes["/x"]->value(), "of no name");
    EXPECT_EQ(*nodes["/c/x"]->value(), "trimmed");
    EXPECT_EQ(nodes["/"]->displayName(), "Orvex") << "stored after the child that has its path";
    for (const char* path :
        {"", "Cell", "/a", "/a/b/", "/a/bx", "//Cell", "/Cell/", "/Cell2", "/c/x/y", "/Cel"})
        EXPECT_FALSE(nodes[path]) << path;
    EXPECT_FALSE(NodesByPath()["/"]);
}

} // namespace
} // namespace orvex::test
