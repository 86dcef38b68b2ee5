#include "StateTemplate.h"

namespace orvex {

namespace {
constexpr const char* kTemplate = "Template";
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
    if (skeleton) {
        state.set(kTemplate, skeleton);
        state.set(kTemplateName, _name);
    }
    return skeleton;
}

std::string StateTemplate::errorIn(const Dictionary& state, const Resources& resources) const
{
    return in(state) ? "" : resources.dictionaryNamed(_name).error;
}

void StateTemplate::removeFrom(Dictionary& state)
{
    state.remove(kTemplate);
    state.remove(kTemplateName);
}

} // namespace orvex
