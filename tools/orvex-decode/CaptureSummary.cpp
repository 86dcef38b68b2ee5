#include "CaptureSummary.h"

#include "CaptureClock.h"
#include "Envelope.h"

#include "TextFormat.h"
#include "VisibleText.h"

#include <cmath>

namespace orvex {

namespace {

using Row = CaptureCounts::Row;

// In UTC, as "2026-11-16 05:54:31.123456"; empty when the capture does not know.
std::string timeText(std::chrono::microseconds time)
{
    if (!captureDate(time))
        return {};
    const auto seconds = std::chrono::floor<std::chrono::seconds>(time);
    const std::string wholeSeconds = dateText({static_cast<double>(seconds.count())}).substr(0, 19);
    return text("%s.%06d", wholeSeconds.c_str(), static_cast<int>((time - seconds).count()));
}

std::string codeText(LogCode code)
{
    switch (code) {
    case kCodeOfPropertyList: return "plist";
    case kCodeOfNoPacket: return "none";
    default: return text("0x%04X", static_cast<unsigned>(code));
    }
}

void writeLine(std::ostream& stream, const std::string& code, const Row& row, const std::string& name)
{
    const auto milliseconds = [](std::chrono::microseconds time) {
        const std::string moment = timeText(time);
        return moment.empty() ? "-" : moment.substr(0, moment.size() - 3);
    };
    std::string line = text("%-8s %9zu %11zu %9zu %9zu %9zu  %-23s  %-23s  %s", code.c_str(), row.messages,
        row.bytes, row.decoded, row.tooShort, row.unwanted(), milliseconds(row.first).c_str(),
        milliseconds(row.last).c_str(), name.c_str());
    line.erase(line.find_last_not_of(' ') + 1);
    stream << line << '\n';
}

void writeTable(std::ostream& stream, const DecodedCapture& capture)
{
    stream << visibleText(capture.path) << ": " << capture.technology << '\n'
           << text("%-8s %9s %11s %9s %9s %9s  %-23s  %-23s  %s\n", "Code", "Packets", "Bytes", "Decoded",
                  "Too short", "Unwanted", "First", "Last", "Name");
    for (const auto& [code, row] : capture.counts->rows())
        writeLine(stream, codeText(code), row, row.kind ? row.kind->name : "");
    writeLine(stream, "total", capture.counts->total(), "");
}

void writeRowJson(JsonWriter& json, LogCode code, const Row& row)
{
    json.beginObject();
    json.member("code", codeText(code));
    if (row.kind)
        json.member("name", row.kind->name);
    json.member("packets", row.messages);
    json.member("bytes", row.bytes);
    json.member("decoded", row.decoded);
    json.member("tooShort", row.tooShort);
    json.member("unwanted", row.unwanted());
    for (const auto& [name, time] : {std::pair("first", row.first), std::pair("last", row.last)}) {
        if (const std::string moment = timeText(time); !moment.empty()) // ISO 8601
            json.member(name, moment.substr(0, 10) + 'T' + moment.substr(11) + 'Z');
    }
    json.endObject();
}

void writeJson(JsonWriter& json, const DecodedCapture& capture)
{
    beginEnvelope(json, capture);
    if (capture.counts) {
        json.key("summary");
        writeSummaryJson(json, *capture.counts);
    }
    json.endObject();
}

} // namespace

void writeSummaryJson(JsonWriter& json, const CaptureCounts& counts)
{
    json.beginArray();
    for (const auto& [code, row] : counts.rows())
        writeRowJson(json, code, row);
    json.endArray();
}

void writeSummaries(
    const std::vector<DecodedCapture>& captures, const DecodeOptions& options, std::ostream& stream)
{
    if (options.format == DecodeOptions::Format::json) {
        writeDocuments(stream, captures, writeJson);
        return;
    }
    bool isFirst = true;
    for (const DecodedCapture& capture : captures) {
        if (!capture.counts)
            continue;
        stream << (isFirst ? "" : "\n");
        isFirst = false;
        writeTable(stream, capture);
    }
}

} // namespace orvex
