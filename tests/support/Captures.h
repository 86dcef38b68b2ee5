#pragma once

#include "CaptureReader.h"
#include "TelephonyConstants.h"

#include <stdexcept>
#include <string>
#include <vector>

namespace orvex::test {

using telephony::kTechnologies;

// The capture that koratd plays by default.
inline std::string capturePath(const std::string& technology)
{
    return ORVEX_CAPTURES "/" + technology + ".pcap";
}

inline std::vector<Bytes> captureOf(const std::string& technology)
{
    const auto reader = CaptureReader::open(capturePath(technology));
    std::vector<Bytes> messages;
    auto status = reader->next();
    for (; status == CaptureReader::Status::message; status = reader->next())
        messages.emplace_back(reader->message().begin(), reader->message().end());
    if (status != CaptureReader::Status::end)
        throw std::runtime_error(reader->error());
    return messages;
}

} // namespace orvex::test
