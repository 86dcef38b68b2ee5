#pragma once

#include "CaptureCounts.h"
#include "DecodeOptions.h"
#include "OfflineSession.h"
#include "PeekedCapture.h"
#include "Platform.h"
#include "Reporting.h"

#include <memory>
#include <optional>
#include <string>
#include <vector>

namespace orvex {

class CaptureSampler;
class TimelineOutput;

// What came of a capture.
struct DecodedCapture {
    bool hasFailed() const { return !failure.empty(); }

    std::string path;                    // as the user gave it
    std::string technology;              // empty while it is not known
    std::string failure;                 // why nothing could be read; empty when something was
    std::optional<CaptureCounts> counts; // present unless it failed
    std::vector<std::string> errors;     // what is missing or looks wrong, a line each
    Value display;                       // after its last message
    bool endsSession = false;            // the next capture is of another technology, or there is none
};

// Decodes captures one after the other. Captures of the same technology make one session; another technology
// begins a new one. For a summary, counts their messages and decodes none. For a timeline, each capture is a
// session of its own.
class CaptureDecoding {
public:
    // Prints errors and notes as they come up. The timeline is there if the options want one.
    CaptureDecoding(const DecodeOptions& options, Platform& platform, const TechnologyGuess& guess,
        TimelineOutput* timeline = nullptr);
    ~CaptureDecoding();
    CaptureDecoding(const CaptureDecoding&) = delete;
    CaptureDecoding& operator=(const CaptureDecoding&) = delete;

    void decodeAll();
    // Saves the session, of which there is one at most, in the options' snapshot file.
    void save();

    const std::vector<DecodedCapture>& captures() const { return _captures; }
    // False once anything could not be read or written as wanted.
    bool isGood() const { return _isGood; }

private:
    void decode(DecodedCapture& capture, Progress& progress);
    bool wouldEndSession(PeekedCapture& capture) const;
    // A null session gets nothing; the messages are counted.
    void feed(DecodedCapture& capture, CaptureReader& reader, OfflineSession* session, Progress& progress);
    void feedSampled(DecodedCapture& capture, PeekedCapture& reader, Progress& progress);
    void noteWrongTechnology(DecodedCapture& capture);
    bool beginSession(DecodedCapture& capture);
    void endSession();
    void fail(DecodedCapture& capture, const std::string& why);
    void addError(DecodedCapture& capture, const std::string& error);
    void addNote(DecodedCapture& capture, const std::string& note);

    const DecodeOptions& _options;
    Platform& _platform;
    const TechnologyGuess& _guess;
    TimelineOutput* _timeline;
    std::unique_ptr<CaptureSampler> _sampler; // of the capture that is fed, if it is sampled
    std::vector<DecodedCapture> _captures;
    std::optional<OfflineSession> _session;
    std::string _technology;                   // the session's
    std::optional<std::size_t> _lastOfSession; // the capture that the session read last
    bool _isGood = true;
};

} // namespace orvex
