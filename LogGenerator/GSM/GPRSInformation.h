#pragma once

#include "GSM/LogCode_0x5137.h"
#include "GSM/LogCode_0x51F4.h"
#include "GSM/LogCode_0x51F5.h"
#include "GSM/LogCode_0x51F6.h"
#include "GSM/LogCode_0x51FB.h"
#include "GSM/LogCode_0x51FD.h"
#include "GSM/LogCode_0x7135.h"
#include "PacketSection.h"

namespace orvex {

// "GPRS Information": what the serving cell offers for packet data.
class GPRSInformation final : public PacketSection<LogCode_0x51F5, LogCode_0x7135, LogCode_0x51F6,
                                  LogCode_0x51FB, LogCode_0x51FD, LogCode_0x51F4, LogCode_0x5137> {
public:
    GPRSInformation(ClassDictionary& dict, CodeDictionary& codeDict);

protected:
    void update(const LogCode_0x51F5& report) override;
    void update(const LogCode_0x7135& report) override;
    void update(const LogCode_0x51F6& report) override;
    void update(const LogCode_0x51FB& report) override;
    void update(const LogCode_0x51FD& report) override;
    void update(const LogCode_0x51F4& report) override;
    void update(const LogCode_0x5137& report) override;
};

} // namespace orvex
