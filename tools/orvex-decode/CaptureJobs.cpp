#include "CaptureJobs.h"

#include "JsonWriter.h"
#include "Progress.h"
#include "Reporting.h"
#include "TemporaryFile.h"
#include "WorkerPool.h"

#include "OutputFile.h"

#include <algorithm>
#include <array>
#include <cerrno>
#include <cstring>
#include <iostream>
#include <map>

#include <unistd.h>

namespace orvex {

namespace {

// What a worker writes, until it is its turn.
struct Results {
    TemporaryFile document;
    TemporaryFile complaints;
    TemporaryFile log;
};

class CaptureJobs {
public:
    CaptureJobs(const DecodeOptions& options, const std::function<int(const DecodeOptions&)>& decode)
        : _options(options)
        , _decode(decode)
        , _progress(options.captures)
    {
    }

    int run()
    {
        if (_options.logFile && !openLog())
            return EXIT_FAILURE;
        WorkerPool(_options.jobs)
            .run({_options.captures.size(), [this](std::size_t job) { _results.try_emplace(job); },
                [this](std::size_t job) { return perform(job); },
                [this](std::size_t job, const WorkerPool::End& end) { report(job, end); }});
        closeLog();
        if (!_parts.empty())
            _isGood = printDocument([this](std::ostream& stream) { write(stream); }, _options) && _isGood;
        return _isGood ? EXIT_SUCCESS : EXIT_FAILURE;
    }

private:
    // Calls `take` with all that a part of the documents holds, piece by piece, but for its last bytes.
    template <typename Take>
    void read(std::size_t length, std::size_t omitted, Take take)
    {
        std::array<char, 65536> chunk; // NOLINT(cppcoreguidelines-pro-type-member-init): filled by fread()
        while (length > 0) {
            const std::size_t wanted = std::min(length, chunk.size());
            const std::size_t count = std::fread(chunk.data(), 1, wanted, _documents.stream());
            if (count == 0)
                return;
            length -= count;
            take(std::string_view(chunk.data(), count - (length == 0 ? omitted : 0)));
        }
    }

    void write(std::ostream& stream)
    {
        std::rewind(_documents.stream());
        if (_options.format == DecodeOptions::Format::tree) {
            for (const auto& [capture, length] : _parts)
                read(length, 0, [&](std::string_view piece) { stream << piece; });
            return;
        }
        constexpr std::size_t kLineBreak = 1; // at the end of each document
        JsonWriter json(stream);
        json.beginObject();
        json.key("captures");
        json.beginArray();
        for (const auto& [capture, length] : _parts) {
            json.beginObject();
            json.member("capture", capture);
            json.key("display");
            json.beginText();
            read(length, kLineBreak, [&](std::string_view piece) { json.text(piece); });
            json.endObject();
        }
        json.endArray();
        json.endObject();
        json.endDocument();
    }

    // In the worker.
    int perform(std::size_t job)
    {
        const Results& results = _results.at(job);
        results.document.takePlaceOf(STDOUT_FILENO);
        results.complaints.takePlaceOf(STDERR_FILENO);
        DecodeOptions options = _options;
        options.captures = {_options.captures[job]};
        options.outputFile.reset();
        if (options.logFile)
            options.logFile = results.log.path();
        return _decode(options);
    }

    void report(std::size_t job, const WorkerPool::End& end)
    {
        const std::string& capture = _options.captures[job];
        const Results& results = _results.at(job);
        std::cerr << results.complaints.contents();
        if (!end.death.empty())
            printError(capture + ": decoding " + end.death);
        _isGood = _isGood && end.isGood;
        if (_log && !results.log.appendTo(_log.get()))
            failLog();
        const auto length = results.document.appendTo(_documents.stream());
        if (!length || std::fflush(_documents.stream()) != 0)
            _isGood = printError(capture + ": " + std::strerror(errno)); // NOLINT(concurrency-mt-unsafe)
        else if (*length > 0)
            _parts.push_back({capture, *length});
        _results.erase(job);
        _progress.advanceOverFile(capture);
    }

    bool openLog()
    {
        auto [file, error] = openOutputFile(*_options.logFile);
        _log = std::move(file);
        return _log || printError(*_options.logFile + ": " + error);
    }
    void closeLog()
    {
        if (_log && std::fclose(_log.release()) != 0)
            failLog();
    }
    void failLog()
    {
        _isGood =
            printError(*_options.logFile + ": " + std::strerror(errno)); // NOLINT(concurrency-mt-unsafe)
    }

    const DecodeOptions& _options;
    const std::function<int(const DecodeOptions&)>& _decode;
    Progress _progress;
    FilePointer _log;
    std::map<std::size_t, Results> _results; // of jobs that are not yet reported
    // All documents, back to back, and whose they are.
    struct Part {
        std::string capture;
        std::size_t length;
    };
    TemporaryFile _documents;
    std::vector<Part> _parts;
    bool _isGood = true;
};

} // namespace

int decodeInJobs(const DecodeOptions& options, const std::function<int(const DecodeOptions&)>& decode)
{
    try {
        return CaptureJobs(options, decode).run();
    } catch (const TemporaryFile::Failure& failure) {
        printError(failure.what());
        return EXIT_FAILURE;
    }
}

} // namespace orvex
