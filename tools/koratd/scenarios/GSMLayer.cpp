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
    std::vector<RadioField::Transmitter> result(kSites + kSmallCells + 1);
    for (int i = 0; i < static_cast<int>(result.size()); ++i) {
        RadioField::Transmitter& transmitter = result[static_cast<std::size_t>(i)];
        if (i < kSites) {
            transmitter.position = gsmTown::kRoadLength * i / (kSites - 1);
            transmitter.offset = 30 + 10 * (i % 5);
            transmitter.levelAt20m = -45;
        } else if (i < kSites + kSmallCells) {
            transmitter.position = gsmTown::kMarketPlace - kMarketRadius + 8 * (i - kSites);
            transmitter.offset = 60;
            transmitter.levelAt20m = -56;
            transmitter.slope = 45;
        } else {
            transmitter.position = (gsmTown::kUnderpass.from + gsmTown::kUnderpass.to) / 2;
            transmitter.isUnderground = true;
        }
    }
    return result;
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
