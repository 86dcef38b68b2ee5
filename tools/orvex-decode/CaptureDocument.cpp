#include "CaptureDocument.h"

#include "Envelope.h"

#include "DisplayTreePrinter.h"
#include "NodesByPath.h"
#include "VisibleText.h"

#include <algorithm>

namespace orvex {

CaptureDocument::CaptureDocument(const std::vector<DecodedCapture>& captures, const DecodeOptions& options)
    : _options(options)
{
    for (const DecodedCapture& capture : captures) {
        NodesByPath nodes;
        if (isTreeWanted(capture))
            OrvexModelNode::makeTreeFromObject(capture.display, nodes);
        _entries.push_back({&capture, nodes[options.path]});
    }
}

bool CaptureDocument::isTreeWanted(const DecodedCapture& capture) const
{
    return !capture.hasFailed() && (_options.format == DecodeOptions::Format::json || capture.endsSession);
}

bool CaptureDocument::hasContent() const
{
    return _options.format == DecodeOptions::Format::json
        || std::ranges::any_of(_entries, [](const Entry& entry) { return entry.node != nullptr; });
}

bool CaptureDocument::lacksPath() const
{
    return std::ranges::any_of(
        _entries, [this](const Entry& entry) { return !entry.node && isTreeWanted(*entry.capture); });
}

void CaptureDocument::write(std::ostream& stream) const
{
    if (_options.format == DecodeOptions::Format::tree)
        writeTrees(stream);
    else
        writeDocuments(
            stream, _entries, [this](JsonWriter& json, const Entry& entry) { writeJson(json, entry); });
}

void CaptureDocument::writeTrees(std::ostream& stream) const
{
    const auto sessions =
        std::ranges::count(_entries, true, [](const Entry& entry) { return entry.capture->endsSession; });
    for (const auto& [capture, node] : _entries) {
        if (!node)
            continue;
        if (sessions > 1)
            stream << "==> " << visibleText(capture->path) << ": " << capture->technology << " <==\n";
        stream << DisplayTreePrinter::text(*node, longestText(_options));
    }
}

void CaptureDocument::writeJson(JsonWriter& json, const Entry& entry) const
{
    beginEnvelope(json, *entry.capture);
    if (entry.node) {
        json.key("tree");
        writeTreeJson(json, *entry.node, _options.path);
    }
    json.endObject();
}

} // namespace orvex
