#pragma once

#include "packets/LogMessage.h"

// The subscription in the handset: a test network's (country code 001, network code 01).
namespace orvex::korat::subscriber {

inline constexpr int kMCC = 1;
inline constexpr int kMNC = 1;

// The SIM's elementary files, all fourteen, as texts. The location information holds the area code.
DictionaryRef simFiles(int locationAreaCode);

// The data connections, as texts throughout: the default one always, the second one while data flows.
// Bearers are named as the technology does ("EPS bearer", "PDP").
ArrayRef pdpContexts(const char* bearer, bool isActive);

} // namespace orvex::korat::subscriber
