#include "Subscription.h"

#include "Array.h"
#include "Dictionary.h"
#include "TelephonyConstants.h"

#include <algorithm>

namespace orvex::korat {

namespace {
constexpr std::int64_t kLargestCode = 0xFFFF;
}

Subscription::Subscription(const Dictionary& startCommand)
    : _wantsEverything(!startCommand.contains(telephony::kSetMarlinLogCodes)
        && !startCommand.contains(telephony::kSetKoratExtraCodes))
{
    const auto add = [&](const char* key, LogCode base) {
        const ArrayRef codes = startCommand[key].array();
        if (!codes)
            return;
        for (const Value& code : *codes) {
            if (const auto* number = code.integer(); number && *number >= 0 && *number <= kLargestCode)
                _codes.insert(base + static_cast<LogCode>(*number));
        }
    };
    add(telephony::kSetMarlinLogCodes, 0);
    add(telephony::kSetKoratExtraCodes, kExtraCodeBase);
}

bool Subscription::isStartCommand(const Dictionary& command)
{
    return command[telephony::kSetState] == Value(telephony::kStreaming);
}

bool Subscription::wantsAny(const std::vector<LogCode>& codes) const
{
    return codes.empty()
        || std::any_of(codes.begin(), codes.end(), [this](LogCode code) { return wants(code); });
}

} // namespace orvex::korat
