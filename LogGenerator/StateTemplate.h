#pragma once

#include "Storage.h"

#include "Dictionary.h"

namespace orvex {

// The template of a display as the generator state keeps it: the dictionary under "Template", its name
// under "TemplateName". One state outlives generators and even technologies. The name tells a new generator
// whether the display it finds is its own, another technology's, which it replaces, or one that no
// generator made, which has no name and is shown as it is.
class StateTemplate {
public:
    // `name` is the base name of the resource; a technology without templates uses any unique name.
    explicit StateTemplate(std::string name)
        : _name(std::move(name))
    {
    }

    // The state's template; null when it has none, or another technology's. One without a name counts as
    // this one.
    DictionaryRef in(const Dictionary& state) const;
    // Loads the resource into the state. Null, with the state unchanged, when it cannot.
    DictionaryRef loadInto(Dictionary& state, const Resources& resources) const;

    // Why there is no template, in one line; empty when the state has it or it can be loaded.
    std::string errorIn(const Dictionary& state, const Resources& resources) const;

    // Stores the display in the state, with this template's name.
    void setDisplay(Dictionary& state, const Value& display) const;
    // True when the state has a display that no generator made.
    static bool hasForeignDisplay(const Dictionary& state);

private:
    std::string _name;
};

} // namespace orvex
