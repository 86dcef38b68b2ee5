#include "OpenedFile.h"

#include "CaptureReader.h"
#include "NodesByPath.h"
#include "Snapshot.h"
#include "SnapshotTree.h"
#include "SnapshotViewer.h"
#include "TechnologyGuess.h"
#include "TextFormat.h"
#include "VisibleText.h"

namespace orvex {

namespace {

OpenedFile failed(const std::string& error)
{
    return {nullptr, {}, error};
}

OpenedFile openSnapshot(const std::string& path)
{
    const auto [snapshot, error] = readSnapshot(path);
    return snapshot ? OpenedFile{snapshotTree(*snapshot), snapshotMessage(*snapshot), {}} : failed(error);
}

// By the log codes at the beginning; empty if they tell nothing.
std::string technologyOfCapture(const std::string& path, const GeneratorEnvironment& environment)
{
    constexpr int kMessagesRead = 10'000;
    const auto reader = CaptureReader::open(path);
    TechnologyGuess::Counts counts;
    for (int i = 0; i < kMessagesRead && reader->next() == CaptureReader::Status::message; ++i)
        ++counts[codeOfMessage(reader->message())];
    return TechnologyGuess(environment).best(counts);
}

OpenedFile openCapture(const std::string& path, const GeneratorEnvironment& environment)
{
    const std::string technology = technologyOfCapture(path, environment);
    const auto generator = LogGenerator::generatorFromTechnology(technology, environment);
    if (!generator)
        return failed(path + ": its messages are of no technology that Orvex knows");
    if (const std::string error = generator->templateError({}); !error.empty())
        return failed(error);
    Dictionary state;
    std::size_t messages = 0;
    const auto reader = CaptureReader::open(path);
    for (; reader->next() == CaptureReader::Status::message; ++messages)
        generator->updateState(state, reader->message());
    NodesByPath paths;
    auto tree = OrvexModelNode::makeTreeFromObject(generator->generateLogUsingState(state), paths);
    return {std::move(tree), text("%zu messages of %s", messages, technology.c_str()), {}};
}

} // namespace

OpenedFile openFile(const std::string& path, const GeneratorEnvironment& environment)
{
    const auto reader = CaptureReader::open(path);
    switch (reader->next()) {
    case CaptureReader::Status::message: return openCapture(path, environment);
    case CaptureReader::Status::end: return failed(path + ": a capture without a message");
    case CaptureReader::Status::broken: break;
    }
    OpenedFile snapshot = openSnapshot(path);
    const bool isNamedSnapshot = path.ends_with(".orvex");
    return snapshot.tree || isNamedSnapshot ? snapshot : failed(reader->error());
}

} // namespace orvex
