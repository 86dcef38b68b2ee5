#pragma once

#include "OrvexModel.h"

#include "Storage.h"

namespace orvex {

// What the application takes from the platform. The referents outlive it.
struct AppPlatform {
    OrvexModel::Platform session;
    Preferences& preferences;
};

} // namespace orvex
