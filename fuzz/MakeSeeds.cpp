// Writes seed inputs for every target, and dictionaries of log codes: fuzz_seeds FUZZ_DIRECTORY

#include "Captures.h"
#include "FixedClock.h"
#include "InputMessages.h"
#include "OfflineSession.h"

#include "Array.h"
#include "FileStorage.h"
#include "MessageFrame.h"
#include "PcapWriter.h"
#include "PortFrame.h"
#include "PropertyList.h"
#include "Snapshot.h"
#include "TextFormat.h"

#include <algorithm>
#include <filesystem>
#include <fstream>
#include <iostream>
#include <map>
#include <set>

namespace fs = std::filesystem;

namespace orvex::fuzz {
namespace {

using Messages = std::vector<Bytes>;

struct Technology {
    const char* identifier;
    const char* target;
};

// In the order of telephony::kTechnologies, by which the targets count.
constexpr Technology kTechnologies[] = {
    {telephony::kTechnologyIFX, "IFX"},
    {telephony::kTechnologyMRL_GSM, "GSM"},
    {telephony::kTechnologyMRL_CDMA, "C2K"},
    {telephony::kTechnologyMRL_LTE, "LTE"},
    {telephony::kTechnologyMRL_UTRAN2, "UTRAN"},
};

class SeedWriter {
public:
    explicit SeedWriter(fs::path folder)
        : _folder(std::move(folder))
    {
    }

    void writeAll() const
    {
        for (const Technology& technology : kTechnologies) {
            writeMessages(technology);
            writeDictionary(technology);
        }
        const Messages drive = firstMessages(telephony::kTechnologyMRL_LTE, 6);
        writeFrames(drive);
        writeSessions();
        writeCaptures(drive);
        writePropertyLists();
        writeTemplates();
    }

private:
    // The packets' code; none of a property list.
    static std::optional<LogCode> codeOf(const Bytes& message)
    {
        const MessageFrame frame(message);
        const bool isPacket =
            frame.logType() == MessageFrame::kTypeBaseband || frame.logType() == MessageFrame::kTypeExtra;
        return isPacket ? std::optional(frame.logCode()) : std::nullopt;
    }

    // Baseband packets alone, where there are any: property lists make long inputs, and slow ones.
    static Messages firstMessages(const char* technology, std::size_t count)
    {
        Messages messages = test::captureOf(technology);
        std::erase_if(
            messages, [](const Bytes& message) { return codeOf(message).value_or(0) >= kExtraCodeBase; });
        messages.resize(count);
        return messages;
    }

    static std::unique_ptr<LogGenerator> generatorOf(const char* technology)
    {
        static const FileResources resources(ORVEX_RESOURCES);
        static const test::FixedClock clock;
        return LogGenerator::generatorFromTechnology(technology, {resources, clock, "Seed"});
    }

    // The longest of each code, alone, and baseband packets in a row.
    void writeMessages(const Technology& technology) const
    {
        std::map<LogCode, Bytes> byCode;
        for (const Bytes& message : test::captureOf(technology.identifier)) {
            Bytes& longest = byCode[codeOf(message).value_or(0)];
            if (message.size() > longest.size())
                longest = message;
        }
        for (const auto& [code, message] : byCode)
            write(technology.target, text("code-%06x", code), InputMessages::inputOf(Messages{message}));
        const bool isWholeReport = byCode.contains(0);
        const Messages row = firstMessages(technology.identifier, isWholeReport ? 2 : 12);
        write(technology.target, "drive", InputMessages::inputOf(row));
        if (isWholeReport || technology.identifier == std::string_view(telephony::kTechnologyMRL_LTE))
            write("Snapshot", technology.target, snapshotOf(technology.identifier, row));
    }

    Bytes snapshotOf(const char* technology, const Messages& messages) const
    {
        OfflineSession session(generatorOf(technology), 0);
        for (const Bytes& message : messages)
            session.take(message);
        session.display(); // makes a history entry
        const std::string path = _folder / "snapshot";
        writeSnapshot({"2024-03-05 14:07:09 +0000", session.saveContents(), "Seed"}, path);
        return takeFile(path);
    }

    // The beginning of a message of 64 bytes in an input: its length, then log type, length and code.
    void writeDictionary(const Technology& technology) const
    {
        const auto command = generatorOf(technology.identifier)->getStartCommand();
        std::string words;
        for (const auto& [key, type] : {std::pair(telephony::kSetMarlinLogCodes, 0x01),
                 std::pair(telephony::kSetKoratExtraCodes, 0xFF)}) {
            const auto codes = (*command)[key].array();
            if (!codes)
                continue;
            for (const Value& code : *codes) {
                const auto number = static_cast<unsigned>(*code.integer());
                words +=
                    text("\"\\x40\\x00\\x%02x\\x3f\\x00\\x%02x\\x%02x\"\n", type, number & 0xFF, number >> 8);
            }
        }
        if (!words.empty())
            writeFile(_folder / "dictionaries" / (std::string(technology.target) + ".dict"), words);
    }

