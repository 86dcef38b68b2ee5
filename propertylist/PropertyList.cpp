#include "PropertyList.h"

#include "PropertyListReaders.h"

#include <utility>

namespace orvex {

namespace {
PropertyListResult failure(const std::string& why)
{
    return {std::nullopt, "No property list: " + why};
}

// The copy gives the bytes to the reader that overwrites them.
template <typename Copy>
PropertyListResult read(ByteView data, const PropertyListLimits& limits, Copy copy)
{
    if (data.size() > limits.maximumBytes)
        return failure("longer than " + std::to_string(limits.maximumBytes) + " bytes");
    if (data.empty())
        return failure("no data");
    try {
        const std::string_view text(reinterpret_cast<const char*>(data.data()), data.size());
        if (text.starts_with("bplist"))
            return {readBinaryPropertyList(data, limits), {}};
        return {readXMLPropertyList(copy(), limits), {}};
    } catch (const PropertyListFault& fault) {
        return failure(fault.what());
    }
}
} // namespace

PropertyListResult propertyListFromData(ByteView data, const PropertyListLimits& limits)
{
    return read(data, limits, [data] { return Bytes(data.begin(), data.end()); });
}

PropertyListResult propertyListFromData(Bytes&& data, const PropertyListLimits& limits)
{
    return read(data, limits, [&data] { return std::move(data); });
}

} // namespace orvex
