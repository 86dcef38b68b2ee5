#pragma once

#include "CellMonitorList.h"
#include "GSM/PDPContextList.h"
#include "LogCode_0xFF0000.h"

#include "AssertionFailure.h"
#include "MRLLogGenerator2.h"

#include <cstdint>
#include <cstdio>
#include <cstdlib>

// What every target defines: takes one input and returns 0. A fault ends the process.
extern "C" int LLVMFuzzerTestOneInput(const std::uint8_t* data, std::size_t size);

namespace orvex::fuzz {

// Ends the process when something does not hold that does whatever the input is.
inline void require(bool holds, const char* what)
{
    if (holds)
        return;
    std::fprintf(stderr, "Does not hold: %s\n", what);
    std::abort();
}

// Runs a step of a session. False when it threw one of the exceptions that end the process by design: extra
// packets, messages of IFX and templates that hold something else than they must. Nothing else is caught:
// any other exception is a finding.
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
