#include "CaptureDecoding.h"
#include "CaptureDocument.h"
#include "CaptureSummary.h"
#include "DecodeOptions.h"
#include "Envelope.h"
#include "FileConflict.h"
#include "Platform.h"
#include "Reporting.h"
#include "SnapshotDiff.h"
#include "SnapshotDocument.h"
#include "TimelineOutputs.h"
#include "database/DatabaseMerge.h"

#include "LinuxSystemLog.h"
#include "Process.h"
#include "Snapshot.h"
#include "SystemLog.h"
#include "TextFormat.h"

#include <algorithm>
#include <filesystem>
#include <memory>

using namespace orvex;

namespace {

constexpr int kFailure = 1;
constexpr int kTrouble = 2; // of a comparison, whose 1 says that there are differences

// Returns why the files cannot be used together; empty when they can.
std::string conflictOf(const DecodeOptions& options)
{
    std::vector<FileInUse> inputs;
    for (const std::string& input : options.inputs) {
        const bool isStream = input == kStandardStream;
        inputs.push_back(
            {isStream ? "standard input" : "the input " + input, isStream ? "/dev/stdin" : input});
    }
    const std::string resources = options.resources.value_or(FileResources::defaultDirectory());
    for (const std::string& name : FileResources(resources).propertyListPaths())
        inputs.push_back({"the template " + name, std::filesystem::path(resources) / name});

    std::vector<FileInUse> outputs;
    if (!options.outputFile && options.task != DecodeOptions::Task::sample
        && options.task != DecodeOptions::Task::mergeDatabases)
        outputs.push_back({"standard output", "/dev/stdout"});
    const std::pair<const char*, const std::optional<std::string>*> files[] = {
        {"--output ", &options.outputFile},
        {"--log ", &options.logFile},
        {"--snapshot ", &options.snapshotFile},
        {"--dlf ", &options.dlfFile},
        {"--timeline ", &options.timelineFile},
        {"--report ", &options.reportFile},
    };
    for (const auto& [option, path] : files) {
        if (*path)
            outputs.push_back({option + **path, **path});
    }
    return fileConflict(inputs, outputs);
}

int decodeCaptures(const DecodeOptions& options, Platform& platform, const TechnologyGuess& guess)
{
    CaptureDecoding decoding(options, platform, guess);
    decoding.decodeAll();
    bool isGood = decoding.isGood();
    // Whatever could be read is shown. With no message at all there is no tree.
    const CaptureDocument document(decoding.captures(), options);
    if (document.lacksPath())
        isGood = printError("no row or branch of the display is at " + options.path);
    if (document.hasContent())
        isGood = printDocument([&](std::ostream& stream) { document.write(stream); }, options) && isGood;
    if (options.snapshotFile) {
        decoding.save();
        isGood = decoding.isGood() && isGood;
    }
    return isGood ? 0 : kFailure;
}

int sampleCaptures(const DecodeOptions& options, Platform& platform, const TechnologyGuess& guess)
{
    TimelineOutputs outputs(options);
    if (!outputs.error().empty()) {
        printError(outputs.error());
        return kFailure;
    }
    CaptureDecoding decoding(options, platform, guess, &outputs);
    decoding.decodeAll();
    return decoding.isGood() ? 0 : kFailure;
}

int summarizeCaptures(const DecodeOptions& options, Platform& platform, const TechnologyGuess& guess)
{
    CaptureDecoding decoding(options, platform, guess);
    decoding.decodeAll();
    const bool isPrinted = printDocument(
        [&](std::ostream& stream) { writeSummaries(decoding.captures(), options, stream); }, options);
    return isPrinted && decoding.isGood() ? 0 : kFailure;
}

// Returns false, after an error line, when there is no template for the display.
bool hasTemplate(const LogGenerator& generator)
{
    const std::string error = generator.templateError({});
    return error.empty() || printError(error);
}

bool extractDlf(const SnapshotDocument& document, const DecodeOptions& options)
{
    if (!document.dlf())
        return printError(options.inputs.front() + ": holds no binary log");
    return writeFile(
        *options.dlfFile, {reinterpret_cast<const char*>(document.dlf()->data()), document.dlf()->size()});
}

// Does with a snapshot what the options want. Returns false, after an error line, when any of it failed.
bool prepare(SnapshotDocument& document, const std::string& path, const DecodeOptions& options,
    const Platform& platform)
{
    if (!document.failure().empty())
        return printError(path + ": " + document.failure());
    bool isGood = true;
    if (!options.technology.empty()) {
        auto generator = platform.generatorFor(options.technology);
        isGood = hasTemplate(*generator);
        document.decodeAnew(std::move(generator));
    }
    for (const std::string& omission : document.omissions())
        printNote(text("%s: %s", path.c_str(), omission.c_str()), options);
    if (options.dlfFile)
        isGood = extractDlf(document, options) && isGood;
    if (options.path != "/" && !document.restrictTo(options.path))
        isGood = printError(path + ": no row or branch of a display is at " + options.path);
    return isGood;
}

void write(const std::vector<SnapshotDocument>& documents, const DecodeOptions& options, std::ostream& stream)
{
    if (options.format == DecodeOptions::Format::json) {
        writeDocuments(stream, documents,
            [](JsonWriter& json, const SnapshotDocument& document) { document.writeJson(json); });
        return;
    }
    for (const SnapshotDocument& document : documents) {
        if (document.failure().empty())
            stream << document.tree(longestText(options));
    }
}

int showSnapshots(const DecodeOptions& options, const Platform& platform)
{
    std::vector<SnapshotDocument> documents;
    bool isGood = true;
    for (const std::string& path : options.inputs)
        isGood = prepare(documents.emplace_back(path, readSnapshot(path)), path, options, platform) && isGood;
    const bool isEmpty = std::ranges::all_of(
        documents, [](const SnapshotDocument& document) { return !document.failure().empty(); });
    if (options.format == DecodeOptions::Format::json || !isEmpty)
        isGood = printDocument([&](std::ostream& stream) { write(documents, options, stream); }, options)
            && isGood;
    return isGood ? 0 : kFailure;
}

int compareSnapshots(const DecodeOptions& options)
{
    OrvexModelNodeRef displays[2];
    for (std::size_t i = 0; i < 2; ++i) {
        const auto [snapshot, error] = readSnapshot(options.inputs[i]);
        if (!snapshot) {
            printError(error);
            return kTrouble;
        }
        displays[i] = lastDisplay(*snapshot, options.path);
    }
    if (!displays[0] && !displays[1]) {
        printError("no row or branch of either display is at " + options.path);
        return kTrouble;
    }
    std::size_t count = 0;
    const auto compare = [&](std::ostream& stream) {
        count = writeDifferences(displays[0].get(), displays[1].get(), options, stream);
    };
    if (options.isQuiet) {
        std::ostream nowhere(nullptr);
        compare(nowhere);
    } else if (!printDocument(compare, options)) {
        return kTrouble;
    }
    return count == 0 ? 0 : 1;
}

int perform(const DecodeOptions& options, Platform& platform, const TechnologyGuess& guess)
{
    switch (options.task) {
    case DecodeOptions::Task::decode: return decodeCaptures(options, platform, guess);
    case DecodeOptions::Task::sample: return sampleCaptures(options, platform, guess);
    case DecodeOptions::Task::summarize: return summarizeCaptures(options, platform, guess);
    case DecodeOptions::Task::showSnapshots: return showSnapshots(options, platform);
    case DecodeOptions::Task::compareSnapshots: return compareSnapshots(options);
    case DecodeOptions::Task::mergeDatabases: return mergeDatabases(options) ? 0 : kFailure;
    }
    return kFailure;
}

// Decodes the inputs, with a log if there is to be one.
int decode(const DecodeOptions& options)
{
    Platform platform(options);
    const TechnologyGuess guess(platform.environment()); // before there is a log for its lines
    std::unique_ptr<FileSystemLog> log;
    if (options.logFile) {
        log = std::make_unique<FileSystemLog>(*options.logFile);
        if (!log->error().empty()) {
            printError(log->error());
            return kFailure;
        }
        SystemLog::install(log.get());
    }
    int status = perform(options, platform, guess);
    SystemLog::install(nullptr);
    if (log) {
        log->flush();
        if (!log->error().empty()) {
            printError(log->error());
            status = kFailure;
        }
    }
    return status;
}

} // namespace

int main(int argc, char** argv)
{
    occupyStandardStreams();
    const DecodeOptions options = DecodeOptions::parse(argc, argv);
    if (options.earlyExit)
        return options.earlyExit->print();
    if (const std::string conflict = conflictOf(options); !conflict.empty()) {
        printError(conflict);
        return CommandLine::kWrongUsage;
    }

    installConsole([](std::string_view) {}); // standard output is for the document alone
    installFatalErrorHandler();
    return decode(options);
}
