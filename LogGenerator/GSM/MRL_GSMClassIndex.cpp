#include "GSM/MRL_GSMClassIndex.h"

#include "Console.h"

namespace orvex {

MRL_GSMClassIndex::~MRL_GSMClassIndex()
{
    writeConsoleLine("Deallocing MRL_GSMClassIndex");
}

} // namespace orvex
