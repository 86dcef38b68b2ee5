#pragma once

#include "packets/GMMStatePacket.h"
#include "packets/GSMRRStatePacket.h"
#include "packets/MMStatePacket.h"
#include "packets/RegistrationPacket.h"
#include "packets/ServingPLMNPacket.h"
#include "packets/WCDMARRCStatePacket.h"

#include <optional>

namespace orvex::korat {

// A part of the handset's day, in which all layers of its protocols stay as they are.
struct GSMTownPhase {
    int shortest = 0; // steps
    int longest = 0;
    GSMRRStatePacket rr;
    std::optional<WCDMARRCStatePacket::State> rrc; // on UMTS only
    MMStatePacket mm;
    GMMStatePacket gmm;
    RegistrationPacket registration;
    ServingPLMNPacket::Service service = ServingPLMNPacket::Service::none;

    bool isOnUMTS() const { return rrc.has_value(); }
    bool isOnGSM() const { return !isOnUMTS() && rr.state != GSMRRStatePacket::State::inactive; }
    bool isCall() const { return mm.state == MMStatePacket::State::connectionActive; }
    // On UMTS, with a channel to send on.
    bool hasConnection() const
    {
        return rrc == WCDMARRCStatePacket::State::cellDCH || rrc == WCDMARRCStatePacket::State::cellFACH;
    }
    // The same, and for more than registration.
    bool hasTransfer() const { return hasConnection() && service == ServingPLMNPacket::Service::both; }
};

} // namespace orvex::korat
