#pragma once

#include "Decoding.h"

#include "packets/LogMessage.h"

#include <gtest/gtest.h>

#include <algorithm>

namespace orvex::korat {

struct LayoutCase {
    LogMessage message;
    const char* section;
    std::vector<test::RowTexts> rows; // in any order: that of a template is for people
};

// What goes in as engineering values comes out of the receiver's own decoders as text.
inline void expectRows(const char* technology, const std::vector<LayoutCase>& cases)
{
    const auto sorted = [](std::vector<test::RowTexts> records) {
        for (test::RowTexts& rows : records)
            std::ranges::sort(rows);
        return records;
    };
    for (const auto& [message, section, rows] : cases) {
        test::Decoding decoding(technology);
        decoding.feed(message.bytes);
        EXPECT_EQ(sorted(decoding.rows(section)), sorted(rows)) << section;
    }
}

} // namespace orvex::korat
