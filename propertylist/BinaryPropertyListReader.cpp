#include "PropertyListReaders.h"

#include "Array.h"
#include "Dictionary.h"
#include "UTF8.h"

#include <algorithm>
#include <bit>
#include <string>
#include <string_view>
#include <utility>

namespace orvex {

namespace {
using Fault = PropertyListFault;

constexpr std::string_view kHeader = "bplist00";
constexpr std::size_t kTrailerSize = 32;
constexpr std::uint8_t kSizeFollows = 0xF; // low half of a marker: the size follows as an integer object

// Limit on the memory of a list: an amount per byte, whatever it shares, plus an allowance for small lists,
// which may share nearly everything. A report is held about five times: as received, as displayed, twice in
// the history, and as nodes of the display tree.
constexpr std::size_t kMemoryForEachByte = 24;
constexpr std::size_t kMemoryOfAnyList = 256 << 10;
constexpr std::size_t kMemoryOfValue = 48;
constexpr std::size_t kMemoryOfContainer = 80;

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

class BinaryReader {
public:
    BinaryReader(ByteView list, const PropertyListLimits& limits)
        : _list(list)
        , _count(limits)
    {
        if (list.size() < kHeader.size() + kTrailerSize)
            throw Fault("shorter than its header and trailer");
        if (!std::equal(kHeader.begin(), kHeader.end(), list.begin()))
            throw Fault("of an unknown version");
        const std::size_t trailer = list.size() - kTrailerSize;
        _offsetSize = list[trailer + 6];
        _referenceSize = list[trailer + 7];
        _objectCount = number(trailer + 8, 8);
        _root = number(trailer + 16, 8);
        _offsetTable = number(trailer + 24, 8);
        if (_offsetSize < 1 || _offsetSize > 8 || _referenceSize < 1 || _referenceSize > 8)
            throw Fault("a bad size of offsets or references");
        if (_offsetTable < kHeader.size() || _offsetTable > trailer
            || _objectCount > (trailer - _offsetTable) / _offsetSize)
            throw Fault("the offset table lies outside");
    }

    Value run()
    {
        count(_root, 0);
        return valueOf(_root);
    }

private:
    struct Object {
        std::uint8_t kind = 0;
        std::uint64_t size = 0; // elements, characters or bytes; for numbers log2 of the bytes
        std::size_t content = 0;
    };

    // Counts what the object becomes before memory is spent on it. Recursive: the number of containers
    // around the object is limited.
    void count(std::uint64_t reference, std::size_t depth)
    {
        _count.addNode();
        if (++_values > _list.size())
            throw Fault("shared containers make more values than the list has bytes");
        const Object object = objectAt(reference);
        std::size_t memory = kMemoryOfValue;
        switch (object.kind) {
        case kData:
        case kASCII:
        case kUTF16: {
            const std::size_t bytes = bytesOf(object).size();
            _count.addBytes(bytes);
            memory += bytes;
            break;
        }
        case kArray:
        case kSet:
        case kDictionary: {
            _count.enterContainer(depth);
            const std::size_t referencesEach = object.kind == kDictionary ? 2 : 1;
            requireBytes(object.content, object.size, referencesEach * _referenceSize);
            for (std::uint64_t i = 0; i < referencesEach * object.size; ++i)
                count(referenceAt(object, i), depth + 1);
            memory += kMemoryOfContainer;
            break;
        }
        default: break;
        }
        _memory += memory;
        if (_memory > kMemoryOfAnyList + kMemoryForEachByte * _list.size())
            throw Fault("shared objects make more of the list than it has room for");
    }

    // Precondition: the object has been counted.
    Value valueOf(std::uint64_t reference)
    {
        const Object object = objectAt(reference);
        switch (object.kind) {
        case kSimple: return flagOf(object);
        case kInteger: return integerOf(object);
        case kReal: return realOf(object);
        case kDate: return Date{eightBytesOf(object) + kPropertyListEpoch};
        case kData: return dataOf(object);
        case kASCII:
        case kUTF16: return textOf(object);
        case kUID:
            require(object.size < 8);
            requireBytes(object.content, 1, object.size + 1);
            return UID{number(object.content, object.size + 1)};
        case kArray: return arrayOf(object);
        case kSet: return Set{arrayOf(object)};
        case kDictionary: return dictionaryOf(object);
        default: throw Fault("an object of unknown kind");
        }
    }

