#include "SipHash.h"

#include <bit>
#include <cstddef>
#include <random>

namespace orvex {

namespace {

class State {
public:
    explicit State(const std::array<std::uint64_t, 2>& key)
        : _v0(key[0] ^ 0x736F6D6570736575)
        , _v1(key[1] ^ 0x646F72616E646F6D)
        , _v2(key[0] ^ 0x6C7967656E657261)
        , _v3(key[1] ^ 0x7465646279746573)
    {
    }

    void take(std::uint64_t word)
    {
        _v3 ^= word;
        mix(2);
        _v0 ^= word;
    }

    std::uint64_t finish()
    {
        _v2 ^= 0xFF;
        mix(4);
        return _v0 ^ _v1 ^ _v2 ^ _v3;
    }

private:
    void mix(int rounds)
    {
        for (; rounds > 0; --rounds) {
            _v0 += _v1;
            _v1 = std::rotl(_v1, 13) ^ _v0;
            _v0 = std::rotl(_v0, 32);
            _v2 += _v3;
            _v3 = std::rotl(_v3, 16) ^ _v2;
            _v0 += _v3;
            _v3 = std::rotl(_v3, 21) ^ _v0;
            _v2 += _v1;
            _v1 = std::rotl(_v1, 17) ^ _v2;
            _v2 = std::rotl(_v2, 32);
        }
    }

    std::uint64_t _v0;
    std::uint64_t _v1;
    std::uint64_t _v2;
    std::uint64_t _v3;
};

// Up to 8 bytes, little-endian.
std::uint64_t wordOf(std::string_view bytes)
{
    std::uint64_t word = 0;
    for (std::size_t i = bytes.size(); i > 0; --i)
        word = word << 8 | static_cast<unsigned char>(bytes[i - 1]);
    return word;
}

std::array<std::uint64_t, 2> randomKey()
{
#ifdef FUZZING_BUILD_MODE_UNSAFE_FOR_PRODUCTION
    return {1, 2}; // fuzzing must be reproducible
#else
    std::random_device device;
    const auto word = [&device] { return std::uint64_t{device()} << 32 | device(); };
    return {word(), word()};
#endif
}

} // namespace

std::uint64_t sipHash(std::string_view text, const std::array<std::uint64_t, 2>& key)
{
    State state(key);
    const std::uint64_t length = text.size();
    for (; text.size() >= 8; text.remove_prefix(8))
        state.take(wordOf(text.substr(0, 8)));
    state.take(length << 56 | wordOf(text));
    return state.finish();
}

std::uint64_t sipHash(std::string_view text)
{
    static const std::array<std::uint64_t, 2> kKey = randomKey();
    return sipHash(text, kKey);
}

} // namespace orvex
