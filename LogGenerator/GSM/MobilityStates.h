#pragma once

namespace orvex {

// The names of states that several sections of mobility management show; "Unknown" for others.
const char* registrationStateText(int state);
const char* mmStateText(int state); // of the circuit-switched side

} // namespace orvex
