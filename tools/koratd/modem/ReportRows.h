#pragma once

#include "modem/ModemState.h"

#include "Dictionary.h"

namespace orvex::korat {

// Rows of a report: texts under their names, in order. What is absent has no row.
class ReportRows {
public:
    void add(const char* name, const std::string& text);
    void add(const char* name, const char* text) { add(name, std::string(text)); }
    void add(const char* name, const std::vector<std::string>& texts);
    void add(const char* name, Cell::Number number, const char* unit = "");
    void add(const char* name, Cell::Level level, const char* unit);

    bool isEmpty() const { return _rows->isEmpty(); }
    const DictionaryRef& dictionary() const { return _rows; }
    // As IFX needs them: IFX shows the value of a dictionary's only entry and drops its key, so a single row
    // becomes a text that begins with its name.
    Value value() const;

private:
    DictionaryRef _rows = Dictionary::make();
};

// The rows of a cell, apart from its technology; those of a connection.
ReportRows rowsOf(const Cell& cell);
ReportRows rowsOf(const Bearer& bearer);

} // namespace orvex::korat
