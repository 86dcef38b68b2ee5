#pragma once

#include "Date.h"
#include "OrvexModel.h"
#include "Storage.h"

#include <string>

namespace orvex {

// What window and console need of the platform. The referents outlive them.
struct AppPlatform {
    OrvexModel::Platform session;
    Preferences& preferences;
};

// Status while the session lacks a port.
inline constexpr const char* kConnectingMessage = "Connecting...";

// Status after an update, in local time and with the digits of the user's locale: "Updated 2024-03-05 at
// 14:07:09".
std::string updateMessageAt(Date moment);

// Switches the home screen's numeric signal strength: stores the preference and notifies the home screen.
// Other monitors switch it on and leave it to this one to switch it off.
void setGSMRSSIPreference(Preferences& preferences, bool shown);

} // namespace orvex
