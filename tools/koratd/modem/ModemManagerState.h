#pragma once

#include "modem/ModemState.h"

#include "Dictionary.h"

namespace orvex::korat {

// What ModemManager's objects say. Objects are a dictionary of their paths; of each, the properties of its
// interfaces by name, as valueFromBus() gives them. Values of the wrong kind count as absent.

// Interfaces, which are also the names of methods' interfaces.
inline constexpr const char* kModemInterface = "org.freedesktop.ModemManager1.Modem";
inline constexpr const char* kModem3gppInterface = "org.freedesktop.ModemManager1.Modem.Modem3gpp";
inline constexpr const char* kSignalInterface = "org.freedesktop.ModemManager1.Modem.Signal";
inline constexpr const char* kLocationInterface = "org.freedesktop.ModemManager1.Modem.Location";
inline constexpr const char* kSimInterface = "org.freedesktop.ModemManager1.Sim";
inline constexpr const char* kBearerInterface = "org.freedesktop.ModemManager1.Bearer";

// The properties of an object's interface; null when there are none.
DictionaryRef propertiesIn(const Dictionary& objects, const std::string& path, const char* interface);

// The path of the modem that is watched: the first that is enabled, else the first that works. Empty when
// there is none.
std::string watchedModemIn(const Dictionary& objects);

// The paths of a modem's SIM card and bearers.
std::vector<std::string> simsOf(const Dictionary& objects, const std::string& modem);
std::vector<std::string> bearersOf(const Dictionary& objects, const std::string& modem);

// The state of a modem, without its cells and its location. Identities are IMEI, IMSI and EID.
ModemState modemStateOf(const Dictionary& objects, const std::string& modem, bool withIdentities);

} // namespace orvex::korat
