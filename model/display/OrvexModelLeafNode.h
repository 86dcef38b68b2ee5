#pragma once

#include "OrvexModelNode.h"

namespace orvex {

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

} // namespace orvex
