#include "CaptureJobs.h"

#include "Progress.h"
#include "Reporting.h"
#include "TemporaryFile.h"
#include "TreeJson.h"
#include "WorkerPool.h"

#include <nlohmann/json.hpp>

#include <cerrno>
#include <cstring>
#include <iostream>
#include <map>

#include <unistd.h>

namespace orvex {

namespace {

using Json = nlohmann::ordered_json;

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
        if (!_documents.empty() || !_json.empty())
            _isGood = printDocument(document(), _options) && _isGood;
        return _isGood ? EXIT_SUCCESS : EXIT_FAILURE;
    }

private:
    bool isJson() const { return _options.format == DecodeOptions::Format::json; }
    std::string document() const { return isJson() ? documentText({{"captures", _json}}) : _documents; }

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
            complain(capture + ": decoding " + end.death);
        _isGood = _isGood && end.isGood;
        if (_log && !results.log.appendTo(_log))
            failLog();
        const std::string document = results.document.contents();
        if (!isJson())
            _documents += document;
        else if (!document.empty())
            _json.push_back({{"capture", capture}, {"display", Json::parse(document)}});
        _results.erase(job);
        _progress.advanceOverFile(capture);
    }

    bool openLog()
    {
        _log = std::fopen(_options.logFile->c_str(), "we");
        if (!_log)
            failLog();
        return _log;
    }
    void closeLog()
    {
        if (_log && std::fclose(_log) != 0)
            failLog();
    }
    void failLog()
    {
        _isGood = complain(*_options.logFile + ": " + std::strerror(errno)); // NOLINT(concurrency-mt-unsafe)
    }

    const DecodeOptions& _options;
    const std::function<int(const DecodeOptions&)>& _decode;
    Progress _progress;
    std::FILE* _log = nullptr;
    std::map<std::size_t, Results> _results; // of jobs that are not yet reported
    std::string _documents;
    Json _json = Json::array();
    bool _isGood = true;
};

} // namespace

int decodeInJobs(const DecodeOptions& options, const std::function<int(const DecodeOptions&)>& decode)
{
    return CaptureJobs(options, decode).run();
}

} // namespace orvex
