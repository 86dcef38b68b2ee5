#pragma once

#include "OrvexModelNode.h"

namespace orvex {

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
