#pragma once

#include "Band.h"
#include "ReportPart.h"
#include "ReportRows.h"

#include <string>
#include <unordered_map>
#include <vector>

namespace orvex {

// Bands of the rows that show a state: one for each row, one for each element of a list.
class States final : public ReportPart {
public:
    static constexpr std::size_t kMostBands = 8; // of a rule

    // `rules` outlive the states.
    explicit States(const std::vector<StateRule>& rules);

    bool addRow(std::size_t number, const TimelineRow& row) override;
    void set(std::size_t number, const std::string& text, const Moment& now) override;
    void clear(std::size_t number, const Moment& now) override;
    void finish(const Moment& last) override;
    // Elements of the member "bands".
    void writeJson(JsonWriter& json) const override;

private:
    const std::vector<StateRule>& _rules;
    std::vector<std::vector<Band>> _bands; // of each rule

    struct Place {
        std::size_t rule;
        std::size_t band;
    };
    std::unordered_map<std::size_t, Place> _places; // by the number of the row
};

} // namespace orvex
