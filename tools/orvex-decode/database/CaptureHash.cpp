#include "database/CaptureHash.h"

#include "SipHash.h"

#include <string_view>

namespace orvex {

namespace {

constexpr std::uint64_t kRows = 0x54696D656C696E65; // a key; part of the version of the tables

// SQLite's integers have a sign, which identities do without.
std::int64_t identityOf(std::uint64_t hash)
{
    return static_cast<std::int64_t>(hash >> 1);
}

} // namespace

void CaptureHash::add(ByteView message, std::chrono::microseconds time)
{
    const std::string_view bytes(reinterpret_cast<const char*>(message.data()), message.size());
    _hash = sipHash(bytes, {_hash, static_cast<std::uint64_t>(time.count())});
}

std::int64_t CaptureHash::value() const
{
    return identityOf(_hash);
}

std::int64_t identityOf(const TimelineRow& row)
{
    return identityOf(sipHash(row.path + '\0' + row.key, {kRows, 0}));
}

} // namespace orvex
