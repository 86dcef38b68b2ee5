#pragma once

#include "Resources.h"

#include "Dictionary.h"

namespace orvex {

// The template of a display, as the generator state keeps it: "Template", and under "TemplateName" whose
// display it is. The session goes on with one state while generators and even technologies come and go; the
// name tells a successor whether the display it finds is one of its own, one of another technology, which it
// replaces, or one without a name, which did not come from a generator and is shown as it is.
class StateTemplate {
public:
    // `name` is the base name of the resource; of a technology without templates any that is its own.
    explicit StateTemplate(std::string name)
        : _name(std::move(name))
    {
    }

    // The state's template; null when it has none, or another technology's. One without a name is taken.
    DictionaryRef in(const Dictionary& state) const;
    // The template of the resource, put into the state. Null, and the state as it was, when there is none.
    DictionaryRef loadInto(Dictionary& state, const Resources& resources) const;

    // Why there would be none, in one line; empty when the state has it or it can be loaded.
    std::string errorIn(const Dictionary& state, const Resources& resources) const;

    // Makes the display the state's, under this template's name.
    void setDisplay(Dictionary& state, const Value& display) const;
    // Whether the state has a display that no generator has made.
    static bool hasForeignDisplay(const Dictionary& state);

private:
    std::string _name;
};

} // namespace orvex
