#include "PropertyList.h"

#include "PropertyListReaders.h"

#include <algorithm>
#include <utility>

namespace orvex {

namespace {
PropertyListResult failure(const std::string& why)
{
    return {std::nullopt, "No property list: " + why};
}

// Copied, because the reader overwrites the bytes.
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
    return read(data, limits, [data] {
        Bytes copy(data.size() + kXMLPadding.size());
        std::ranges::copy(data, copy.begin());
        std::ranges::copy(kXMLPadding, copy.end() - kXMLPadding.size());
        return copy;
    });
}

PropertyListResult propertyListFromData(Bytes&& data, const PropertyListLimits& limits)
{
    return read(data, limits, [&data] {
        data.insert(data.end(), kXMLPadding.begin(), kXMLPadding.end());
        return std::move(data);
    });
}

} // namespace orvex
