#pragma once

#include "OrvexModelNode.h"

#include <cstddef>
#include <ostream>
#include <string>
#include <string_view>
#include <vector>

namespace orvex {

// Writes a JSON document piece by piece, so that its size costs no memory: indented by two blanks or, where
// compact, on one line. Bytes that are not UTF-8 become U+FFFD.
class JsonWriter {
public:
    explicit JsonWriter(std::ostream& stream)
        : _stream(stream)
    {
    }

    void beginObject() { open('{'); }
    void endObject() { close('}'); }
    void beginArray() { open('['); }
    void endArray() { close(']'); }
    // Before each value of an object.
    void key(std::string_view name);
    void string(std::string_view text);
    void number(double number);
    void number(std::size_t number);
    void boolean(bool value);
    void null();
    void member(std::string_view name, std::string_view text)
    {
        key(name);
        string(text);
    }
    void member(std::string_view name, std::size_t value)
    {
        key(name);
        number(value);
    }
    // After the outermost value.
    void endDocument() { _stream << '\n'; }

    bool isCompact() const { return _isCompact; }
    // From the next value on. Set it back before the enclosing container is closed.
    void setCompact(bool isCompact) { _isCompact = isCompact; }

private:
    void open(char bracket);
    void close(char bracket);
    void beginValue();
    void beginLine();

    std::ostream& _stream;
    std::vector<bool> _isEmpty; // of each open container
    bool _followsKey = false;
    bool _isCompact = false;
};

// Writes the display tree, or a branch of it that has the path, as one JSON object: {"name", "path",
// "children"} for a branch, {"name", "path", "value"} for a leaf, with "number" and "unit" if the value is a
// quantity.
//
// A tree of 32 levels or more below its root is written compact and without paths. Paths repeat every name
// above them, and indentation grows too: a few KB of a hostile report would become gigabytes.
void writeTreeJson(JsonWriter& json, const OrvexModelNode& root, const std::string& path = "/");

} // namespace orvex
