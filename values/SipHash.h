#pragma once

#include <array>
#include <cstdint>
#include <string_view>

namespace orvex {

// SipHash-2-4 of a text under a 128-bit key (Aumasson and Bernstein, 2012). Without the key nobody can choose
// texts whose hashes collide.
std::uint64_t sipHash(std::string_view text, const std::array<std::uint64_t, 2>& key);

// The same under this process's random key.
std::uint64_t sipHash(std::string_view text);

} // namespace orvex
