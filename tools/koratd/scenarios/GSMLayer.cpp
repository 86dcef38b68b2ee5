#include "GSMLayer.h"

#include "GSMTown.h"

namespace orvex::korat {

namespace {
constexpr double kMargin = 4;      // dB
constexpr int kStepsToTrigger = 8; // 0.8 s
constexpr double kWeakest = -110;  // dBm
constexpr double kStrongest = -47;

constexpr int kSites = 13;
constexpr int kSmallCells = 34;
constexpr double kMarketRadius = 136;  // m
constexpr int kBroadcastCarriers = 60; // ARFCNs 1 to 60; the others are for traffic

std::vector<RadioField::Transmitter> transmitters()
{
    return gsmTown::transmittersAt({.wide = kSites,
        .small = kSmallCells,
        .marketRadius = kMarketRadius,
        .wideLevelAt20m = -45,
        .smallLevelAt20m = -56,
        .nearest = 30,
        .furtherBy = 10,
        .distances = 5});
}

std::vector<GSMCell> cells()
{
    std::vector<GSMCell> result;
    result.reserve(transmitters().size());
    for (int i = 0; i < static_cast<int>(transmitters().size()); ++i)
        result.push_back({1 + 23 * i % kBroadcastCarriers, i % 8, (3 + i / 8) % 8, 2001 + 3 * i});
    return result;
}
} // namespace

GSMLayer::GSMLayer()
    : _cells(cells())
    , _field(transmitters(), gsmTown::kUnderpass, kWeakest, kStrongest)
    , _selector(kMargin, kStepsToTrigger)
{
}

bool GSMLayer::step(double position, Randomness& randomness)
{
    _field.step(position, randomness);
    return _selector.step(_field);
}

Heard<GSMCell> GSMLayer::serving() const
{
    return {&_cells[_selector.serving()], _field.level(_selector.serving())};
}

std::vector<Heard<GSMCell>> GSMLayer::others(double weakest) const
{
    auto result = heardCells(_cells, _field, weakest);
    std::erase_if(result, [this](const auto& each) { return each.cell == serving().cell; });
    return result;
}

} // namespace orvex::korat
