#pragma once

#include "modem/ModemState.h"

#include "Dictionary.h"

namespace orvex::korat {

// Reads ModemManager's objects: a dictionary of paths, holding a dictionary of interfaces, holding properties
// as converted by valueFromBus(). Values of the wrong kind count as absent.

// Interface names.
inline constexpr const char* kModemInterface = "org.freedesktop.ModemManager1.Modem";
inline constexpr const char* kModem3gppInterface = "org.freedesktop.ModemManager1.Modem.Modem3gpp";
inline constexpr const char* kSignalInterface = "org.freedesktop.ModemManager1.Modem.Signal";
inline constexpr const char* kLocationInterface = "org.freedesktop.ModemManager1.Modem.Location";
inline constexpr const char* kSimInterface = "org.freedesktop.ModemManager1.Sim";
inline constexpr const char* kBearerInterface = "org.freedesktop.ModemManager1.Bearer";

// The properties of an object's interface, or null.
DictionaryRef propertiesIn(const Dictionary& objects, const std::string& path, const char* interface);

// The path of the modem to watch: the first enabled one, else the first that works. Empty if there is none.
std::string watchedModemIn(const Dictionary& objects);

// The paths of a modem's SIM card and bearers.
std::vector<std::string> simsOf(const Dictionary& objects, const std::string& modem);
std::vector<std::string> bearersOf(const Dictionary& objects, const std::string& modem);

// The state of a modem without cells and location. Identities are IMEI, IMSI and EID.
ModemState modemStateOf(const Dictionary& objects, const std::string& modem, bool withIdentities);

} // namespace orvex::korat
