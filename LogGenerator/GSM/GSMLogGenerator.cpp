#include "GSM/GSMLogGenerator.h"

#include "StateTemplate.h"

#include "Array.h"
#include "PropertyList.h"
#include "TelephonyConstants.h"

namespace orvex {

namespace {

// The source position that these assertions have always reported; crash reports are sorted by it.
constexpr const char* kFile = "LogGenerator/GSM/GSMLogGenerator";
constexpr int kUnknownObjectLine = 78;
constexpr int kNoPropertyListLine = 90;

Value onlyEntryOf(const Value& object)
{
    const auto dictionary = object.dictionary();
    return dictionary && dictionary->size() == 1 ? dictionary->begin()->value : Value();
}

Value collapsed(const Value& object)
{
    Value only = onlyEntryOf(object);
    return only.isNull() ? object : only;
}

} // namespace

std::unique_ptr<LogGenerator> GSMLogGenerator::generator(const GeneratorEnvironment& environment)
{
    return std::make_unique<GSMLogGenerator>(environment);
}

std::vector<PacketKind> GSMLogGenerator::packetKinds() const
{
    return {{kCodeOfPropertyList, "Display", 0}};
}

DictionaryRef GSMLogGenerator::getStartCommand() const
{
    return Dictionary::make({{telephony::kSetState, telephony::kStreaming}});
}

void GSMLogGenerator::updateState(Dictionary& state, ByteView data)
{
    const auto list = propertyListFromData(data);
    if (!list.value) {
        throw AssertionFailure(
            "Could not deserialize the object", "updateState:withData:", kFile, kNoPropertyListLine);
    }
    const Value display = processObject(*list.value);
    state.set("DisplayState", *list.value);
    StateTemplate("IFX").setDisplay(state, display);
    state.set("ExtraInfo", Dictionary::make());
}

Value GSMLogGenerator::generateLogUsingState(Dictionary& state)
{
    updateHistoryInState(state, environment().clock);
    return state["Display"];
}

ArrayRef GSMLogGenerator::getSaveContentsFromState(const Dictionary& state) const
{
    const ArrayRef history = state["History"].array();
    return history ? history->shallowCopy() : Array::make();
}

Value GSMLogGenerator::processObject(const Value& object)
{
    if (object.string())
        return object;
    if (const auto dictionary = object.dictionary()) {
        auto result = Dictionary::make();
        for (const auto& [key, value] : *dictionary)
            result->set(key, collapsed(processObject(value)));
        return result;
    }
    if (const auto array = object.array()) {
        auto result = Array::make();
        result->reserve(array->size());
        for (std::size_t i = 1; i < array->size(); ++i) // from the second element on, deliberately
            result->append(collapsed(processObject((*array)[i])));
        return result;
    }
    throw AssertionFailure(std::string("Unknown object of type ") + nameOf(object.kind()) + " encountered",
        "processObject:", kFile, kUnknownObjectLine);
}

Value GSMLogGenerator::canCollapse(const Value& object) const
{
    return onlyEntryOf(object);
}

} // namespace orvex
