#include "MRLLogGenerator.h"

#include "MTLDLFAddVersionReport.h"

#include "Array.h"
#include "SystemLog.h"
#include "TextFormat.h"

#include <utility>

namespace orvex {

namespace {
// What the report has always said in place of the program's name and date.
constexpr const char* kExecutableName = "EXECUTABLE_NAME";
constexpr const char* kBuildDate = "Dec 19 2018 23:59:16";

// Keeps the packets of the newest entries that fit and drops the others. Returns the number of bytes dropped.
std::size_t dropOldestPackets(const Array& history, std::size_t room)
{
    std::size_t dropped = 0;
    for (std::size_t i = history.size(); i > 0; --i) {
        const DictionaryRef entry = history[i - 1].dictionary();
        const BytesRef packets = entry ? (*entry)["DisplayState"].data() : nullptr;
        if (!packets)
            continue;
        if (packets->size() <= room) {
            room -= packets->size();
            continue;
        }
        room = 0;
        dropped += packets->size();
        entry->set("DisplayState", std::make_shared<Bytes>());
    }
    if (dropped > 0)
        systemLog(Priority::warning, "The history dropped its oldest raw packets, %zu bytes", dropped);
    return dropped;
}
} // namespace

MRLLogGenerator::MRLLogGenerator(const GeneratorEnvironment& environment)
    : LogGenerator(environment)
    , _binData(environment.rawPacketLimit)
{
}

std::optional<PiecedBytes> MRLLogGenerator::generateDlfFromState(const Dictionary& state) const
{
    const auto& [resources, clock, buildVersion, rawPacketLimit] = environment();
    const std::string version = buildVersion ? text("Orvex %s", buildVersion->c_str()) : "(none)";
    const Date now = clock.now();
    const Clock::Zone zone = clock.zoneAt(now);
    const MTLDLFTimeInformation time{
        .secondsSince1970 = static_cast<std::uint32_t>(static_cast<std::int64_t>(now.secondsSince1970)),
        .zoneMinutes = static_cast<std::int16_t>(zone.secondsEastOfUTC / 60),
        .isDaylightSaving = static_cast<std::uint8_t>(zone.isDaylightSaving ? 1 : 0),
    };

    const auto report = std::make_shared<Bytes>(kMTLDLFVersionReportLength);
    std::uint32_t written = 0;
    const std::uint32_t result =
        MTLDLFAddVersionReport(report->data(), static_cast<std::uint32_t>(report->size()), written, 1, 1,
            version.c_str(), kExecutableName, kBuildDate, time);
    if (result != 0) {
        systemLog(Priority::dlfFailure, "Could not write DLF header (result=%d)", static_cast<int>(result));
        return std::nullopt;
    }

    PiecedBytes dlf;
    dlf.append(report);
    const ArrayRef history = state["History"].array();
    if (!history)
        return dlf;
    for (const Value& element : *history) {
        const DictionaryRef entry = element.dictionary();
        if (!entry || (*entry)["DisplayState"].isNull())
            continue;
        const BytesRef packets = (*entry)["DisplayState"].data();
        if (!packets) {
            systemLog(Priority::dlfFailure,
                "Got wrong class writing history to DLF; aborting writing the DLF file");
            return std::nullopt;
        }
        if (packets->size() >= 2)
            dlf.append(packets, 1);
    }
    return dlf;
}

ArrayRef MRLLogGenerator::getSaveContentsFromState(const Dictionary& state) const
{
    const ArrayRef history = state["History"].array();
    auto contents = history ? history->shallowCopy() : Array::make();
    if (auto dlf = generateDlfFromState(state)) {
        contents->append(Dictionary::make({
            {"Description", text("DLF binary (%d bytes)", static_cast<int>(dlf->size()))},
            {"DLF", std::move(*dlf)},
        }));
    }
    return contents;
}

void MRLLogGenerator::handOverBinData(Dictionary& state)
{
    // The newest history entry shares these bytes. Without this hold they are freed when that entry loses
    // its packets.
    state.set("DisplayState", Value());
    if (!_binData) {
        _binData.emplace(environment().rawPacketLimit);
        return;
    }
    if (const ArrayRef history = state["History"].array())
        _droppedFromHistory += dropOldestPackets(*history, environment().rawPacketLimit - _binData->size());
    state.set("DisplayState", _binData->take());
}

} // namespace orvex
