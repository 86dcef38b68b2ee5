#pragma once

#include "Array.h"
#include "ArrayLock.h"
#include "Dictionary.h"

namespace orvex {

// Writes rows, name and text, into one dictionary of the display: a section's own, or a record's in a list.
// A writer without a dictionary drops what it is given.
//
// Texts are formatted when they are read (DeferredText), so a const char* given to setText() must live as
// long as the program.
class RowWriter {
public:
    RowWriter() = default;
    // Sets rows and leaves the others.
    explicit RowWriter(DictionaryRef dictionary)
        : _dictionary(dictionary.get())
        , _share(std::move(dictionary))
    {
    }
    // Begins to write a dictionary anew: after end() it has only the rows set since. It outlives the writer.
    void beginAnew(Dictionary& dictionary)
    {
        _dictionary = &dictionary;
        _next = 0;
        _isWrittenAnew = true;
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
    // The list in this row, to be filled by a RowList. An array that somebody else holds is replaced, not
    // changed: it may be part of an older history entry.
    ArrayRef list(std::string_view name);
    void remove(std::string_view name);

    void end()
    {
        if (_isWrittenAnew && _next < _dictionary->size())
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

    Dictionary* _dictionary = nullptr;
    DictionaryRef _share;  // null for a record, whose list holds it
    std::size_t _next = 0; // where the next row is expected
    bool _isWrittenAnew = false;
};

// Fills a list of the display anew, with a row dictionary or a text for each record, and holds the array lock
// meanwhile. At its end the list has exactly the records written. Without a list it drops them.
//
// Dictionaries and texts that nobody else holds are reused: lists change with nearly every packet, and making
// the same rows again would be most of the work.
//
// Never nest two of these: the array lock does not give nested holds back.
class RowList {
public:
    explicit RowList(ArrayRef list)
        : _list(std::move(list))
    {
    }
    ~RowList();
    RowList(const RowList&) = delete;
    RowList& operator=(const RowList&) = delete;

    // Begins the next record. The writer is valid until the next call.
    RowWriter& next();
    // A record that is a text.
    void append(DeferredText text);

private:
    Value& nextElement();

    ArrayLockScope _lock;
    ArrayRef _list;
    RowWriter _row;
    std::size_t _count = 0;
};

} // namespace orvex
