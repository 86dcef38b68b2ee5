#include "C2K/C2KLogGenerator.h"

#include "C2K/DataRate.h"
#include "C2K/EVDO.h"
#include "C2K/OneXStatus.h"
#include "C2K/OneXSystemIdentity.h"
#include "C2K/OneXTrafficFrames.h"
#include "MessageFrame.h"
#include "StateTemplate.h"

#include "Array.h"
#include "SystemLog.h"
#include "TelephonyConstants.h"

#include <algorithm>

namespace orvex {

namespace {

struct Decoder {
    LogCode code;
    void (*decode)(Packet packet, Dictionary& state, const Publisher& publisher);
};

// In the order of the start command.
constexpr Decoder kDecoders[] = {
    {0x108A, &EVDOFingers::decode},
    {0x1183, &EVDOStatus::decode},
    {0x1192, &ForwardLinkRate::decode},
    {0x12B6, &EVDOActiveSet::decode},
    {0x119C, &OneXStatus::decode},
    {0x119D, &OneXTrafficFrames::decode},
    {0x127E, &ReverseLinkRate::decode},
    {0x134F, &OneXSystemIdentity::decode},
};

const StateTemplate& ownTemplate()
{
    static const StateTemplate kTemplate("C2KTemplate");
    return kTemplate;
}

} // namespace

std::unique_ptr<LogGenerator> C2KLogGenerator::generator(const GeneratorEnvironment& environment)
{
    return std::make_unique<C2KLogGenerator>(environment);
}

DictionaryRef C2KLogGenerator::getStartCommand() const
{
    auto logCodes = Array::make();
    for (const Decoder& decoder : kDecoders)
        logCodes->append(decoder.code);
    return Dictionary::make(
        {{telephony::kSetState, telephony::kStreaming}, {telephony::kSetMarlinLogCodes, logCodes}});
}

void C2KLogGenerator::updateState(Dictionary& state, ByteView data)
{
    getDisplayFromState(state, environment().resources);
    updateFromLog(data, state["Lookup"].dictionary(), state);
}

Value C2KLogGenerator::generateLogUsingState(Dictionary& state)
{
    Value display = getDisplayFromState(state, environment().resources);
    handOverBinData(state);
    updateHistoryInState(state, environment().clock);
    return display;
}

std::string C2KLogGenerator::templateError(const Dictionary& state) const
{
    return ownTemplate().errorIn(state, environment().resources);
}

void C2KLogGenerator::processTemplate(
    const Dictionary& skeleton, const DictionaryRef& storeDisplayIntoDict, Dictionary& storeLookupIntoDict)
{
    for (const auto& [name, value] : skeleton) {
        const std::string* internalKey = value.string();
        if (const auto section = value.dictionary()) {
            const auto display = Dictionary::make();
            processTemplate(*section, display, storeLookupIntoDict);
            storeDisplayIntoDict->set(name, display);
        } else if (internalKey && *internalKey == "_sorted") {
            storeDisplayIntoDict->set(name, *internalKey); // a mark for the display, not a row
        } else if (internalKey) {
            storeDisplayIntoDict->set(name, "");
            Publisher::addRow(storeLookupIntoDict, *internalKey, name, storeDisplayIntoDict);
        }
    }
    systemLog(Priority::warning, "Processing the template");
}

Value C2KLogGenerator::getDisplayFromState(Dictionary& state, const Resources& resources)
{
    auto skeleton = ownTemplate().in(state);
    const Value& found = state["Display"];
    if (StateTemplate::hasForeignDisplay(state) || (skeleton && !found.isNull()))
        return found;
    if (!skeleton)
        skeleton = ownTemplate().loadInto(state, resources);
    if (!skeleton) {
        systemLog(Priority::error, "Cannot load C2K template for display");
        return {};
    }
    const auto display = Dictionary::make();
    const auto lookup = Dictionary::make();
    processTemplate(*skeleton, display, *lookup);
    ownTemplate().setDisplay(state, display);
    state.set("Lookup", lookup);
    state.set("ExtraInfo", Dictionary::make());
    return display;
}

void C2KLogGenerator::updateFromLog(
    ByteView message, const DictionaryRef& usingLookup, Dictionary& usingState)
{
    const MessageFrame frame(message);
    if (!frame.isComplete())
        return;
    // The line says "Dropping", but packets of other types have always been decoded.
    if (frame.logType() != MessageFrame::kTypeBaseband)
        systemLog(Priority::error, "Invalid log type: %x. Dropping.", static_cast<unsigned>(frame.logType()));
    const auto* decoder = std::ranges::find(kDecoders, frame.logCode(), &Decoder::code);
    if (decoder == std::end(kDecoders))
        return;
    const Packet packet = frame.packet();
    decoder->decode(packet, usingState, Publisher(usingLookup));
    _binData->append(packet);
}

} // namespace orvex
