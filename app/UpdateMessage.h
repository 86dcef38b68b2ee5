#pragma once

#include "Date.h"

#include <string>

namespace orvex {

// What the status line says while a port of the session is missing.
inline constexpr const char* kConnectingMessage = "Connecting...";

// What it says after an update: "Updated 2024-03-05 at 14:07:09", in local time and with the
// digits of the user's locale.
std::string updateMessageAt(Date moment);

} // namespace orvex
