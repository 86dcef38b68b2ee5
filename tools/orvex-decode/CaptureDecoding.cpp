#include "CaptureDecoding.h"

#include "CaptureSampler.h"
#include "ReadAhead.h"

#include "Snapshot.h"
#include "TelephonyConstants.h"
#include "TextFormat.h"

#include <algorithm>

namespace orvex {

namespace {

// 1234567 as "1,234,567".
std::string grouped(std::size_t number)
{
    std::string digits = std::to_string(number);
    for (std::size_t place = digits.size(); place > 3; place -= 3)
        digits.insert(place - 3, 1, ',');
    return digits;
}

std::string labelOf(const std::string& path)
{
    return path == kStandardStream ? "standard input" : path;
}

// Readers put the path in front; here it is known.
std::string reasonOf(const CaptureReader& reader, const std::string& path)
{
    const std::string prefix = labelOf(path) + ": ";
    return reader.error().starts_with(prefix) ? reader.error().substr(prefix.size()) : reader.error();
}

struct FoundTechnology {
    std::string name;
    std::string error; // why there is none
};

FoundTechnology technologyOf(
    PeekedCapture& capture, const DecodedCapture& result, const TechnologyGuess& guess)
{
    const TechnologyGuess::Counts codes = capture.peekCodes();
    if (const std::string name = guess.best(codes); !name.empty())
        return {name, {}};
    if (!codes.empty())
        return {{}, "its messages do not tell their technology; name it with --technology"};
    if (capture.next() == CaptureReader::Status::broken)
        return {{}, reasonOf(capture, result.path)};
    return {{}, "holds no messages that tell its technology; name it with --technology"};
}

} // namespace

CaptureDecoding::CaptureDecoding(
    const DecodeOptions& options, Platform& platform, const TechnologyGuess& guess, TimelineOutput* timeline)
    : _options(options)
    , _platform(platform)
    , _guess(guess)
    , _timeline(timeline)
{
}

CaptureDecoding::~CaptureDecoding() = default;

void CaptureDecoding::decodeAll()
{
    Progress progress(_options);
    for (const std::string& path : _options.inputs) {
        _captures.emplace_back().path = path;
        decode(_captures.back(), progress);
    }
    endSession();
}

void CaptureDecoding::decode(DecodedCapture& capture, Progress& progress)
{
    PeekedCapture reader(
        std::make_unique<ReadAhead>(capture.path == kStandardStream ? CaptureReader::openStandardInput()
                                                                    : CaptureReader::open(capture.path)));
    capture.technology = _options.technology;
    if (capture.technology.empty()) {
        const auto [name, error] = technologyOf(reader, capture, _guess);
        if (!error.empty()) {
            fail(capture, error);
            return;
        }
        capture.technology = name;
    }
    if (_options.task == DecodeOptions::Task::summarize) {
        feed(capture, reader, nullptr, progress);
        return;
    }
    if (!beginSession(capture))
        return;
    if (_timeline) {
        feedSampled(capture, reader, progress);
        return;
    }
    feed(capture, reader, wouldEndSession(reader) ? nullptr : &*_session, progress);
    if (capture.hasFailed())
        return;
    _lastOfSession = _captures.size() - 1;
    if (_options.format == DecodeOptions::Format::json && _options.inputs.size() > 1)
        capture.display = _session->shown().deepCopy(); // the next capture may change it
}

// IFX ends the process at the first message that is no property list. When the user named it for a capture of
// another technology, that helps nobody.
bool CaptureDecoding::wouldEndSession(PeekedCapture& capture) const
{
    if (_options.technology != telephony::kTechnologyIFX)
        return false;
    const std::string likely = _guess.best(capture.peekCodes());
    return !likely.empty() && likely != _options.technology;
}

void CaptureDecoding::feed(
    DecodedCapture& capture, CaptureReader& reader, OfflineSession* session, Progress& progress)
{
    capture.counts.emplace(_guess.kindsOf(capture.technology));
    CaptureReader::Status status = reader.next();
    for (; status == CaptureReader::Status::message; status = reader.next()) {
        if (_sampler)
            _sampler->take(reader.message(), reader.time());
        _platform.clock.setTime(reader.time());
        capture.counts->add(reader.message(), reader.time());
        if (session)
            session->take(reader.message());
        progress.advance(reader.message().size());
    }
    if (const std::string omissions = reader.omissions(); !omissions.empty())
        addNote(capture, omissions);
    const CaptureCounts::Row total = capture.counts->total();
    if (status == CaptureReader::Status::broken) {
        const std::string reason = reasonOf(reader, capture.path);
        if (total.messages == 0)
            fail(capture, reason);
        else
            addError(capture, text("%s (after %zu whole messages)", reason.c_str(), total.messages));
    }
    noteWrongTechnology(capture);
}

void CaptureDecoding::feedSampled(DecodedCapture& capture, PeekedCapture& reader, Progress& progress)
{
    if (wouldEndSession(reader)) {
        fail(capture, "does not look like " + _technology);
        return;
    }
    _timeline->begin(capture);
    _sampler = std::make_unique<CaptureSampler>(_options.sampling, *_session, *_timeline);
    feed(capture, reader, &*_session, progress);
    const auto sampler = std::move(_sampler);
    if (capture.hasFailed())
        return;
    if (!sampler->finish()) {
        fail(capture, "no message has a time");
        return;
    }
    if (const std::string note = sampler->clockNote(); !note.empty())
        addNote(capture, note);
    for (const std::string& path : sampler->missingFields())
        addNote(capture, "nothing was shown at " + path);
    _lastOfSession = _captures.size() - 1;
    endSession();
    if (const std::string error = _timeline->end(capture); !error.empty())
        _isGood = printError(error);
}

void CaptureDecoding::noteWrongTechnology(DecodedCapture& capture)
{
    if (!capture.counts)
        return;
    std::size_t telling = 0;
    for (const auto& [code, row] : capture.counts->rows()) {
        if (tellsTechnology(code) && row.kind)
            return;
        telling += tellsTechnology(code) ? row.messages : 0;
    }
    if (telling == 0)
        return;
    const std::string likely = _guess.best(capture.counts->messagesByCode());
    addNote(capture,
        "0 of " + grouped(telling) + " messages were for " + capture.technology
            + (likely.empty() ? "" : "; they look like " + likely));
}

bool CaptureDecoding::beginSession(DecodedCapture& capture)
{
    if (_session && _technology == capture.technology && !_timeline)
        return true;
    if (_session && _options.snapshotFile) {
        fail(capture, "is of " + capture.technology + "; the snapshot is of " + _technology);
        return false;
    }
    endSession();
    auto generator = _platform.generatorFor(capture.technology);
    if (const std::string error = generator->templateError({}); !error.empty()) {
        if (_timeline) { // which would say that nothing was shown
            fail(capture, error);
            return false;
        }
        capture.errors.push_back(error);
        _isGood = printError(error);
    }
    _session.emplace(std::move(generator), _options.refreshEvery);
    _technology = capture.technology;
    return true;
}

void CaptureDecoding::endSession()
{
    if (_lastOfSession) {
        DecodedCapture& last = _captures[*_lastOfSession];
        last.display = _session->display();
        last.endsSession = true;
    }
    _lastOfSession.reset();
}

void CaptureDecoding::save()
{
    if (std::ranges::all_of(_captures, &DecodedCapture::hasFailed))
        return;
    const Snapshot snapshot{dateText(_platform.clock.now()), _session->saveContents(), _options.description};
    const std::string fault = writeSnapshot(snapshot, *_options.snapshotFile);
    if (!fault.empty()) {
        _isGood = printError(fault);
        return;
    }
    if (const std::size_t dropped = _session->droppedRawBytes(); dropped > 0) {
        printNote(text("%s: lacks the oldest %zu bytes of raw messages; a snapshot holds up to %zu MiB",
                      _options.snapshotFile->c_str(), dropped, RawPackets::kLimit >> 20),
            _options);
    }
}

void CaptureDecoding::fail(DecodedCapture& capture, const std::string& why)
{
    capture.failure = why;
    capture.counts.reset();
    _isGood = printError(labelOf(capture.path) + ": " + why);
}

void CaptureDecoding::addError(DecodedCapture& capture, const std::string& error)
{
    capture.errors.push_back(error);
    _isGood = printError(labelOf(capture.path) + ": " + error);
}

void CaptureDecoding::addNote(DecodedCapture& capture, const std::string& note)
{
    capture.errors.push_back(note);
    printNote(labelOf(capture.path) + ": " + note, _options);
}

} // namespace orvex
