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
    const char* name;
    std::size_t minimumLength;
    void (*decode)(Packet packet, Dictionary& state, const Publisher& publisher);
};

// In the order of the start command.
constexpr Decoder kDecoders[] = {
    {0x108A, "EV-DO Fingers", LogCode_0x108A::kMinimumLength, &EVDOFingers::decode},
    {0x1183, "EV-DO Status", LogCode_0x1183::kLength, &EVDOStatus::decode},
    {0x1192, "EV-DO Forward Link Rate", LogCode_0x1192::kMinimumLength, &ForwardLinkRate::decode},
    {0x12B6, "EV-DO Active Set", LogCode_0x12B6::kMinimumLength, &EVDOActiveSet::decode},
    {0x119C, "1x Status", LogCode_0x119C::kMinimumLength, &OneXStatus::decode},
    {0x119D, "1x Traffic Frames", LogCode_0x119D::kMinimumLength, &OneXTrafficFrames::decode},
    {0x127E, "EV-DO Reverse Link Rate", LogCode_0x127E::kMinimumLength, &ReverseLinkRate::decode},
    {0x134F, "1x System Identity", LogCode_0x134F::kMinimumLength, &OneXSystemIdentity::decode},
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

std::vector<PacketKind> C2KLogGenerator::packetKinds() const
{
    std::vector<PacketKind> result;
    for (const Decoder& decoder : kDecoders)
        result.push_back({decoder.code, decoder.name, decoder.minimumLength});
    return result;
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
