// Decodes packets with any template. The first byte selects the technology; the first message is the
// template.

#include "FuzzSession.h"
#include "FuzzTarget.h"

#include "PropertyList.h"
#include "TelephonyConstants.h"

int LLVMFuzzerTestOneInput(const std::uint8_t* data, std::size_t size)
{
    using namespace orvex;
    if (size == 0)
        return 0;
    fuzz::InputMessages messages({data + 1, size - 1});
    const auto list = propertyListFromData(messages.next().value_or(Bytes()));
    if (const auto skeleton = list.value ? list.value->dictionary() : nullptr)
        fuzz::FuzzSession(telephony::kTechnologies[data[0] % std::size(telephony::kTechnologies)], skeleton)
            .run(messages);
    return 0;
}
