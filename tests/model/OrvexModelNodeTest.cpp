#include "NodesByPath.h"

#include "Array.h"
#include "Dictionary.h"

#include <gtest/gtest.h>

namespace orvex::test {
namespace {

// "/path=value" for a leaf, "/path" for a branch, in the order of the tree.
void describe(const OrvexModelNode& node, const std::string& path, std::vector<std::string>& result)
{
    result.push_back(node.value() ? path + "=" + *node.value() : path);
    if (!node.childNodes())
        return;
    for (const auto& child : *node.childNodes())
        describe(*child, pathByAppending(path, child->displayName()), result);
}

std::vector<std::string> treeOf(const Value& display)
{
    NodesByPath nodesByPath;
    const auto root = OrvexModelNode::makeTreeFromObject(display, nodesByPath);
    EXPECT_EQ(root->displayName(), "Orvex");
    EXPECT_EQ(nodesByPath["/"], root);
    std::vector<std::string> result;
    describe(*root, "/", result);
    return result;
}

DictionaryRef nested(const Value& value)
{
    return Dictionary::make({{"x", value}});
}

TEST(OrvexModelNode, ShowsEveryKindOfObject)
{
    using Tree = std::vector<std::string>;
    const struct {
        const char* name;
        Value display;
        Tree tree;
    } cases[] = {
        {"an unsorted dictionary keeps its order and its keys",
            Dictionary::make({{"02;B", "x"}, {"01;A", "y"}}), Tree{"/", "/02;B=x", "/01;A=y"}},
        {"a sorted dictionary is in string order, without prefixes",
            Dictionary::make({{"2;B", "x"}, {"_sorted", ""}, {"10;A", Dictionary::make()}}),
            Tree{"/", "/A", "/B=x"}},
        {"only one separator makes a prefix",
            Dictionary::make({{"_sorted", "no"}, {"a;b;c", "1"}, {"plain", "2"}, {"z;", "3"}}),
            Tree{"/", "/a;b;c=1", "/plain=2", "/=3"}},
        {"a null value is left out", Dictionary::make({{"A", Value()}, {"B", "b"}}), Tree{"/", "/B=b"}},
        {"array elements are numbered", Dictionary::make({{"List", Array::make({"a", "b"})}}),
            Tree{"/", "/List", "/List/0=a", "/List/1=b"}},
        {"arrays in arrays", Array::make({Array::make(), Array::make({"a"})}),
            Tree{"/", "/0", "/1", "/1/0=a"}},
        {"other values are unknown",
            Dictionary::make({{"n", 1}, {"r", 1.5}, {"t", true}, {"d", Date()},
                {"b", std::make_shared<Bytes>()}, {"u", UID()}, {"s", Set{Array::make({"a"})}}}),
            Tree{"/", "/n=(unknown)", "/r=(unknown)", "/t=(unknown)", "/d=(unknown)", "/b=(unknown)",
                "/u=(unknown)", "/s=(unknown)"}},
        {"only the top dictionary is sorted",
            Dictionary::make({{"_sorted", ""}, {"1;S", Dictionary::make({{"2;b", ""}, {"1;a", ""}})}}),
            Tree{"/", "/S", "/S/2;b=", "/S/1;a="}},
        {"an absent display", Value(), Tree{"/=(unknown)"}},
        {"a display that is a text", "text", Tree{"/=text"}},
    };
    for (const auto& [name, display, tree] : cases)
        EXPECT_EQ(treeOf(display), tree) << name;
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
