#pragma once

namespace orvex {

// The first thing a program does. Where it was started without a standard input, output or error, the next
// files it opens would take their numbers, and lines meant for the user would land in them. /dev/null takes
// the numbers instead, open for reading: what is written still fails.
void occupyStandardStreams();

} // namespace orvex
