#include "CaptureReader.h"
#include "DecodeOptions.h"
#include "OfflineSession.h"
#include "Progress.h"
#include "TreeJson.h"

#include "DisplayTreePrinter.h"
#include "FatalErrors.h"
#include "FileResources.h"
#include "FileSystemLog.h"
#include "SystemClock.h"

#include "Console.h"

#include <cerrno>
#include <cstdio>
#include <cstring>
#include <fstream>
#include <iostream>

using namespace orvex;

namespace {

constexpr int kFailure = 1;
constexpr int kWrongUsage = 2;

bool complain(const std::string& message)
{
    std::cerr << "orvex-decode: " << message << '\n';
    return false;
}

// Feeds the messages of one capture. False, after a line on standard error, when it could not be read whole.
bool feed(OfflineSession& session, const std::string& path, Progress& progress)
{
    const auto reader = CaptureReader::open(path);
    const std::size_t before = session.messageCount();
    CaptureReader::Status status = reader->next();
    for (; status == CaptureReader::Status::message; status = reader->next()) {
        session.take(reader->message());
        progress.advance(reader->message().size());
    }
    if (const std::string omissions = reader->omissions(); !omissions.empty())
        complain(path + ": " + omissions);
    if (status == CaptureReader::Status::end)
        return true;
    const std::size_t whole = session.messageCount() - before;
    return complain(
        reader->error() + (whole > 0 ? " (after " + std::to_string(whole) + " whole messages)" : ""));
}

bool print(const OrvexModelNode& root, const DecodeOptions& options)
{
    const std::string document =
        options.format == DecodeOptions::Format::json ? treeJson(root) : DisplayTreePrinter::text(root);
    if (!options.outputFile) {
        std::cout << document << std::flush;
        return std::cout ? true : complain("standard output: could not be written");
    }
    std::ofstream file(*options.outputFile, std::ios::binary);
    file << document << std::flush;
    return file ? true : complain(*options.outputFile + ": " + std::strerror(errno));
}

int decode(const DecodeOptions& options)
{
    const FileResources resources(options.resources.value_or(FileResources::defaultDirectory()));
    const SystemClock clock;
    auto generator = LogGenerator::generatorFromTechnology(
        options.technology, GeneratorEnvironment{resources, clock, ORVEX_VERSION});
    if (!generator) {
        complain("this build does not decode " + options.technology);
        return kFailure;
    }
    OfflineSession session(std::move(generator), options.refreshEvery);
    bool isGood = true;
    {
        Progress progress(options.captures);
        for (const std::string& capture : options.captures)
            isGood = feed(session, capture, progress) && isGood;
    }
    // What could be read is shown, whatever could not; but nothing at all is no document.
    if (!isGood && session.messageCount() == 0)
        return kFailure;
    return print(*session.finish(), options) && isGood ? 0 : kFailure;
}

} // namespace

int main(int argc, char** argv)
{
    const DecodeOptions options = DecodeOptions::parse(argc, argv);
    switch (options.action) {
    case DecodeOptions::Action::help: std::cout << DecodeOptions::usage(); return 0;
    case DecodeOptions::Action::version: std::cout << "orvex-decode " ORVEX_VERSION "\n"; return 0;
    case DecodeOptions::Action::wrongUsage:
        complain(options.error);
        std::cerr << DecodeOptions::usage();
        return kWrongUsage;
    case DecodeOptions::Action::decode: break;
    }

    installConsole([](std::string_view) {}); // standard output carries the document alone
    installFatalErrorHandler();
    std::unique_ptr<FileSystemLog> log;
    if (options.logFile) {
        log = std::make_unique<FileSystemLog>(*options.logFile);
        SystemLog::install(log.get());
    }
    const bool canLog = !log || log->error().empty() || complain(log->error());
    int status = canLog ? decode(options) : kFailure;
    SystemLog::install(nullptr);
    if (log && canLog) {
        log->flush();
        if (!log->error().empty()) {
            complain(log->error());
            status = kFailure;
        }
    }
    return status;
}
