#include "LogGenerator.h"

#include "C2K/C2KLogGenerator.h"
#include "GSM/GSMLogGenerator.h"
#include "GSM/MRL_GSMLogGenerator.h"
#include "LTE/LTELogGenerator.h"
#include "UTRAN/UTRANLogGenerator.h"

#include "Array.h"
#include "SystemLog.h"
#include "TelephonyConstants.h"
#include "TextFormat.h"

namespace orvex {

namespace {
constexpr std::size_t kHistoryLength = 5;

// The ordered entries up to the first absent value.
DictionaryRef entryEndingAtFirstAbsent(std::initializer_list<Dictionary::Entry> entries)
{
    auto result = Dictionary::make();
    for (const auto& [key, value] : entries) {
        if (value.isNull())
            break;
        // Byte buffers in the state are replaced, never changed, so they need no copy.
        result->set(key, value.data() ? value : value.shallowCopy());
    }
    return result;
}

constexpr struct {
    const char* technology;
    std::unique_ptr<LogGenerator> (*generator)(const GeneratorEnvironment& environment);
} kGenerators[] = {
    {telephony::kTechnologyIFX, &GSMLogGenerator::generator},
    {telephony::kTechnologyMRL_GSM, &MRL_GSMLogGenerator::generator},
    {telephony::kTechnologyMRL_CDMA, &C2KLogGenerator::generator},
    {telephony::kTechnologyMRL_LTE, &LTELogGenerator::generator},
    {telephony::kTechnologyMRL_UTRAN2, &UTRANLogGenerator::generator},
};
} // namespace

LogGenerator::LogGenerator(const GeneratorEnvironment& environment)
    : _environment(environment)
{
    systemLog(Priority::warning, "Creating Log object: %p", static_cast<const void*>(this));
}

std::unique_ptr<LogGenerator> LogGenerator::generatorFromTechnology(
    const Value& technology, const GeneratorEnvironment& environment)
{
    for (const auto& [identifier, generator] : kGenerators) {
        if (technology == Value(identifier))
            return generator(environment);
    }
    return nullptr;
}

void LogGenerator::updateHistoryInState(Dictionary& state, const Clock& clock)
{
    ArrayRef history = state["History"].array();
    if (!history) {
        history = Array::make();
        state.set("History", history);
    }
    if (history->size() >= kHistoryLength)
        history->removeFirst(history->size() - (kHistoryLength - 1));
    history->append(entryEndingAtFirstAbsent({
        {"DisplayState", state["DisplayState"]},
        {"Display", state["Display"]},
        {"ExtraInfo", state["ExtraInfo"]},
        {"Date", dateText(clock.now())},
        {"Description", text("Snapshot (%s)", dateText(clock.now()).c_str())},
    }));
}

} // namespace orvex
