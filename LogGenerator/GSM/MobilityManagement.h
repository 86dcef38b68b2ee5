#pragma once

#include "PacketReader.h"
#include "PacketSection.h"

namespace orvex {

// GPRS mobility management state.
//
//   13  u8  state
//   14  u8  sub-state
//   15  u8  update status
class LogCode_0x7130 {
public:
    static constexpr LogCode kCode = 0x7130;
    static constexpr std::size_t kMinimumLength = 16;

    explicit LogCode_0x7130(Packet packet)
        : _packet(packet)
    {
    }

    int state() const { return _packet.u8(13); }
    int subState() const { return _packet.u8(14); }
    int updateStatus() const { return _packet.u8(15); }

private:
    PacketReader _packet;
};

// Mobility management state of the circuit-switched side.
//
//   13  u8  state
//   14  u8  sub-state
//   15  u8  update status
class LogCode_0x7131 {
public:
    static constexpr LogCode kCode = 0x7131;
    static constexpr std::size_t kMinimumLength = 16;

    explicit LogCode_0x7131(Packet packet)
        : _packet(packet)
    {
    }

    int state() const { return _packet.u8(13); }
    int subState() const { return _packet.u8(14); }
    int updateStatus() const { return _packet.u8(15); }

private:
    PacketReader _packet;
};

// Registration.
//
//   13  u8  registration state
//   14  u8  PLMN selection mode
class LogCode_0x7132 {
public:
    static constexpr LogCode kCode = 0x7132;
    static constexpr std::size_t kMinimumLength = 16;

    explicit LogCode_0x7132(Packet packet)
        : _packet(packet)
    {
    }

    int registrationState() const { return _packet.u8(13); }
    int plmnSelectionMode() const { return _packet.u8(14); }

private:
    PacketReader _packet;
};

// "Process PS": registration and mobility management of the packet-switched side.
class ProcessPS final : public PacketSection<LogCode_0x7130, LogCode_0x7132> {
public:
    ProcessPS(ClassDictionary& dict, CodeDictionary& codeDict);

protected:
    void update(const LogCode_0x7130& report) override;
    void update(const LogCode_0x7132& report) override;
};

// "Process CS": registration and mobility management of the circuit-switched side.
class ProcessCS final : public PacketSection<LogCode_0x7131, LogCode_0x7132> {
public:
    ProcessCS(ClassDictionary& dict, CodeDictionary& codeDict);

protected:
    void update(const LogCode_0x7131& report) override;
    void update(const LogCode_0x7132& report) override;
};

// "Process CO": registration and mobility management of the circuit-switched side, in brief.
class ProcessCO final : public PacketSection<LogCode_0x7131, LogCode_0x7132> {
public:
    ProcessCO(ClassDictionary& dict, CodeDictionary& codeDict);

protected:
    void update(const LogCode_0x7131& report) override;
    void update(const LogCode_0x7132& report) override;
};

} // namespace orvex