    void writeFrames(const Messages& messages) const
    {
        Bytes stream;
        for (const Bytes& message : messages) {
            const Bytes frame = encodedFrame({.payload = message});
            stream.insert(stream.end(), frame.begin(), frame.end());
        }
        const auto middle = stream.begin() + 30;
        write("Frame", "split",
            InputMessages::inputOf(Messages{{stream.begin(), middle}, {middle, stream.end()}}));
        const Bytes& list = messages.front();
        write("Frame", "request",
            InputMessages::inputOf(Messages{encodedFrame({1, FrameKind::request, 7, list}),
                encodedFrame({1, FrameKind::reply, 7, list})}));
    }

    // The technology's number and its frames, a refresh after every other one; see SessionTarget.
    void writeSessions() const
    {
        constexpr std::size_t kMessages = 6;
        for (std::size_t i = 0; i < std::size(kTechnologies); ++i) {
            const auto& [identifier, target] = kTechnologies[i];
            const Messages messages = test::captureOf(identifier);
            Messages pieces;
            for (std::size_t message = 0; message < kMessages; ++message) {
                pieces.push_back(encodedFrame({.payload = messages[message]}));
                if (message % 2 != 0)
                    pieces.emplace_back();
            }
            Bytes input = InputMessages::inputOf(pieces);
            input.insert(input.begin(), static_cast<std::uint8_t>(i));
            write("Session", target, input);
        }
    }

    void writeCaptures(const Messages& messages) const
    {
        const std::string path = _folder / "capture";
        {
            PcapWriter pcap(path);
            for (const Bytes& message : messages)
                pcap.write(message, kStart);
        }
        write("Capture", "pcap", takeFile(path));

        Bytes clean;
        Bytes raw;
        for (const Bytes& message : messages) {
            clean.insert(clean.end(), message.begin() + 1, message.end());
            raw.insert(raw.end(), message.begin(), message.end());
        }
        write("Capture", "dlf", clean);
        write("Dlf", "clean", clean);
        write("Dlf", "messages", raw);
        Dictionary state{
            {"History", Array::make({Dictionary::make({{"DisplayState", std::make_shared<Bytes>(raw)}})})}};
        const auto generator = generatorOf(telephony::kTechnologyMRL_LTE);
        const auto contents = generator->getSaveContentsFromState(state);
        write("Dlf", "snapshot", *(*(*contents)[contents->size() - 1].dictionary())["DLF"].data());
    }

    void writePropertyLists() const
    {
        const Value list = Dictionary::make({
            {"text", "a <b> & \xC3\xA4"},
            {"numbers", Array::make({-1, 65536, 0.25, true, false})},
            {"date", Date{1'700'000'000}},
            {"data", std::make_shared<Bytes>(Bytes{0, 1, 254, 255})},
            {"nested", Array::make({Dictionary::make(), Array::make({""})})},
        });
        write("PropertyList", "xml", propertyListXML(list).value());
        write("PropertyList", "binary", propertyListBinary(list).value());
        const Bytes report = firstMessages(telephony::kTechnologyIFX, 1).front();
        write(
            "PropertyList", "report-binary", propertyListBinary(*propertyListFromData(report).value).value());
    }

    // The technology's number, its template and a packet; see TemplateTarget.
    void writeTemplates() const
    {
        // IFX, the first technology, has none.
        static constexpr const char* kTemplates[] = {"MRL_GSM", "C2KTemplate", "LTE", "MRL_UTRAN2"};
        const FileResources resources(ORVEX_RESOURCES);
        for (std::size_t i = 0; i < std::size(kTemplates); ++i) {
            Messages messages = firstMessages(kTechnologies[i + 1].identifier, 3);
            const Bytes list =
                propertyListBinary(resources.dictionaryNamed(kTemplates[i]).dictionary).value();
            messages.insert(messages.begin(), list);
            Bytes input = InputMessages::inputOf(messages);
            input.insert(input.begin(), static_cast<std::uint8_t>(i + 1));
            write("Template", kTemplates[i], input);
        }
    }

    static Bytes takeFile(const std::string& path)
    {
        std::ifstream file(path, std::ios::binary);
        Bytes bytes((std::istreambuf_iterator<char>(file)), std::istreambuf_iterator<char>());
        fs::remove(path);
        return bytes;
    }

    void write(const char* target, const std::string& name, const Bytes& input) const
    {
        writeFile(_folder / "corpus" / target / name, std::string(input.begin(), input.end()));
    }

    static void writeFile(const fs::path& path, const std::string& content)
    {
        fs::create_directories(path.parent_path());
        std::ofstream(path, std::ios::binary) << content;
    }

    static constexpr std::chrono::microseconds kStart{1'700'000'000'000'000};

    fs::path _folder;
};

} // namespace
} // namespace orvex::fuzz

int main(int argc, char** argv)
{
    if (argc != 2) {
        std::cerr << "usage: " << argv[0] << " FUZZ_DIRECTORY\n";
        return 2;
    }
    orvex::fuzz::SeedWriter(argv[1]).writeAll();
}
