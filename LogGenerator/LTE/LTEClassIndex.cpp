#include "LTE/LTEClassIndex.h"

#include "Console.h"

namespace orvex {

LTEClassIndex::~LTEClassIndex()
{
    writeConsoleLine("Deallocing LTEClassIndex");
}

} // namespace orvex
