// Messages of any content through the decoders of one technology, which the build names.

#include "FuzzSession.h"
#include "FuzzTarget.h"

int LLVMFuzzerTestOneInput(const std::uint8_t* data, std::size_t size)
{
    using namespace orvex;
    fuzz::FuzzSession(ORVEX_FUZZ_TECHNOLOGY).run(fuzz::InputMessages({data, size}));
    return 0;
}
