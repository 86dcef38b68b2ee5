#pragma once

#include "LogPackets.h"
#include "SectionFixture.h"

#include <map>

namespace orvex::test {

// What one row shows for every value of one packet byte: the text of the table, or the fallback.
template <typename Section>
void expectTextsOfByte(LogCode code, std::size_t offset, const char* row,
    const std::map<int, const char*>& texts, const char* fallback)
{
    SectionFixture<Section> fixture;
    for (int value = 0; value < 256; ++value) {
        Bytes bytes = packet(code, Bytes(40, 0xEE));
        bytes[offset] = static_cast<std::uint8_t>(value);
        const auto text = texts.find(value);
        EXPECT_EQ(textOf(fixture.rowsAfter(bytes, code), row), text == texts.end() ? fallback : text->second)
            << row << " " << value;
    }
}

} // namespace orvex::test
