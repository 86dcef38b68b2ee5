#include "StateTemplate.h"

namespace orvex {

namespace {
constexpr const char* kTemplate = "Template";
constexpr const char* kDisplay = "Display";
constexpr const char* kTemplateName = "TemplateName";
} // namespace

DictionaryRef StateTemplate::in(const Dictionary& state) const
{
    const Value& name = state[kTemplateName];
    const bool isOwn = name.isNull() || (name.string() && *name.string() == _name);
    return isOwn ? state[kTemplate].dictionary() : nullptr;
}

DictionaryRef StateTemplate::loadInto(Dictionary& state, const Resources& resources) const
{
    auto skeleton = _name.empty() ? nullptr : resources.dictionaryNamed(_name).dictionary;
    if (skeleton)
        state.set(kTemplate, skeleton);
    return skeleton;
}

std::string StateTemplate::errorIn(const Dictionary& state, const Resources& resources) const
{
    return in(state) || hasForeignDisplay(state) ? "" : resources.dictionaryNamed(_name).error;
}

void StateTemplate::setDisplay(Dictionary& state, const Value& display) const
{
    state.set(kDisplay, display);
    state.set(kTemplateName, _name);
}

bool StateTemplate::hasForeignDisplay(const Dictionary& state)
{
    return !state[kDisplay].isNull() && state[kTemplateName].isNull();
}

} // namespace orvex
