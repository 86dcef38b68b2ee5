#include "FuzzSession.h"
#include "FuzzTarget.h"

#include "TelephonyConstants.h"

int LLVMFuzzerTestOneInput(const std::uint8_t* data, std::size_t size)
{
    using namespace orvex;
    fuzz::FuzzSession(telephony::kTechnologyMRL_LTE).run(fuzz::InputMessages({data, size}));
    return 0;
}
