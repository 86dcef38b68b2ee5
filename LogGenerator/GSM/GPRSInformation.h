#pragma once

#include "GSM/GSMCells.h"
#include "GSM/ServingPLMN.h"
#include "PacketReader.h"
#include "PacketSection.h"

namespace orvex {

// Where system information 13 stands.
//
//   14  u8  position
class LogCode_0x51F4 {
public:
    static constexpr LogCode kCode = 0x51F4;
    static constexpr std::size_t kMinimumLength = 15;

    explicit LogCode_0x51F4(Packet packet)
        : _packet(packet)
    {
    }

    int si13Position() const { return _packet.u8(14); }

private:
    PacketReader _packet;
};

// GPRS options of the cell, part one.
//
//   13  u8  packet flow context supported
//   14  u8  priority access threshold
//   15  u8  network control order
class LogCode_0x51F5 {
public:
    static constexpr LogCode kCode = 0x51F5;
    static constexpr std::size_t kMinimumLength = 18;

    explicit LogCode_0x51F5(Packet packet)
        : _packet(packet)
    {
    }

    int packetFlowContext() const { return _packet.u8(13); }
    int priorityAccessThreshold() const { return _packet.u8(14); }
    int networkControlOrder() const { return _packet.u8(15); }

private:
    PacketReader _packet;
};

// GPRS options of the cell, part two.
//
//   15  u8  T3192, coded as in 3GPP TS 44.060, table 12.24.2
//   16  u8  largest DRX timer, s
//   17  u8  access burst: 0 has 8 bits, any other 11
class LogCode_0x51F6 {
public:
    static constexpr LogCode kCode = 0x51F6;
    static constexpr std::size_t kMinimumLength = 24;

    explicit LogCode_0x51F6(Packet packet)
        : _packet(packet)
    {
    }

    int t3192() const { return _packet.u8(15); }
    int drxTimerMax() const { return _packet.u8(16); }
    bool hasLongAccessBurst() const { return _packet.u8(17) != 0; }

private:
    PacketReader _packet;
};

// Packet broadcast control channel of the cell.
//
//   13  u8  1 when the cell has one
class LogCode_0x51FB {
public:
    static constexpr LogCode kCode = 0x51FB;
    static constexpr std::size_t kMinimumLength = 34;

    explicit LogCode_0x51FB(Packet packet)
        : _packet(packet)
    {
    }

    int pbcchPresent() const { return _packet.u8(13); }

private:
    PacketReader _packet;
};

// Packet system information of the cell.
//
//   13  u8  packet PSI status supported
//   14  u8  PSI messages of low repetition rate (PSI_COUNT_LR)
//   15  u8  PSI messages of high repetition rate (PSI_COUNT_HR)
//   16  u8  extended measurement order
//   33  u8  packet SI status: 0 not supported
class LogCode_0x51FD {
public:
    static constexpr LogCode kCode = 0x51FD;
    static constexpr std::size_t kMinimumLength = 35;

    explicit LogCode_0x51FD(Packet packet)
        : _packet(packet)
    {
    }

    int packetPSIStatus() const { return _packet.u8(13); }
    int countLowRepetition() const { return _packet.u8(14); }
    int countHighRepetition() const { return _packet.u8(15); }
    int extendedMeasurementOrder() const { return _packet.u8(16); }
    bool hasPacketSIStatus() const { return _packet.u8(33) != 0; }

private:
    PacketReader _packet;
};

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
