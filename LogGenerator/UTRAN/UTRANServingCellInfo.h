#pragma once

#include "Base.h"

namespace orvex {

// "Serving Cell Info": who the serving UTRAN cell is, from the baseband and from the telephony service's
// cell-monitor list. Where both tell a row, whichever came last is shown.
class UTRANServingCellInfo final : public Base {
public:
    UTRANServingCellInfo(ClassDictionary& dict, CodeDictionary& codeDict);

    void updateWithData(Packet packet, LogCode logCode) override;

private:
    void updateFromServingCell(Packet packet) const;
    void updateFromCellMonitorList(Packet packet) const;
};

} // namespace orvex
