#include "PropertyList.h"

#include "BinaryPropertyListReader.h"
#include "PropertyListCount.h"
#include "XMLPropertyListReader.h"

namespace orvex {

namespace {
PropertyListResult failure(const std::string& why)
{
    return {std::nullopt, "No property list: " + why};
}
} // namespace

PropertyListResult propertyListFromData(std::span<const std::uint8_t> data, const PropertyListLimits& limits)
{
    if (data.size() > limits.maximumBytes)
        return failure("longer than " + std::to_string(limits.maximumBytes) + " bytes");
    if (data.empty())
        return failure("no data");
    std::string_view text(reinterpret_cast<const char*>(data.data()), data.size());
    try {
        if (text.starts_with("bplist"))
            return {readBinaryPropertyList(data, limits), {}};
        constexpr std::string_view kByteOrderMark = "\xEF\xBB\xBF";
        if (text.starts_with(kByteOrderMark))
            text.remove_prefix(kByteOrderMark.size());
        return {readXMLPropertyList(text, limits), {}};
    } catch (const PropertyListFault& fault) {
        return failure(fault.what());
    }
}

} // namespace orvex
