#include "ReportOutput.h"

#include "CaptureClock.h"
#include "CaptureSummary.h"

#include "NodesByPath.h"
#include "OrvexModelNode.h"
#include "ReportPage.h"

#include <filesystem>
#include <utility>

namespace orvex {

ReportOutput::ReportOutput(std::string path, std::chrono::milliseconds every, std::string& error)
    : _path(std::move(path))
    , _every(every)
    , _file(_path)
{
    if (error.empty() && !_file.error().empty())
        error = _path + ": " + _file.error();
}

void ReportOutput::begin(const DecodedCapture& capture)
{
    _report.emplace(capture.technology);
}

void ReportOutput::message(ByteView /*message*/, std::chrono::microseconds time)
{
    if (captureDate(time))
        _report->takeMessage(time);
}

std::string ReportOutput::end(const DecodedCapture& capture)
{
    _report->finish();
    writeReportPage(_file.stream(), [&](JsonWriter& json) { write(json, capture); });
    const std::string error = _file.commit();
    return error.empty() ? error : _path + ": " + error;
}

void ReportOutput::write(JsonWriter& json, const DecodedCapture& capture) const
{
    const CaptureCounts::Row total = capture.counts->total();
    json.beginObject();
    json.member("version", ORVEX_VERSION);
    json.member("name",
        capture.path == kStandardStream ? "Standard input"
                                        : std::filesystem::path(capture.path).filename().string());
    json.member("technology", capture.technology);
    json.member("messages", total.messages);
    json.member("bytes", total.bytes);
    json.member("every", static_cast<std::size_t>(_every.count()));
    json.key("notes");
    json.beginArray();
    for (const std::string& error : capture.errors)
        json.string(error);
    json.endArray();
    _report->writeJson(json);
    json.key("codes");
    writeSummaryJson(json, *capture.counts);
    NodesByPath paths;
    json.key("tree");
    writeTreeJson(json, *OrvexModelNode::makeTreeFromObject(capture.display, paths));
    json.endObject();
    json.endDocument();
}

} // namespace orvex
