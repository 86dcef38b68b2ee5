#include "modem/ModemManagerState.h"

#include "modem/ModemManagerCells.h"

#include "Array.h"
#include "EnumTable.h"
#include "TextFormat.h"

#include <algorithm>
#include <limits>
#include <tuple>

namespace orvex::korat {

namespace {
constexpr std::int64_t kMostOfAll = std::numeric_limits<std::int64_t>::max();
constexpr std::int64_t kAnyTechnology = 0xFFFFFFFF; // MM_MODEM_ACCESS_TECHNOLOGY_ANY, which names none
constexpr int kUnknown = -2;                        // no value of any table
constexpr int kStateFailed = -1;                    // MMModemState
constexpr int kStateLocked = 2;
constexpr int kStateEnabled = 6;

constexpr EnumText kStates[] = {{kStateFailed, "failed"}, {1, "initializing"}, {kStateLocked, "locked"},
    {3, "disabled"}, {4, "disabling"}, {5, "enabling"}, {kStateEnabled, "enabled"}, {7, "searching"},
    {8, "registered"}, {9, "disconnecting"}, {10, "connecting"}, {11, "connected"}};

// MMModemStateFailedReason.
constexpr EnumText kFailures[] = {{2, "the SIM is missing"}, {3, "the SIM does not work"},
    {4, "its capabilities are not known"}, {5, "the eSIM has no profile"}};

// MMModemLock.
constexpr EnumText kLocks[] = {{2, "SIM PIN"}, {3, "SIM PIN2"}, {4, "SIM PUK"}, {5, "SIM PUK2"},
    {6, "service provider PIN"}, {7, "service provider PUK"}, {8, "network PIN"}, {9, "network PUK"}};

// MMModem3gppRegistrationState.
constexpr EnumText kRegistrations[] = {{0, "idle"}, {1, "home"}, {2, "searching"}, {3, "denied"},
    {5, "roaming"}, {6, "home, SMS only"}, {7, "roaming, SMS only"}, {8, "emergency calls only"},
    {9, "home, CSFB not preferred"}, {10, "roaming, CSFB not preferred"}, {11, "restricted local service"}};

// MMModemAccessTechnology: a bit each.
constexpr struct {
    int bit;
    const char* name;
    Radio radio;
} kAccessTechnologies[] = {
    {1, "GSM", Radio::gsm},
    {2, "GSM Compact", Radio::gsm},
    {3, "GPRS", Radio::gsm},
    {4, "EDGE", Radio::gsm},
    {5, "UMTS", Radio::umts},
    {6, "HSDPA", Radio::umts},
    {7, "HSUPA", Radio::umts},
    {8, "HSPA", Radio::umts},
    {9, "HSPA+", Radio::umts},
    {10, "1xRTT", Radio::cdma},
    {11, "EV-DO Rev. 0", Radio::cdma},
    {12, "EV-DO Rev. A", Radio::cdma},
    {13, "EV-DO Rev. B", Radio::cdma},
    {14, "LTE", Radio::lte},
    {16, "LTE Cat-M", Radio::lte},
    {17, "LTE NB-IoT", Radio::lte},
    {15, "5G NR", Radio::nr5g},
};

constexpr std::pair<const char*, const char*> kSignals[] = {
    {"Gsm", "GSM"}, {"Umts", "UMTS"}, {"Lte", "LTE"}, {"Nr5g", "5G"}, {"Cdma", "CDMA"}, {"Evdo", "EV-DO"}};

constexpr struct {
    const char* key;
    const char* name;
    const char* unit;
} kSignalLevels[] = {
    {"rssi", "RSSI", "dBm"},
    {"rscp", "RSCP", "dBm"},
    {"ecio", "Ec/Io", "dB"},
    {"rsrp", "RSRP", "dBm"},
    {"rsrq", "RSRQ", "dB"},
    {"snr", "SNR", "dB"},
    {"sinr", "SINR", "dB"},
    {"io", "Io", "dBm"},
    {"error-rate", "Error Rate", "%"},
};

int enumerated(const Value& value)
{
    const std::int64_t* number = value.integer();
    return number && std::in_range<int>(*number) ? static_cast<int>(*number) : kUnknown;
}

std::vector<std::string> textsIn(const Value& value)
{
    std::vector<std::string> result;
    if (const ArrayRef array = value.array()) {
        for (const Value& element : *array) {
            if (std::string text = textIn(element); !text.empty())
                result.push_back(std::move(text));
        }
    }
    return result;
}

int stateOf(const Dictionary& objects, const std::string& path)
{
    const DictionaryRef modem = propertiesIn(objects, path, kModemInterface);
    return modem ? enumerated((*modem)["State"]) : kUnknown;
}

Condition conditionOf(int state)
{
    if (state >= kStateEnabled)
        return Condition::enabled;
    if (state == kStateFailed)
        return Condition::failed;
    return state == kStateLocked ? Condition::locked : Condition::disabled;
}

void takeModem(ModemState& state, const Dictionary& modem, bool withIdentities)
{
    state.manufacturer = textIn(modem["Manufacturer"]);
    state.model = textIn(modem["Model"]);
    state.revision = textIn(modem["Revision"]);
    if (withIdentities)
        state.imei = textIn(modem["EquipmentIdentifier"]);
    const int number = enumerated(modem["State"]);
    state.stateName = textFor(number, kStates, "unknown");
    state.condition = conditionOf(number);
    if (state.condition == Condition::failed)
        state.conditionText =
            textFor(enumerated(modem["StateFailedReason"]), kFailures, "the reason is not known");
    if (state.condition == Condition::locked)
        state.conditionText = textFor(enumerated(modem["UnlockRequired"]), kLocks, "a code");
    const std::int64_t technologies = numberIn(modem["AccessTechnologies"], kAnyTechnology - 1).value_or(0);
    for (const auto& [bit, name, radio] : kAccessTechnologies) {
        if ((technologies >> bit & 1) == 0)
            continue;
        state.accessTechnologies.emplace_back(name);
        if (radio != Radio::nr5g || !state.radio)
            state.radio = radio;
    }
    if (const ArrayRef quality = modem["SignalQuality"].array(); quality && !quality->isEmpty())
        state.signalQuality = numberIn((*quality)[0], 100);
}

Registration registrationFrom(const Dictionary& properties)
{
    return {textFor(enumerated(properties["RegistrationState"]), kRegistrations, "unknown"),
        textIn(properties["OperatorCode"]), textIn(properties["OperatorName"])};
}

SimCard simFrom(const Dictionary& properties, std::vector<std::string> ownNumbers, bool withIdentities)
{
    SimCard sim{textIn(properties["SimIdentifier"]), textIn(properties["OperatorIdentifier"]),
        textIn(properties["OperatorName"]), std::move(ownNumbers), {}, {}};
    if (withIdentities) {
        sim.imsi = textIn(properties["Imsi"]);
        sim.eid = textIn(properties["Eid"]);
    }
    return sim;
}

Bearer::Addresses addressesIn(const Value& value)
{
    Bearer::Addresses result;
    const DictionaryRef configuration = value.dictionary();
    if (!configuration)
        return result;
    result.address = textIn((*configuration)["address"]);
    if (const auto prefix = numberIn((*configuration)["prefix"], 128); prefix && !result.address.empty())
        result.address += '/' + std::to_string(*prefix);
    result.gateway = textIn((*configuration)["gateway"]);
    for (const char* key : {"dns1", "dns2", "dns3"}) {
        if (std::string server = textIn((*configuration)[key]); !server.empty())
            result.nameServers.push_back(std::move(server));
    }
    return result;
}

Bearer bearerFrom(const Dictionary& properties)
{
    Bearer bearer;
    if (const DictionaryRef settings = properties["Properties"].dictionary())
        bearer.apn = textIn((*settings)["apn"]); // beside user name and password, which nobody is shown
    bearer.interface = textIn(properties["Interface"]);
    const bool* connected = properties["Connected"].boolean();
    bearer.isConnected = connected && *connected;
    bearer.ipv4 = addressesIn(properties["Ip4Config"]);
    bearer.ipv6 = addressesIn(properties["Ip6Config"]);
    if (const DictionaryRef counters = properties["Stats"].dictionary(); counters && bearer.isConnected) {
        bearer.duration = numberIn((*counters)["duration"], kMostOfAll);
        bearer.receivedBytes = numberIn((*counters)["rx-bytes"], kMostOfAll);
        bearer.sentBytes = numberIn((*counters)["tx-bytes"], kMostOfAll);
    }
    return bearer;
}

std::vector<SignalLevel> signalFrom(const Dictionary& properties)
{
    std::vector<SignalLevel> result;
    for (const auto& [property, technology] : kSignals) {
        const DictionaryRef levels = properties[property].dictionary();
        if (!levels)
            continue;
        for (const auto& [key, name, unit] : kSignalLevels) {
            if (const auto level = levelIn((*levels)[key]))
                result.push_back({std::string(technology) + ' ' + name, *level, unit});
        }
    }
    return result;
}
} // namespace

DictionaryRef propertiesIn(const Dictionary& objects, const std::string& path, const char* interface)
{
    const DictionaryRef interfaces = objects[path].dictionary();
    return interfaces ? (*interfaces)[interface].dictionary() : nullptr;
}

std::string watchedModemIn(const Dictionary& objects)
{
    // Paths end in a number that grows.
    const auto rank = [&](const std::string& path) {
        const Condition condition = conditionOf(stateOf(objects, path));
        return std::tuple(condition != Condition::enabled, condition == Condition::failed, path.size(), path);
    };
    std::string best;
    for (const Dictionary::Entry& object : objects) {
        if (propertiesIn(objects, object.key, kModemInterface)
            && (best.empty() || rank(object.key) < rank(best)))
            best = object.key;
    }
    return best;
}

std::vector<std::string> simsOf(const Dictionary& objects, const std::string& modem)
{
    const DictionaryRef properties = propertiesIn(objects, modem, kModemInterface);
    const std::string* path = properties ? (*properties)["Sim"].string() : nullptr;
    const bool hasSim = path && path->size() > 1; // "/" stands for none
    return hasSim ? std::vector{*path} : std::vector<std::string>();
}

std::vector<std::string> bearersOf(const Dictionary& objects, const std::string& modem)
{
    const DictionaryRef properties = propertiesIn(objects, modem, kModemInterface);
    return properties ? textsIn((*properties)["Bearers"]) : std::vector<std::string>();
}

ModemState modemStateOf(const Dictionary& objects, const std::string& modem, bool withIdentities)
{
    ModemState state;
    state.modemCount = static_cast<std::size_t>(std::ranges::count_if(objects,
        [&](const auto& object) { return propertiesIn(objects, object.key, kModemInterface) != nullptr; }));
    const DictionaryRef properties = propertiesIn(objects, modem, kModemInterface);
    if (!properties) {
        state.condition = Condition::noModem;
        return state;
    }
    takeModem(state, *properties, withIdentities);
    if (const auto network = propertiesIn(objects, modem, kModem3gppInterface))
        state.registration = registrationFrom(*network);
    if (const auto levels = propertiesIn(objects, modem, kSignalInterface))
        state.signal = signalFrom(*levels);
    for (const std::string& path : simsOf(objects, modem)) {
        if (const auto sim = propertiesIn(objects, path, kSimInterface))
            state.sim = simFrom(*sim, textsIn((*properties)["OwnNumbers"]), withIdentities);
    }
    for (const std::string& path : bearersOf(objects, modem)) {
        if (const auto bearer = propertiesIn(objects, path, kBearerInterface))
            state.bearers.push_back(bearerFrom(*bearer));
    }
    return state;
}

} // namespace orvex::korat
