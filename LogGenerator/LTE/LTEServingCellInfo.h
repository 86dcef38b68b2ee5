#pragma once

#include "Base.h"

namespace orvex {

// "Serving Cell Info": who the serving LTE cell is, from the baseband and from the telephony service's
// cell-monitor list. Where both tell a row, whichever came last is shown.
class LTEServingCellInfo final : public Base {
public:
    LTEServingCellInfo(ClassDictionary& dict, CodeDictionary& codeDict);

    void updateWithData(Packet packet, LogCode logCode) override;

private:
    void updateFromServingCell(Packet packet) const;
    void updateFromAntennas(Packet packet) const;
    void updateFromCellMonitorList(Packet packet) const;
};

} // namespace orvex
