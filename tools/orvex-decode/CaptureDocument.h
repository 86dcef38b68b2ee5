#pragma once

#include "CaptureDecoding.h"
#include "TreeJson.h"

#include "OrvexModelNode.h"

#include <ostream>
#include <string>
#include <vector>

namespace orvex {

// What is printed of captures: the display tree at the end of each session or, in JSON, after each capture.
class CaptureDocument {
public:
    // The captures and the options outlive the document.
    CaptureDocument(const std::vector<DecodedCapture>& captures, const DecodeOptions& options);

    // False when there is nothing to print.
    bool hasContent() const;
    // True when a display has no row or branch at the options' path.
    bool lacksPath() const;
    void write(std::ostream& stream) const;

private:
    // A capture, and what is printed of its display: null when there is no display, or nothing at the path.
    struct Entry {
        const DecodedCapture* capture;
        OrvexModelNodeRef node;
    };

    bool isTreeWanted(const DecodedCapture& capture) const;
    void writeTrees(std::ostream& stream) const;
    void writeJson(JsonWriter& json, const Entry& entry) const;

    const DecodeOptions& _options;
    std::vector<Entry> _entries;
};

} // namespace orvex
