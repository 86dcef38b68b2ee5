#include "FuzzSession.h"

#include "FuzzTarget.h"
#include "MemoryFile.h"

#include "FileStorage.h"
#include "NodesByPath.h"
#include "Snapshot.h"
#include "SnapshotTree.h"
#include "SystemLog.h"
#include "TelephonyConstants.h"
#include "TreeJson.h"

#include <nlohmann/json.hpp>

#include <map>
#include <sstream>

namespace orvex::fuzz {

namespace {

constexpr std::size_t kRefreshEvery = 8; // messages

class DroppingLog final : public SystemLog {
public:
    void write(Priority /*priority*/, std::string_view /*line*/) override { }
};

void installSinks()
{
    static DroppingLog log;
    SystemLog::install(&log);
    installConsole([](std::string_view) {});
}

const char* templateName(const std::string& technology)
{
    static const std::map<std::string, const char*> names = {
        {telephony::kTechnologyMRL_GSM, "MRL_GSM"},
        {telephony::kTechnologyMRL_CDMA, "C2KTemplate"},
        {telephony::kTechnologyMRL_LTE, "LTE"},
        {telephony::kTechnologyMRL_UTRAN2, "MRL_UTRAN2"},
    };
    const auto name = names.find(technology);
    return name == names.end() ? nullptr : name->second; // IFX has no template
}

// Cached, because reading the file is not under test.
DictionaryRef ownTemplate(const std::string& technology)
{
    static std::map<std::string, DictionaryRef> known;
    const auto [entry, isNew] = known.try_emplace(technology);
    if (const char* name = templateName(technology); name && isNew)
        entry->second = FileResources(ORVEX_RESOURCES).dictionaryNamed(name).dictionary;
    return entry->second;
}

test::FixedResources resourcesOf(const std::string& technology, const DictionaryRef& skeleton)
{
    installSinks();
    test::FixedResources resources;
    if (const char* name = templateName(technology))
        resources.templates[name] = Value(skeleton).deepCopy().dictionary();
    return resources;
}

void requireJson(const OrvexModelNode& tree)
{
    std::ostringstream text;
    JsonWriter json(text);
    writeTreeJson(json, tree);
    require(nlohmann::json::accept(text.str()), "the JSON text of a tree is JSON");
}

void requireSnapshot(const std::string& path)
{
    const auto snapshot = readSnapshot(path).snapshot;
    require(snapshot.has_value(), "a snapshot that was written can be read");
    snapshotTree(*snapshot);
}

} // namespace

FuzzSession::FuzzSession(const std::string& technology)
    : FuzzSession(technology, ownTemplate(technology))
{
}

FuzzSession::FuzzSession(const std::string& technology, const DictionaryRef& skeleton)
    : _resources(resourcesOf(technology, skeleton))
    , _session(LogGenerator::generatorFromTechnology(technology, {_resources, _clock, "Fuzz"}), kRefreshEvery)
{
}

void FuzzSession::run(InputMessages messages)
{
    while (const auto message = messages.next()) {
        if (!take(*message))
            return;
    }
    if (refresh()) // the first refresh builds the display, the next shows it
        finish(Ending::written);
}

bool FuzzSession::take(ByteView message)
{
    return survives([&] { _session.take(message); });
}

bool FuzzSession::refresh()
{
    return survives([this] { _session.display(); });
}

void FuzzSession::finish(Ending ending)
{
    survives([this, ending] {
        NodesByPath paths;
        const auto tree = OrvexModelNode::makeTreeFromObject(_session.display(), paths);
        const MemoryFile file;
        const bool isWritten =
            writeSnapshot({"2024-03-05 14:07:09 +0000", _session.saveContents(), "Fuzz"}, file.path())
                .empty();
        if (ending == Ending::written)
            return;
        requireJson(*tree);
        if (isWritten)
            requireSnapshot(file.path());
    });
}

} // namespace orvex::fuzz
