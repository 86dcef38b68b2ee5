#pragma once

#include "Resources.h"

#include "Dictionary.h"

namespace orvex {

// The template of a display, as the generator state keeps it: "Template", and under "TemplateName" the
// resource it came from. The session goes on with one state while generators and even technologies come and
// go; the name tells a successor whether the display it finds is one of its own.
class StateTemplate {
public:
    // `name` is the base name of the resource.
    explicit StateTemplate(std::string name)
        : _name(std::move(name))
    {
    }

    const std::string& name() const { return _name; }
    // The state's template; null when it has none, or another technology's. One without a name is taken.
    DictionaryRef in(const Dictionary& state) const;
    // The template of the resource, put into the state. Null, and the state as it was, when there is none.
    DictionaryRef loadInto(Dictionary& state, const Resources& resources) const;

    // Why there would be none, in one line; empty when the state has it or it can be loaded.
    std::string errorIn(const Dictionary& state, const Resources& resources) const;

    // For a display that was laid out from no template.
    static void removeFrom(Dictionary& state);

private:
    std::string _name;
};

} // namespace orvex
