#pragma once

#include "Dictionary.h"

namespace orvex {

// Writes rows, name and text, into one dictionary of the display: a section's own, or a record's in a list.
// A writer over nothing drops what it is given.
//
// Texts are made when they are read (DeferredText): a const char* given to setText() has to live as long
// as the program.
class RowWriter {
public:
    // Sets rows and leaves the others. The dictionary outlives the writer.
    explicit RowWriter(Dictionary* dictionary)
        : _dictionary(dictionary)
    {
    }
    // Writes a dictionary anew: only what is set from now on is in it after end().
    static RowWriter anew(Dictionary* dictionary)
    {
        RowWriter rows(dictionary);
        rows._isWrittenAnew = true;
        return rows;
    }

    void setText(std::string_view name, const char* text)
    {
        if (_dictionary)
            slot(name).set(DeferredText(text));
    }
    void set(std::string_view name, Value value)
    {
        if (_dictionary)
            slot(name) = std::move(value);
    }
    // Formatted as by printf.
    template <typename... Arguments>
    void setText(std::string_view name, PrintfFormat<std::type_identity_t<Arguments>...> format,
        Arguments... arguments)
    {
        if (_dictionary)
            slot(name).set(DeferredText(format, arguments...));
    }
    void remove(std::string_view name);

    void end()
    {
        if (_isWrittenAnew && _dictionary && _next < _dictionary->size())
            _dictionary->removeFrom(_next);
    }

    const Dictionary* dictionary() const { return _dictionary; }

private:
    // Rows are mostly written in the order in which they stand.
    Value& slot(std::string_view name)
    {
        if (Value* expected = _dictionary->slotAt(_next, name)) {
            ++_next;
            return *expected;
        }
        return slotElsewhere(name);
    }
    Value& slotElsewhere(std::string_view name);

    Dictionary* _dictionary;
    std::size_t _next = 0; // where the next row is expected
    bool _isWrittenAnew = false;
};

} // namespace orvex
