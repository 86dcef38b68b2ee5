#include "CaptureTechnology.h"

#include "Array.h"
#include "CaptureReader.h"
#include "LogCode.h"
#include "MessageFrame.h"
#include "PropertyList.h"
#include "TelephonyConstants.h"

#include <map>

namespace orvex {

namespace {

constexpr int kMessagesRead = 10'000;

using Counts = std::map<LogCode, std::size_t>;

std::size_t countOf(const Counts& counts, const Value& codes, LogCode base)
{
    std::size_t sum = 0;
    const ArrayRef list = codes.array();
    if (!list)
        return 0;
    for (const Value& code : *list) {
        const auto found =
            code.integer() ? counts.find(base + static_cast<LogCode>(*code.integer())) : counts.end();
        sum += found == counts.end() ? 0 : found->second;
    }
    return sum;
}

} // namespace

std::string technologyOfCapture(const std::string& path, const GeneratorEnvironment& environment)
{
    const auto reader = CaptureReader::open(path);
    Counts counts;
    for (int i = 0; i < kMessagesRead && reader->next() == CaptureReader::Status::message; ++i) {
        if (i == 0 && propertyListFromData(reader->message()).value)
            return telephony::kTechnologyIFX;
        if (const MessageFrame frame(reader->message()); frame.isComplete())
            ++counts[frame.logCode()];
    }
    std::string best;
    std::size_t most = 0;
    for (const char* technology : telephony::kTechnologies) {
        const DictionaryRef command =
            LogGenerator::generatorFromTechnology(technology, environment)->getStartCommand();
        const std::size_t wanted = countOf(counts, (*command)[telephony::kSetMarlinLogCodes], 0)
            + countOf(counts, (*command)[telephony::kSetKoratExtraCodes], kExtraCodeBase);
        if (wanted > most) {
            most = wanted;
            best = technology;
        }
    }
    return best;
}

} // namespace orvex
