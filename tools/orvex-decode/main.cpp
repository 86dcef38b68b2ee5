#include "CaptureReader.h"
#include "DecodeOptions.h"
#include "FileConflict.h"
#include "OfflineSession.h"
#include "ReadAhead.h"
#include "Reporting.h"
#include "SnapshotDocument.h"
#include "TreeJson.h"

#include "DisplayTreePrinter.h"
#include "FileStorage.h"
#include "LinuxSystemLog.h"
#include "NodesByPath.h"
#include "Process.h"
#include "QtRunLoop.h"

#include "Snapshot.h"
#include "SystemLog.h"
#include "TextFormat.h"

#include <filesystem>
#include <iostream>
#include <unistd.h>

using namespace orvex;

namespace {

constexpr int kFailure = 1;

// Feeds the messages of a capture. Returns false, after an error line, unless it could be read to its end.
bool feed(OfflineSession& session, const std::string& path, Progress& progress)
{
    ReadAhead reader(CaptureReader::open(path));
    const std::size_t before = session.messageCount();
    CaptureReader::Status status = reader.next();
    for (; status == CaptureReader::Status::message; status = reader.next()) {
        session.take(reader.message());
        progress.advance(reader.message().size());
    }
    if (const std::string omissions = reader.omissions(); !omissions.empty())
        printError(path + ": " + omissions);
    if (status == CaptureReader::Status::end)
        return true;
    const std::size_t whole = session.messageCount() - before;
    return printError(
        reader.error() + (whole > 0 ? " (after " + std::to_string(whole) + " whole messages)" : ""));
}

// Cuts long texts for a terminal, but not for a file or another program.
std::size_t longestText(const DecodeOptions& options)
{
    return !options.outputFile && ::isatty(STDOUT_FILENO) ? kLongestVisibleText : std::string::npos;
}

bool print(const Value& display, const DecodeOptions& options)
{
    NodesByPath paths;
    const auto tree = OrvexModelNode::makeTreeFromObject(display, paths);
    return printDocument(
        [&](std::ostream& stream) {
            if (options.format == DecodeOptions::Format::tree) {
                stream << DisplayTreePrinter::text(*tree, longestText(options));
                return;
            }
            JsonWriter json(stream);
            writeTreeJson(json, *tree);
            json.endDocument();
        },
        options);
}

std::string resourcesOf(const DecodeOptions& options)
{
    return options.resources.value_or(FileResources::defaultDirectory());
}

// Returns why the files cannot be used together; empty when they can.
std::string conflictOf(const DecodeOptions& options)
{
    std::vector<FileInUse> inputs;
    for (const std::string& capture : options.inputs)
        inputs.push_back({"the input " + capture, capture});
    const std::string resources = resourcesOf(options);
    for (const std::string& name : FileResources(resources).propertyListPaths())
        inputs.push_back({"the template " + name, std::filesystem::path(resources) / name});

    std::vector<FileInUse> outputs;
    if (!options.outputFile)
        outputs.push_back({"standard output", "/dev/stdout"});
    const std::pair<const char*, const std::optional<std::string>*> files[] = {
        {"--output ", &options.outputFile},
        {"--log ", &options.logFile},
        {"--snapshot ", &options.snapshotFile},
        {"--dlf ", &options.dlfFile},
    };
    for (const auto& [option, path] : files) {
        if (*path)
            outputs.push_back({option + **path, **path});
    }
    return fileConflict(inputs, outputs);
}

// What decoding needs of the platform.
struct Platform {
    explicit Platform(const DecodeOptions& options)
        : resources(resourcesOf(options))
        , rawPacketLimit(options.snapshotFile ? RawPackets::kLimit : 0)
    {
    }

    std::unique_ptr<LogGenerator> generatorFor(const std::string& technology) const
    {
        return LogGenerator::generatorFromTechnology(
            technology, GeneratorEnvironment{resources, clock, ORVEX_VERSION, rawPacketLimit});
    }

