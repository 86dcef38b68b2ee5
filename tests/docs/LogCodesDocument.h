#pragma once

#include "LogCode.h"
#include "Value.h"

#include <map>
#include <optional>
#include <string>
#include <vector>

namespace orvex::test {

using Cells = std::vector<std::string>; // of a table row

// A field of a packet, as a row of docs/log-codes.md lays it out.
struct DocumentedField {
    // Where it stands: so many bits, from this one of the packet on.
    struct Place {
        std::size_t firstBit;
        std::size_t width;
    };

    std::string offset; // such as 29+6n+2i
    std::string type;
    std::string path;
    std::string shown;

    bool isCondition() const { return path.starts_with("= "); }
    bool isRow() const { return !isCondition() && !path.starts_with("*"); }
    bool isOpaque() const { return type.ends_with(" bytes"); }
    // How many records the path or the offset tells apart: 1 without an index.
    int records() const;
    // The path of a record's row.
    std::string pathOf(int record) const;
    // The raw values for which the document has a text of their own.
    std::vector<std::uint64_t> valuesWithText() const;
    // What is shown for a raw value. None where the document has it in words.
    std::optional<std::string> expected(std::uint64_t raw, const std::string& actual) const;
};

struct DocumentedCode {
    std::string technology;
    LogCode code = 0;
    std::size_t minimumLength = 0;
    std::vector<std::string> sections = {};
    std::vector<DocumentedField> fields = {};
    std::vector<Cells> otherRows = {}; // of tables with other columns

    // None when the packet lacks the subpacket in which the field stands.
    std::optional<DocumentedField::Place> place(
        const DocumentedField& field, const Bytes& packet, int record) const;
};

// The codes of docs/log-codes.md.
std::vector<DocumentedCode> documentedCodes();

// What a formula such as "0.25 × raw − 140 dBm" or a list such as "0: Off; else On" makes of a raw value;
// `actual` decides how many decimals a number has. None for words.
std::optional<std::string> textFor(const std::string& shown, std::int64_t raw, const std::string& actual);

std::uint64_t valueAt(const Bytes& packet, const DocumentedField& field, DocumentedField::Place place);
void setValue(Bytes& packet, const DocumentedField& field, DocumentedField::Place place, std::uint64_t value);

} // namespace orvex::test