    ArrayRef arrayOf(const Object& object)
    {
        auto array = Array::make();
        array->reserve(object.size);
        for (std::uint64_t i = 0; i < object.size; ++i)
            array->append(valueOf(referenceAt(object, i)));
        return array;
    }

    DictionaryRef dictionaryOf(const Object& object)
    {
        auto dictionary = Dictionary::make();
        for (std::uint64_t i = 0; i < object.size; ++i) {
            const Value key = valueOf(referenceAt(object, i));
            Value value = valueOf(referenceAt(object, object.size + i));
            if (const std::string* name = key.string())
                dictionary->set(*name, std::move(value));
            else
                dictionary->leaveOutOne();
        }
        return dictionary;
    }

    static bool flagOf(const Object& object)
    {
        constexpr std::uint64_t kFalse = 8;
        constexpr std::uint64_t kTrue = 9;
        require(object.size == kFalse || object.size == kTrue);
        return object.size == kTrue;
    }

    Value integerOf(const Object& object) const
    {
        constexpr std::uint64_t kWide = 4;
        require(object.size <= kWide);
        const std::size_t bytes = std::size_t{1} << object.size;
        requireBytes(object.content, 1, bytes);
        if (object.size < kWide)
            return static_cast<std::int64_t>(number(object.content, bytes));
        require(number(object.content, 8) == 0);
        const std::uint64_t magnitude = number(object.content + 8, 8);
        if (std::in_range<std::int64_t>(magnitude))
            return magnitude;
        return static_cast<double>(magnitude);
    }

    double realOf(const Object& object) const
    {
        if (object.size == 3)
            return eightBytesOf(object);
        require(object.size == 2);
        requireBytes(object.content, 1, 4);
        return std::bit_cast<float>(static_cast<std::uint32_t>(number(object.content, 4)));
    }

    double eightBytesOf(const Object& object) const
    {
        require(object.size == 3);
        requireBytes(object.content, 1, 8);
        return std::bit_cast<double>(number(object.content, 8));
    }

    BytesRef dataOf(const Object& object)
    {
        const auto bytes = bytesOf(object);
        return std::make_shared<Bytes>(bytes.begin(), bytes.end());
    }

    // XML texts cannot hold a zero either, and none can be displayed.
    std::string textOf(const Object& object)
    {
        const auto bytes = bytesOf(object);
        std::string text =
            object.kind == kUTF16 ? textOfUTF16(bytes) : std::string(bytes.begin(), bytes.end());
        if (text.find('\0') != std::string::npos)
            throw Fault("a zero character in a text");
        return text;
    }

    // Unpaired surrogates become U+FFFD.
    static std::string textOfUTF16(ByteView bytes)
    {
        std::u16string units;
        units.reserve(bytes.size() / 2);
        for (std::size_t i = 0; i < bytes.size(); i += 2)
            units += static_cast<char16_t>(bytes[i] << 8 | bytes[i + 1]);
        return utf8FromUTF16(units);
    }

    // The bytes of a text or of data.
    ByteView bytesOf(const Object& object) const
    {
        const std::size_t bytesEach = object.kind == kUTF16 ? 2 : 1;
        requireBytes(object.content, object.size, bytesEach);
        return _list.subspan(object.content, object.size * bytesEach);
    }

    // Precondition: the byte exists.
    std::uint64_t referenceAt(const Object& container, std::uint64_t index) const
    {
        return number(container.content + index * _referenceSize, _referenceSize);
    }

    Object objectAt(std::uint64_t reference) const
    {
        if (reference >= _objectCount)
            throw Fault("a reference to an object that is not there");
        const std::uint64_t offset = number(_offsetTable + reference * _offsetSize, _offsetSize);
        if (offset < kHeader.size() || offset >= _offsetTable)
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

    // Precondition: the bytes exist.
    std::uint64_t number(std::size_t position, std::size_t bytes) const
    {
        std::uint64_t result = 0;
        for (const std::uint8_t byte : _list.subspan(position, bytes))
            result = result << 8 | byte;
        return result;
    }

    ByteView _list;
    PropertyListCount _count;
    std::size_t _values = 0;
    std::size_t _memory = 0;
    std::size_t _offsetSize = 0;
    std::size_t _referenceSize = 0;
    std::uint64_t _objectCount = 0;
    std::uint64_t _root = 0;
    std::uint64_t _offsetTable = 0;
};
} // namespace

Value readBinaryPropertyList(ByteView list, const PropertyListLimits& limits)
{
    return BinaryReader(list, limits).run();
}

} // namespace orvex
