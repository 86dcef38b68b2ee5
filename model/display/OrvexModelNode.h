#pragma once

#include "Value.h"

#include <memory>
#include <string>
#include <vector>

namespace orvex {

class OrvexModelNode;
using OrvexModelNodeRef = std::shared_ptr<const OrvexModelNode>;

class NodesByPath;

// A node of the display tree: what one row of the screens shows. Immutable; a screen may keep a node of a
// tree that the model has dropped.
//
// A branch has child nodes, a leaf has a value; a plain node has neither.
class OrvexModelNode {
public:
    explicit OrvexModelNode(std::string name)
        : _name(std::move(name))
    {
    }
    virtual ~OrvexModelNode() = default;
    OrvexModelNode(const OrvexModelNode&) = delete;
    OrvexModelNode& operator=(const OrvexModelNode&) = delete;

    const std::string& displayName() const { return _name; }
    virtual const std::vector<OrvexModelNodeRef>* childNodes() const { return nullptr; }
    virtual const std::string* value() const { return nullptr; }

    // Builds the tree of a display dictionary (or of any other value) and fills the path dictionary with it.
    // The root is named "Orvex" and has the path "/".
    // Dictionaries are shown in their DisplayOrder.
    static OrvexModelNodeRef makeTreeFromObject(const Value& object, NodesByPath& pathDictionary);

private:
    std::string _name;
};

// A leaf: one value with its name.
class OrvexModelLeafNode final : public OrvexModelNode {
public:
    OrvexModelLeafNode(std::string name, std::string value)
        : OrvexModelNode(std::move(name))
        , _string(std::move(value))
    {
    }

    const std::string* value() const override { return &_string; }

private:
    std::string _string;
};

// A branch: a dictionary or an array of the display.
class OrvexModelTreeNode final : public OrvexModelNode {
public:
    OrvexModelTreeNode(std::string name, std::vector<OrvexModelNodeRef> children)
        : OrvexModelNode(std::move(name))
        , _childNodes(std::move(children))
    {
    }

    const std::vector<OrvexModelNodeRef>* childNodes() const override { return &_childNodes; }

private:
    std::vector<OrvexModelNodeRef> _childNodes;
};

} // namespace orvex
