#pragma once

#include "CellMonitorList.h"
#include "ExtraPackets.h"
#include "GSM/GSMLogGenerator.h"
#include "MRLLogGenerator2.h"

#include <cstdint>
#include <cstdio>
#include <cstdlib>

// Defined by every target: takes one input and returns 0. A finding aborts the process.
extern "C" int LLVMFuzzerTestOneInput(const std::uint8_t* data, std::size_t size);

namespace orvex::fuzz {

// Aborts unless a property that every input must have holds.
inline void require(bool holds, const char* what)
{
    if (holds)
        return;
    std::fprintf(stderr, "Does not hold: %s\n", what);
    std::abort();
}

// Runs a step of a session. Returns false if it threw one of the exceptions that end the process by design,
// for extra packets, IFX messages and templates of the wrong kind. Any other exception is a finding.
template <typename Step>
bool survives(Step step)
{
    try {
        step();
        return true;
    } catch (const LogCode_0xFF0000::UnknownDataException&) {
    } catch (const PDPContextList::UnknownDataException&) {
    } catch (const CellMonitorList::WrongKindException&) {
    } catch (const AssertionFailure&) {
    } catch (const InvalidTemplateException&) {
    }
    return false;
}

} // namespace orvex::fuzz
