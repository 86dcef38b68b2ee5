#include "RRC_State.h"

#include "EnumTable.h"
#include "LogCode_0xD0E0.h"

#include "Console.h"
#include "SystemLog.h"
#include "TextFormat.h"

namespace orvex {

namespace {

constexpr EnumText kStates[] = {{0, "Disconnected"}, {1, "Connecting"}, {2, "Cell Fach"}, {3, "Cell DCH"},
    {4, "Cell PCH"}, {5, "Cell URA PCH"}};

// {Name = text; ...}, for the developer's eyes.
std::string describe(const Dictionary* rows)
{
    if (!rows)
        return "(null)";
    std::string result = "{";
    for (const auto& [key, value] : *rows)
        result += key + " = " + (value.string() ? *value.string() : nameOf(value.kind())) + "; ";
    return result + "}";
}

} // namespace

RRC_State::RRC_State(ClassDictionary& dict, CodeDictionary& codeDict)
    : Base("RRC Info", {LogCode_0xD0E0::kCode}, dict, codeDict)
{
}

void RRC_State::updateWithData(Packet packet, LogCode logCode)
{
    systemLog(Priority::warning, "RRC Info");
    if (logCode != LogCode_0xD0E0::kCode)
        return;
    // Reported, not rejected: what is missing reads as invalid, and the row says so.
    if (packet.size() < LogCode_0xD0E0::kExpectedLength) {
        systemLog(Priority::warning, "LogCode_0xD0E0 is length is %ld expected size %ld",
            static_cast<long>(packet.size()), static_cast<long>(LogCode_0xD0E0::kExpectedLength));
    }
    const int state = LogCode_0xD0E0(packet).state();
    const char* name = textFor(state, kStates, "Unknown RRC Mode");
    RowWriter row = rows();
    row.setText("State", name);
    writeConsoleLine(
        text("Display Dict = %s, rrc mode = %d %s", describe(row.dictionary()).c_str(), state, name));
}

} // namespace orvex
