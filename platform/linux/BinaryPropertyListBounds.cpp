#include "BinaryPropertyListBounds.h"

#include <stdexcept>

namespace orvex {

namespace {
constexpr std::size_t kHeaderSize = 8;
constexpr std::size_t kTrailerSize = 32;
constexpr std::uint8_t kSizeFollows = 0xF; // in the low half of a marker: an integer object with the size

enum Kind : std::uint8_t {
    kSimple = 0x0,
    kInteger = 0x1,
    kReal = 0x2,
    kDate = 0x3,
    kData = 0x4,
    kASCII = 0x5,
    kUTF16 = 0x6,
    kUID = 0x8,
    kArray = 0xA,
    kSet = 0xC,
    kDictionary = 0xD,
};

struct Fault : std::runtime_error {
    using std::runtime_error::runtime_error;
};

class Walker {
public:
    Walker(std::span<const std::uint8_t> list, const PropertyListLimits& limits)
        : _list(list)
        , _limits(limits)
    {
        if (list.size() < kHeaderSize + kTrailerSize)
            throw Fault("shorter than its header and trailer");
        const std::size_t trailer = list.size() - kTrailerSize;
        _offsetSize = list[trailer + 6];
        _referenceSize = list[trailer + 7];
        _objectCount = number(trailer + 8, 8);
        _root = number(trailer + 16, 8);
        _offsetTable = number(trailer + 24, 8);
        if (_offsetSize < 1 || _offsetSize > 8 || _referenceSize < 1 || _referenceSize > 8)
            throw Fault("a bad size of offsets or references");
        if (_offsetTable < kHeaderSize || _offsetTable > trailer
            || _objectCount > (trailer - _offsetTable) / _offsetSize)
            throw Fault("the offset table lies outside");
    }

    void run() { walk(_root, 0, false); }

private:
    struct Object {
        std::uint8_t kind = 0;
        std::uint64_t size = 0; // elements, characters or bytes; for numbers the power of two of the bytes
        std::size_t content = 0;
    };

    // Depth is the number of containers around the object.
    void walk(std::uint64_t reference, std::size_t depth, bool isKey)
    {
        if (++_nodes > _limits.maximumNodes)
            throw Fault("more than " + std::to_string(_limits.maximumNodes) + " values");
        const Object object = objectAt(reference);
        if (isKey && object.kind != kASCII && object.kind != kUTF16)
            throw Fault("a key that is no text");
        switch (object.kind) {
        case kArray:
        case kSet: return walkContainer(object, 1, depth);
        case kDictionary: return walkContainer(object, 2, depth);
        default: return checkScalar(object);
        }
    }

    void walkContainer(const Object& object, std::size_t referencesEach, std::size_t depth)
    {
        if (depth >= _limits.maximumDepth)
            throw Fault("nested deeper than " + std::to_string(_limits.maximumDepth) + " containers");
        const std::size_t bytesEach = referencesEach * _referenceSize;
        requireBytes(object.content, object.size, bytesEach);
        for (std::uint64_t i = 0; i < object.size * referencesEach; ++i)
            walk(number(object.content + i * _referenceSize, _referenceSize), depth + 1,
                referencesEach == 2 && i < object.size);
    }

    void checkScalar(const Object& object)
    {
        constexpr std::uint64_t kFalse = 8;
        constexpr std::uint64_t kTrue = 9;
        switch (object.kind) {
        case kSimple: return require(object.size == kFalse || object.size == kTrue);
        case kInteger:
            require(object.size <= 4);
            requireBytes(object.content, 1, std::size_t{1} << object.size);
            // Sixteen bytes hold what is too large for eight with sign.
            return require(object.size < 4 || number(object.content, 8) == 0);
        case kReal:
            require(object.size == 2 || object.size == 3);
            return requireBytes(object.content, 1, std::size_t{1} << object.size);
        case kDate: require(object.size == 3); return requireBytes(object.content, 1, 8);
        case kUID: require(object.size < 8); return requireBytes(object.content, 1, object.size + 1);
        case kData:
        case kASCII: return countText(object, 1);
        case kUTF16: return countText(object, 2);
        default: throw Fault("an object of unknown kind");
        }
    }

    void countText(const Object& object, std::size_t bytesEach)
    {
        requireBytes(object.content, object.size, bytesEach);
        _bytes += object.size * bytesEach;
        if (_bytes > _limits.maximumBytes)
            throw Fault(
                "shared texts or data of more than " + std::to_string(_limits.maximumBytes) + " bytes");
        if (object.kind != kData)
            checkCharacters(object.content, object.size, bytesEach);
    }

    // The parser takes texts to end at a zero, and stops the process at a key that does not.
    void checkCharacters(std::size_t content, std::uint64_t count, std::size_t bytesEach) const
    {
        for (std::uint64_t i = 0; i < count; ++i) {
            if (number(content + i * bytesEach, bytesEach) == 0)
                throw Fault("a zero character in a text");
        }
    }

    Object objectAt(std::uint64_t reference) const
    {
        if (reference >= _objectCount)
            throw Fault("a reference to an object that is not there");
        const std::uint64_t offset = number(_offsetTable + reference * _offsetSize, _offsetSize);
        if (offset < kHeaderSize || offset >= _offsetTable)
            throw Fault("an object outside of the list");
        const std::uint8_t marker = _list[offset];
        Object object{static_cast<std::uint8_t>(marker >> 4), marker & 0xFU, offset + 1};
        const bool mayBeLong = object.kind >= kData && object.kind != kUID;
        if (mayBeLong && object.size == kSizeFollows) {
            requireBytes(object.content, 1, 1);
            const std::uint8_t sizeMarker = _list[object.content];
            const std::size_t sizeBytes = std::size_t{1} << (sizeMarker & 0xFU);
            require(sizeMarker >> 4 == kInteger && sizeBytes <= 8);
            requireBytes(object.content + 1, 1, sizeBytes);
            object.size = number(object.content + 1, sizeBytes);
            object.content += 1 + sizeBytes;
        }
        return object;
    }

    static void require(bool isGood)
    {
        if (!isGood)
            throw Fault("a malformed object");
    }

    // Objects end before the offset table.
    void requireBytes(std::size_t content, std::uint64_t count, std::size_t bytesEach) const
    {
        if (content > _offsetTable || count > (_offsetTable - content) / bytesEach)
            throw Fault("an object outside of the list");
    }

    // The caller has made sure that the bytes are there.
    std::uint64_t number(std::size_t position, std::size_t bytes) const
    {
        std::uint64_t result = 0;
        for (const std::uint8_t byte : _list.subspan(position, bytes))
            result = result << 8 | byte;
        return result;
    }

    std::span<const std::uint8_t> _list;
    const PropertyListLimits& _limits;
    std::size_t _offsetSize = 0;
    std::size_t _referenceSize = 0;
    std::uint64_t _objectCount = 0;
    std::uint64_t _root = 0;
    std::uint64_t _offsetTable = 0;
    std::size_t _nodes = 0;
    std::size_t _bytes = 0;
};
} // namespace

std::optional<std::string> faultOfBinaryPropertyList(
    std::span<const std::uint8_t> list, const PropertyListLimits& limits)
{
    try {
        Walker(list, limits).run();
        return std::nullopt;
    } catch (const Fault& fault) {
        return fault.what();
    }
}

} // namespace orvex
