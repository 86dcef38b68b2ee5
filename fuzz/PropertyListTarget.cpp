// A property list in either form. What could be read can be written, and then says the same.

#include "FuzzTarget.h"

#include "PropertyList.h"

namespace {

// Binary lists may share containers; what a short one stands for would take seconds at the usual limit.
constexpr orvex::PropertyListLimits kLimits{.maximumBytes = 1 << 20, .maximumNodes = 20'000};
// XML has a dictionary for a UID, one more level.
constexpr orvex::PropertyListLimits kLimitsOfWritten{.maximumDepth = 257};

} // namespace

int LLVMFuzzerTestOneInput(const std::uint8_t* data, std::size_t size)
{
    using namespace orvex;
    const auto list = propertyListFromData({data, size}, kLimits);
    fuzz::require(list.value.has_value() == list.error.empty(), "a value or the reason why there is none");
    if (!list.value)
        return 0;
    const auto xml = propertyListXML(*list.value);
    const auto binary = propertyListBinary(*list.value);
    fuzz::require(binary.has_value(), "what was read has a binary form");
    if (!xml) // a date that XML does not have
        return 0;
    for (const auto& form : {*xml, *binary}) {
        const auto again = propertyListFromData(form, kLimitsOfWritten);
        fuzz::require(again.value.has_value(), "a list that was written can be read");
        fuzz::require(propertyListXML(*again.value) == xml, "a list that was written and read is the same");
    }
    return 0;
}
