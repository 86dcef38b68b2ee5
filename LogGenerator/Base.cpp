#include "Base.h"

#include "ArrayLock.h"
#include "SystemLog.h"

namespace orvex {

Base::Base(
    std::string sectionName, std::vector<LogCode> logCodes, ClassDictionary& dict, CodeDictionary& codeDict)
    : _sectionName(std::move(sectionName))
    , _logCodes(std::move(logCodes))
{
    dict.insert_or_assign(_sectionName, this);
    updateLogCodeDict(codeDict);
}

void Base::updateLogCodeDict(CodeDictionary& codeDict)
{
    const auto codes = getLogCodeArray();
    systemLog(Priority::warning, "Array Count: %d", static_cast<int>(codes.size()));
    for (const LogCode code : codes)
        codeDict.subscribe(code, *this);
}

void Base::updateSectionRef(const Value& container)
{
    _dictionary = container.dictionary();
    _array = container.array();
    systemLogText(Priority::warning, getSectionName());
}

void Base::clearElementsInArray(const ArrayRef& array)
{
    const ArrayLockScope lock;
    if (array)
        array->removeAll();
}

void Base::replaceArray(const ArrayRef& array, const Array& with)
{
    const ArrayLockScope lock;
    if (!array)
        return;
    array->removeAll();
    array->appendAll(with);
}

void Base::reportUnknown(LogCode logCode)
{
    systemLog(Priority::error, "Received an unknown log message: %d", logCode);
}

std::int16_t Base::lookUpECNO(std::uint32_t ratio)
{
    struct Band {
        std::uint32_t lowest;
        std::int16_t decibel;
    };
    // About 1 dB apart at the top, drifting further down: no formula yields these bounds.
    static constexpr Band kBands[] = {{524288, 0}, {417648, -1}, {331809, -2}, {263625, -3}, {209464, -4},
        {166442, -5}, {132269, -6}, {105124, -7}, {83563, -8}, {66436, -9}, {52831, -10}, {42024, -11},
        {33441, -12}, {26622, -13}, {21206, -14}, {16904, -15}, {13487, -16}, {10772, -17}, {8616, -18},
        {6903, -19}, {5543, -20}, {4462, -21}, {3604, -22}, {2922, -23}, {2241, -24}, {1950, -25},
        {1608, -26}, {1337, -27}, {1121, -28}, {950, -29}, {814, -30}, {757, -31}, {706, -31}, {0, 0}};
    for (const Band& band : kBands) {
        if (ratio >= band.lowest)
            return band.decibel;
    }
    return 0;
}

} // namespace orvex
