#include "NodesByPath.h"

#include "Array.h"
#include "CaseLines.h"
#include "Dictionary.h"
#include "PropertyList.h"
#include "PropertyListForms.h"

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

// "DISPLAY -> TREE", a display as a property list in XML.
TEST(OrvexModelNode, ShowsEveryKindOfObject)
{
    const auto treeOf = [](const Value& display) {
        NodesByPath nodes;
        const auto root = OrvexModelNode::makeTreeFromObject(display, nodes);
        EXPECT_EQ(root->displayName(), "Orvex");
        EXPECT_EQ(nodes["/"], root);
        return described(*root, "/");
    };
    for (const std::string& line : caseLines("model/trees.txt")) {
        const auto [display, tree] = divided(line, " -> ");
        EXPECT_EQ(" " + tree, treeOf(propertyListFromData(bytesOf(xmlList(display))).value.value())) << line;
    }
    EXPECT_EQ(treeOf(Array::make({UID(), Set{Array::make({"a"})}})), " / /0=(unknown) /1=(unknown)");
    EXPECT_EQ(treeOf(Dictionary::make({{"A", Value()}, {"B", "b"}})), " / /B=b") << "null is left out";
    EXPECT_EQ(treeOf({}), " /=(unknown)") << "absent";
}

TEST(OrvexModelNode, PathDictionaryKeepsTheLaterOfTwoNodes)
{
    NodesByPath nodes;
    OrvexModelNode::makeTreeFromObject(
        Dictionary::make({{"_sorted", ""}, {"1;Cell", "first"}, {"2;Cell", "second"},
            {"3;a/b", Dictionary::make({{"x", "deep"}})}, {"4;//", Dictionary::make({{"x", "of no name"}})},
            {"5;c/", Dictionary::make({{"x", "trimmed"}})}}),
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
