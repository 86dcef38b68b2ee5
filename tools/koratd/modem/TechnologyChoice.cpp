#include "modem/TechnologyChoice.h"

#include "TelephonyConstants.h"

namespace orvex::korat {

namespace {
const char* technologyOf(Radio radio)
{
    switch (radio) {
    case Radio::gsm:
    case Radio::umts: return telephony::kTechnologyMRL_GSM;
    case Radio::tdscdma: return telephony::kTechnologyMRL_UTRAN2;
    case Radio::lte: return telephony::kTechnologyMRL_LTE;
    default: return telephony::kTechnologyIFX; // shows anything
    }
}

// Empty when nothing speaks for a technology just now.
std::string wantedBy(const ModemState& state)
{
    if (state.condition != Condition::enabled)
        return {};
    if (const Cell* cell = state.servingCell())
        return technologyOf(cell->radio);
    switch (state.cellAnswer) {
    case CellAnswer::notSupported:
    case CellAnswer::denied: return telephony::kTechnologyIFX; // the others would stay empty
    case CellAnswer::notAsked: return state.radio ? technologyOf(*state.radio) : "";
    default: return {};
    }
}
} // namespace

const std::string& TechnologyChoice::choose(const ModemState& state)
{
    if (const std::string wanted = wantedBy(state); !wanted.empty())
        _current = wanted;
    if (_current.empty())
        _current = telephony::kTechnologyIFX;
    _next.clear();
    return _current;
}

const std::string& TechnologyChoice::follow(const ModemState& state, Time now)
{
    const std::string wanted = wantedBy(state);
    if (wanted.empty() || wanted == _current) {
        _next.clear();
    } else if (wanted != _next) {
        _next = wanted;
        _since = now;
    } else if (now - _since >= kSettleTime) {
        _current = wanted;
        _next.clear();
    }
    return _current;
}

} // namespace orvex::korat
