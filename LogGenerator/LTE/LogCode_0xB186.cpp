#include "LTE/LogCode_0xB186.h"

namespace orvex {

namespace {
constexpr std::size_t kHeaderLength = 4;
} // namespace

bool LogCode_0xB186::Candidate::isComplete() const
{
    const int rat = technology();
    const std::size_t fieldsLength = rat <= geran ? 4 : rat <= cdmaHRPD ? 8 : 0;
    return _record.contains(kHeaderLength, fieldsLength);
}

void LogCode_0xB186::Candidate::expectTechnology(int first, int last) const
{
    if (technology() < first || technology() > last)
        throw ArrayOutOfBoundsException();
}

LogCode_0xB186::LTEFields LogCode_0xB186::Candidate::lteFields() const
{
    expectTechnology(lte, lte);
    const PacketReader fields = _record.from(kHeaderLength);
    return {fields.u16(0), fields.u16(2) >> 7};
}

LogCode_0xB186::UTRANFields LogCode_0xB186::Candidate::utranFields() const
{
    expectTechnology(utran, utran);
    const PacketReader fields = _record.from(kHeaderLength);
    return {fields.u16(0), fields.u16(2)};
}

LogCode_0xB186::GERANFields LogCode_0xB186::Candidate::geranFields() const
{
    expectTechnology(geran, geran);
    const PacketReader fields = _record.from(kHeaderLength);
    return {fields.u16(0), fields.u8(2), fields.u8(3)};
}

LogCode_0xB186::CDMAFields LogCode_0xB186::Candidate::cdmaFields() const
{
    expectTechnology(cdma1xRTT, cdmaHRPD);
    const PacketReader fields = _record.from(kHeaderLength);
    return {fields.u8(0), fields.u16(4), fields.u16(6)};
}

} // namespace orvex
