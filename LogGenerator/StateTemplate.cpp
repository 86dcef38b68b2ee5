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
    auto skeleton = _name.empty() ? nullptr : resources.dictionaryNamed(_name);
    if (skeleton) {
        state.set(kTemplate, skeleton);
        state.set(kTemplateName, _name);
    }
    return skeleton;
}

void StateTemplate::removeFrom(Dictionary& state)
{
    state.remove(kTemplate);
    state.remove(kTemplateName);
}

} // namespace orvex
