#pragma once

#include "RowWriter.h"

#include "Array.h"
#include "ArrayLock.h"

namespace orvex {

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
