#pragma once

#include "DecodeOptions.h"

#include <functional>

namespace orvex {

// Decodes each capture in a session of its own, several at a time, and writes documents, log lines and
// complaints in the order of the captures. A capture that cannot be read, or that ends its decoder, has a
// line on standard error and leaves the others alone.
//
// `decode` decodes what the options name, in a worker process, and returns the exit status. Returns that of
// the program.
int decodeInJobs(const DecodeOptions& options, const std::function<int(const DecodeOptions&)>& decode);

} // namespace orvex