    FileResources resources;
    SystemClock clock;
    std::size_t rawPacketLimit; // bytes; only a snapshot needs raw packets
};

// Returns false, after an error line, when there is no template for the display.
bool hasTemplate(const LogGenerator& generator)
{
    const std::string error = generator.templateError({});
    return error.empty() || printError(error);
}

bool save(const OfflineSession& session, Date begun, const DecodeOptions& options)
{
    const Snapshot snapshot{dateText(begun), session.saveContents(), options.description};
    const std::string fault = writeSnapshot(snapshot, *options.snapshotFile);
    if (const std::size_t dropped = session.droppedRawBytes(); fault.empty() && dropped > 0)
        printError(text("%s: lacks the oldest %zu bytes of raw messages; a snapshot holds up to %zu MiB",
            options.snapshotFile->c_str(), dropped, RawPackets::kLimit >> 20));
    return fault.empty() || printError(fault);
}

int decodeCaptures(const DecodeOptions& options)
{
    const Platform platform(options);
    const Date begun = platform.clock.now();
    auto generator = platform.generatorFor(options.technology);
    bool isGood = hasTemplate(*generator);
    OfflineSession session(std::move(generator), options.refreshEvery);
    {
        Progress progress(options.inputs);
        for (const std::string& capture : options.inputs)
            isGood = feed(session, capture, progress) && isGood;
    }
    // Whatever could be read is shown. With no message at all there is no document.
    if (!isGood && session.messageCount() == 0)
        return kFailure;
    isGood = print(session.display(), options) && isGood;
    if (options.snapshotFile)
        isGood = save(session, begun, options) && isGood;
    return isGood ? 0 : kFailure;
}

bool extractDlf(const SnapshotDocument& document, const DecodeOptions& options)
{
    if (!document.dlf())
        return printError(options.inputs.front() + ": holds no binary log");
    return writeFile(
        *options.dlfFile, {reinterpret_cast<const char*>(document.dlf()->data()), document.dlf()->size()});
}

void write(const std::vector<SnapshotDocument>& documents, const DecodeOptions& options, std::ostream& stream)
{
    if (options.format == DecodeOptions::Format::tree) {
        for (const SnapshotDocument& document : documents)
            stream << document.tree(longestText(options));
        return;
    }
    JsonWriter json(stream);
    json.beginObject();
    json.key("snapshots");
    json.beginArray();
    for (const SnapshotDocument& document : documents)
        document.writeJson(json);
    json.endArray();
    json.endObject();
    json.endDocument();
}

int showSnapshots(const DecodeOptions& options)
{
    const Platform platform(options);
    std::vector<SnapshotDocument> documents;
    bool isGood = true;
    for (const std::string& path : options.inputs) {
        const auto [snapshot, error] = readSnapshot(path);
        if (!snapshot) {
            isGood = printError(error);
            continue;
        }
        SnapshotDocument& document = documents.emplace_back(*snapshot);
        if (!options.technology.empty()) {
            auto generator = platform.generatorFor(options.technology);
            isGood = hasTemplate(*generator) && isGood;
            document.decodeAnew(std::move(generator));
        }
        for (const std::string& omission : document.omissions())
            printError(text("%s: %s", path.c_str(), omission.c_str()));
        if (options.dlfFile)
            isGood = extractDlf(document, options) && isGood;
    }
    if (documents.empty())
        return kFailure;
    isGood =
        printDocument([&](std::ostream& stream) { write(documents, options, stream); }, options) && isGood;
    return isGood ? 0 : kFailure;
}

// Decodes the inputs, with a log if there is to be one.
int decode(const DecodeOptions& options)
{
    std::unique_ptr<FileSystemLog> log;
    if (options.logFile) {
        log = std::make_unique<FileSystemLog>(*options.logFile);
        if (!log->error().empty()) {
            printError(log->error());
            return kFailure;
        }
        SystemLog::install(log.get());
    }
    int status = options.areSnapshots ? showSnapshots(options) : decodeCaptures(options);
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
