#pragma once

#include "Base.h"

#include "SystemLog.h"

namespace orvex {

// The line that a section logs for every packet.
struct EntryLine {
    Priority priority;
    const char* word;
};

enum class OtherCodes { areReported, areIgnored };

// Receives the packets of one payload reader.
template <typename Reader>
class PacketTaker {
public:
    PacketTaker() = default;
    PacketTaker(const PacketTaker&) = delete;
    PacketTaker& operator=(const PacketTaker&) = delete;

    virtual void update(const Reader& report) = 0;

protected:
    ~PacketTaker() = default;
};

// A section that names the payload readers of its packets, in the order of its log codes, and has an
// update() for each. Packets of other codes, and packets shorter than their reader's minimum length, change
// nothing.
template <typename... Readers>
class PacketSection : public Base, protected PacketTaker<Readers>... {
public:
    std::size_t minimumLength([[maybe_unused]] LogCode logCode) const final
    {
        return (std::size_t{0} + ... + (Readers::kCode == logCode ? Readers::kMinimumLength : 0));
    }

    void updateWithData([[maybe_unused]] Packet packet, LogCode logCode) final
    {
        systemLogText(_entryLine.priority, _entryLine.word);
        const bool isTaken = (offer<Readers>(packet, logCode) || ...);
        if (!isTaken && _otherCodes == OtherCodes::areReported)
            reportUnknown(logCode);
    }

protected:
    // Logs its name for every packet and reports other codes.
    PacketSection(const char* sectionName, ClassDictionary& dict, CodeDictionary& codeDict)
        : PacketSection(sectionName, sectionName, dict, codeDict)
    {
    }
    // The same, but logs another word.
    PacketSection(
        const char* sectionName, const char* entryWord, ClassDictionary& dict, CodeDictionary& codeDict)
        : PacketSection(sectionName, {Priority::warning, entryWord}, OtherCodes::areReported, dict, codeDict)
    {
    }
    PacketSection(const char* sectionName, EntryLine entryLine, OtherCodes otherCodes, ClassDictionary& dict,
        CodeDictionary& codeDict)
        : Base(sectionName, {Readers::kCode...}, dict, codeDict)
        , _entryLine(entryLine)
        , _otherCodes(otherCodes)
    {
    }

private:
    // False when the packet is of another code.
    template <typename Reader>
    bool offer(Packet packet, LogCode logCode)
    {
        if (logCode != Reader::kCode)
            return false;
        if (packet.size() >= Reader::kMinimumLength) {
            PacketTaker<Reader>& taker = *this;
            taker.update(Reader(packet));
        }
        return true;
    }

    EntryLine _entryLine;
    OtherCodes _otherCodes;
};

} // namespace orvex
