#pragma once

#include "Date.h"
#include "DeferredText.h"

#include <concepts>
#include <cstdint>
#include <memory>
#include <span>
#include <string>
#include <string_view>
#include <variant>
#include <vector>

namespace orvex {

class Array;
class Dictionary;

using Bytes = std::vector<std::uint8_t>;
using ByteView = std::span<const std::uint8_t>;
using ArrayRef = std::shared_ptr<Array>;
using DictionaryRef = std::shared_ptr<Dictionary>;
using BytesRef = std::shared_ptr<Bytes>;

// A keyed archive's reference to one of its objects.
struct UID {
    std::uint64_t number = 0;

    friend bool operator==(const UID&, const UID&) = default;
};

// Consecutive bytes made of shared buffers, which are not copied.
class PiecedBytes {
public:
    // Appends the bytes from the offset on, which is at most their number.
    void append(BytesRef bytes, std::size_t offset = 0);
    std::size_t size() const { return _size; }
    // In order. Valid as long as this object.
    std::vector<ByteView> pieces() const;

private:
    struct Piece {
        BytesRef bytes;
        std::size_t offset;
    };

    std::vector<Piece> _pieces;
    std::size_t _size = 0;
};

// Unordered elements, immutable.
struct Set {
    std::shared_ptr<const Array> elements;
};

// The one value type of property lists, generator state, display dictionary and snapshots.
//
// Scalars are held by value. Arrays, dictionaries and byte buffers are held by reference, so copies of a
// Value share them; shallowCopy() and deepCopy() make new containers.
//
// A text may be a DeferredText. It is formatted on first read, so concurrent reads are unsafe.
//
// Data may be PiecedBytes: dataPieces() returns the pieces, data() joins them into one buffer for good.
//
// UIDs and sets occur in binary property lists only. Orvex does not use them; they have kinds of their own so
// that they are not mistaken for others.
class Value {
public:
    enum class Kind { null, string, integer, real, boolean, date, data, array, dictionary, uid, set };

    Value() = default;
    Value(std::string text)
        : _content(std::move(text))
    {
    }
    Value(std::string_view text)
        : _content(std::string(text))
    {
    }
    Value(const char* text)
        : _content(std::string(text))
    {
    }
    Value(DeferredText text)
        : _content(text)
    {
    }
    Value(std::same_as<bool> auto flag)
        : _content(flag)
    {
    }
    Value(std::integral auto number) requires(!std::same_as<decltype(number), bool>)
        : _content(static_cast<std::int64_t>(number))
    {
    }
    Value(double number)
        : _content(number)
    {
    }
    Value(Date date)
        : _content(date)
    {
    }
    // A null reference gives a null value.
    Value(BytesRef data);
    Value(PiecedBytes data);
    Value(ArrayRef array);
    Value(DictionaryRef dictionary);
    Value(UID uid)
        : _content(uid)
    {
    }
    Value(Set set);

    Kind kind() const
    {
        if (std::holds_alternative<DeferredText>(_content))
            return Kind::string;
        return std::holds_alternative<PiecedBytesRef>(_content) ? Kind::data
                                                                : static_cast<Kind>(_content.index());
    }
    bool isNull() const { return kind() == Kind::null; }

    // Each returns null if the value is of another kind.
    const std::string* string() const
    {
        makeText();
        return std::get_if<std::string>(&_content);
    }
    const std::int64_t* integer() const { return std::get_if<std::int64_t>(&_content); }
    const double* real() const { return std::get_if<double>(&_content); }
    const bool* boolean() const { return std::get_if<bool>(&_content); }
    const Date* date() const { return std::get_if<Date>(&_content); }
    BytesRef data() const
    {
        joinPieces();
        return reference<BytesRef>();
    }
    // The pieces of data; none if the value is of another kind.
    std::vector<ByteView> dataPieces() const;
    ArrayRef array() const { return reference<ArrayRef>(); }
    DictionaryRef dictionary() const { return reference<DictionaryRef>(); }
    const UID* uid() const { return std::get_if<UID>(&_content); }
    const Set* set() const { return std::get_if<Set>(&_content); }
    // Borrowed: these do not share ownership.
    Array* heldArray() const { return reference<ArrayRef>().get(); }
    Dictionary* heldDictionary() const { return reference<DictionaryRef>().get(); }
    // The container if no other value shares it, else null.
    Array* ownArray() const { return own(reference<ArrayRef>()); }
    Dictionary* ownDictionary() const { return own(reference<DictionaryRef>()); }

    void set(DeferredText text)
    {
        if (auto* late = std::get_if<DeferredText>(&_content))
            *late = text;
        else
            _content.emplace<DeferredText>(text);
    }

    // A new container with the same elements; any other value unchanged.
    Value shallowCopy() const;
    // The same, with deep copies of the elements.
    Value deepCopy() const;

    // Compares containers element by element.
    friend bool operator==(const Value& left, const Value& right);

private:
    using PiecedBytesRef = std::shared_ptr<const PiecedBytes>;

    template <typename Reference>
    const Reference& reference() const
    {
        static const Reference kNone;
        const auto* held = std::get_if<Reference>(&_content);
        return held ? *held : kNone;
    }
    template <typename Container>
    static Container* own(const std::shared_ptr<Container>& reference)
    {
        return reference.use_count() == 1 ? reference.get() : nullptr;
    }
    void makeText() const
    {
        if (const auto* late = std::get_if<DeferredText>(&_content))
            _content = late->text();
    }
    void joinPieces() const;

    // In the order of Kind.
    mutable std::variant<std::monostate, std::string, std::int64_t, double, bool, Date, BytesRef, ArrayRef,
        DictionaryRef, UID, Set, DeferredText, PiecedBytesRef>
        _content;
};

// For messages: "string", "dictionary", ...
const char* nameOf(Value::Kind kind);

} // namespace orvex
