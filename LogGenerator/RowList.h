#pragma once

#include "RowWriter.h"

#include "Array.h"

namespace orvex {

// Fills a list of the display anew, a row dictionary for each record. Dictionaries and texts that are there,
// and that nobody else holds, are written into again: lists change with nearly every packet, and most of the
// work would be to make the same rows anew.
//
// The list ends with the last record when the RowList does. One over nothing drops what it is given. Who
// fills a published list holds the array lock.
class RowList {
public:
    explicit RowList(Array* list)
        : _list(list)
        , _row(RowWriter::anew(nullptr))
    {
    }
    ~RowList();
    RowList(const RowList&) = delete;
    RowList& operator=(const RowList&) = delete;

    // The rows of the next record, to be written until the next call.
    RowWriter& next();

private:
    Value& nextElement();

    Array* _list;
    RowWriter _row;
    std::size_t _count = 0;
};

} // namespace orvex
