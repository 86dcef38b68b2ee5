#pragma once

#include "Base.h"

#include "SystemLog.h"

namespace orvex {

// The line that a section writes for every packet.
struct EntryLine {
    Priority priority;
    const char* word;
};

enum class OtherCodes { areReported, areIgnored };

// A section of one log code, whose packets Reader reads. Packets of other codes and packets below the
// reader's minimum length change nothing.
template <typename Reader>
class SingleCodeSection : public Base {
public:
    void updateWithData(Packet packet, LogCode logCode) final
    {
        systemLog(_entryLine.priority, "%s", _entryLine.word);
        if (logCode != Reader::kCode) {
            if (_otherCodes == OtherCodes::areReported)
                reportUnknown(logCode);
            return;
        }
        if (packet.size() >= Reader::kMinimumLength)
            update(Reader(packet));
    }

protected:
    // Says its name for every packet and reports those of other codes.
    SingleCodeSection(const char* sectionName, ClassDictionary& dict, CodeDictionary& codeDict)
        : SingleCodeSection(
            sectionName, {Priority::warning, sectionName}, OtherCodes::areReported, dict, codeDict)
    {
    }
    SingleCodeSection(const char* sectionName, EntryLine entryLine, OtherCodes otherCodes,
        ClassDictionary& dict, CodeDictionary& codeDict)
        : Base(sectionName, {Reader::kCode}, dict, codeDict)
        , _entryLine(entryLine)
        , _otherCodes(otherCodes)
    {
    }

    virtual void update(const Reader& report) = 0;

private:
    EntryLine _entryLine;
    OtherCodes _otherCodes;
};

} // namespace orvex
