#include "MRLLogGenerator2.h"

#include "Base.h"
#include "MessageFrame.h"
#include "StateTemplate.h"

#include "Array.h"
#include "SystemLog.h"
#include "TelephonyConstants.h"
#include "TextFormat.h"

#include <algorithm>
#include <charconv>

namespace orvex {

namespace {
// Logs the creation of the generator before its base classes log theirs.
const GeneratorEnvironment& announced(const GeneratorEnvironment& environment, const ClassIndex* cIndexObj)
{
    systemLog(
        Priority::error, "Creating MRLLogGenerator2 object with %p", static_cast<const void*>(cIndexObj));
    return environment;
}
} // namespace

MRLLogGenerator2::MRLLogGenerator2(
    const GeneratorEnvironment& environment, std::string pListName, std::unique_ptr<ClassIndex> cIndexObj)
    : MRLLogGenerator(announced(environment, cIndexObj.get()))
    , _pListName(std::move(pListName))
    , _cIndex(std::move(cIndexObj))
{
    const long owners = 1; // this generator alone
    systemLog(Priority::error, "Class Index: %ld", owners);
}

MRLLogGenerator2::~MRLLogGenerator2()
{
    // Every Marlin technology logs this name.
    systemLog(Priority::warning, "MRL_GSMLogGenerator is destructed %p", static_cast<const void*>(this));
}

void MRLLogGenerator2::updateState(Dictionary& state, ByteView data)
{
    if (!isBoundToDisplayOf(state))
        getDisplayFromState(state);
    updateWithData(data);
    if (_binData)
        _binData->append(data);
}

void MRLLogGenerator2::updateWithData(ByteView data)
{
    const MessageFrame frame(data);
    if (!frame.isComplete())
        return;
    const unsigned logType = frame.logType();
    if (logType != MessageFrame::kTypeBaseband && logType != MessageFrame::kTypeExtra) {
        systemLog(Priority::error, "Invalid log type: %x. Dropping.", logType);
        return;
    }
    const LogCode code = frame.logCode();
    const auto* subscribers = _cIndex ? _cIndex->getSubscribers(code) : nullptr;
    if (!subscribers)
        return;
    for (Base* section : *subscribers)
        section->updateWithData(frame.packet(), code);
}

Value MRLLogGenerator2::generateLogUsingState(Dictionary& state)
{
    Value display = getDisplayFromState(state);
    handOverBinData(state);
    updateHistoryInState(state, environment().clock);
    return display;
}

std::string MRLLogGenerator2::templateError(const Dictionary& state) const
{
    return StateTemplate(_pListName).errorIn(state, environment().resources);
}

Value MRLLogGenerator2::getDisplayFromState(Dictionary& state)
{
    if (isBoundToDisplayOf(state) || StateTemplate::hasForeignDisplay(state))
        return state["Display"];

    const StateTemplate ownTemplate(_pListName);
    DictionaryRef skeleton = ownTemplate.in(state);
    if (const DictionaryRef display = state["Display"].dictionary(); display && skeleton) {
        // The session has a new generator, for example because the service came back. The display stays,
        // and the new sections write where the old ones did.
        bindToDisplay(skeleton, display);
        _boundDisplay = display;
        return display;
    }
    if (!skeleton)
        skeleton = ownTemplate.loadInto(state, environment().resources);
    if (!skeleton) {
        systemLog(Priority::error, "Cannot load template for display");
        return {};
    }
    systemLog(Priority::warning, "Initialized class index: %p, Self: %p",
        static_cast<const void*>(_cIndex.get()), static_cast<const void*>(this));
    if (_cIndex)
        _cIndex->status();
    const Value built = processTemplate(skeleton);
    printDict(built);
    ownTemplate.setDisplay(state, built);
    state.set("ExtraInfo", Dictionary::make());
    _boundDisplay = built.dictionary();
    return {}; // deliberate: only the next call returns it
}

bool MRLLogGenerator2::isBoundToDisplayOf(const Dictionary& state) const
{
    const DictionaryRef display = state["Display"].dictionary();
    return display && display == _boundDisplay.lock();
}

Value MRLLogGenerator2::processTemplate(const Value& object)
{
    if (object.string())
        return object;
    if (const auto dictionary = object.dictionary()) {
        for (std::size_t i = 0; i < dictionary->leftOut(); ++i)
            systemLog(Priority::error, "Dictionary Key is not a string?");
        auto result = Dictionary::make();
        for (const auto& [key, value] : *dictionary) {
            const Value processed = processTemplate(value); // children are bound before their parent
            bindSection(key, processed);
            result->set(key, processed);
        }
        return result;
    }
    if (const auto array = object.array()) {
        auto result = Array::make();
        for (const Value& element : *array)
            result->append(processTemplate(element));
        return result;
    }
    systemLog(Priority::error, "Received an object of unknown type");
    systemLog(Priority::warning, "Processing the template");
    throw InvalidTemplateException(
        text("template %s holds a value of kind %s", _pListName.c_str(), nameOf(object.kind())));
}

void MRLLogGenerator2::bindToDisplay(const Value& templateObject, const Value& display)
{
    const auto elements = templateObject.array();
    const auto shownElements = display.array();
    if (elements && shownElements) {
        for (std::size_t i = 0; i < std::min(elements->size(), shownElements->size()); ++i)
            bindToDisplay((*elements)[i], (*shownElements)[i]);
        return;
    }
    const auto skeleton = templateObject.dictionary();
    const auto shown = display.dictionary();
    if (!skeleton || !shown)
        return;
    for (const auto& [key, value] : *skeleton) {
        bindToDisplay(value, (*shown)[key]);
        bindSection(key, (*shown)[key]);
    }
}

void MRLLogGenerator2::bindSection(std::string_view name, const Value& container)
{
    if (Base* section = _cIndex ? _cIndex->getClass(name) : nullptr)
        section->updateSectionRef(container);
}

void MRLLogGenerator2::printDict(const Value& object) const
{
    if (object.string())
        return;
    if (const auto dictionary = object.dictionary()) {
        for (const auto& entry : *dictionary)
            printDict(entry.value);
    } else if (const auto array = object.array()) {
        for (const Value& element : *array)
            printDict(element);
    } else {
        systemLog(Priority::error, "Received an object of unknown type");
    }
}

std::vector<PacketKind> MRLLogGenerator2::packetKinds() const
{
    return _cIndex ? _cIndex->packetKinds() : std::vector<PacketKind>();
}

DictionaryRef MRLLogGenerator2::getStartCommand() const
{
    auto logCodes = Array::make();
    auto extraCodes = Array::make();
    for (const std::string& key : _cIndex ? _cIndex->getAllLogCodes() : std::vector<std::string>()) {
        LogCode code = 0;
        std::from_chars(key.data(), key.data() + key.size(), code);
        if (code >= kExtraCodeBase)
            extraCodes->append(code - kExtraCodeBase);
        else
            logCodes->append(code);
    }
    return Dictionary::make({
        {telephony::kSetState, telephony::kStreaming},
        {telephony::kSetMarlinLogCodes, logCodes},
        {telephony::kSetKoratExtraCodes, extraCodes},
    });
}

} // namespace orvex
