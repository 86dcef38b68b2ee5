#pragma once

#include "PacketReader.h"

#include <algorithm>
#include <exception>

namespace orvex {

// A record was indexed at or beyond its packet's own count. Never caught: the section that does so is broken.
class ArrayOutOfBoundsException : public std::exception {
public:
    const char* what() const noexcept override { return "record index beyond the packet's own count"; }
};

// The repeated records of a packet: `count` of them, as the packet itself says, `stride` bytes apart from
// `start` on, each `width` bytes long (the stride by default; in some formats one record reaches into the
// next). Record is constructed from a reader that begins at the record's first byte.
//
// Iteration ends at the last record that lies wholly inside the packet, whatever the count claims. Indexing
// checks the count alone: an index at or beyond it throws ArrayOutOfBoundsException, and fields beyond the
// packet read as 0.
template <typename Record>
class RecordList {
public:
    RecordList(PacketReader packet, std::size_t start, std::size_t stride, std::size_t count)
        : RecordList(packet, start, stride, count, stride)
    {
    }
    RecordList(
        PacketReader packet, std::size_t start, std::size_t stride, std::size_t count, std::size_t width)
        : _packet(packet)
        , _start(start)
        , _stride(stride)
        , _count(count)
        , _width(width)
    {
    }

    std::size_t count() const { return _count; }
    // How many of them lie wholly inside the packet.
    std::size_t countInside() const
    {
        const std::size_t available = _packet.from(_start).size();
        return available < _width ? 0 : std::min(_count, (available - _width) / _stride + 1);
    }
    Record operator[](std::size_t index) const
    {
        if (index >= _count)
            throw ArrayOutOfBoundsException();
        return Record(_packet.from(_start + index * _stride));
    }

    class Iterator {
    public:
        Iterator(const RecordList& list, std::size_t index)
            : _list(list)
            , _index(index)
        {
        }

        Record operator*() const { return _list[_index]; }
        Iterator& operator++()
        {
            ++_index;
            return *this;
        }
        bool operator==(const Iterator& other) const { return _index == other._index; }

    private:
        const RecordList& _list;
        std::size_t _index;
    };

    Iterator begin() const { return {*this, 0}; }
    Iterator end() const { return {*this, countInside()}; }

private:
    PacketReader _packet;
    std::size_t _start;
    std::size_t _stride;
    std::size_t _count;
    std::size_t _width;
};

} // namespace orvex
