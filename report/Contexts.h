#pragma once

#include "ReportPart.h"

#include <array>
#include <cstdint>
#include <optional>
#include <string>
#include <string_view>
#include <unordered_map>
#include <vector>

namespace orvex {

// The member "contexts": the packet data contexts ever shown, with what each showed last.
class Contexts final : public ReportPart {
public:
    static constexpr std::size_t kMostContexts = 200;
    static constexpr std::array<const char*, 7> kColumns{
        "Context ID", "Bearer", "APN", "PDP Type", "PDP Address", "QCI", "State"};

    // `path` of an element's rows; empty when there are no contexts.
    explicit Contexts(std::string_view path);

    bool addRow(std::size_t number, const TimelineRow& row) override;
    void set(std::size_t number, const std::string& text, const Moment& now) override;
    void clear(std::size_t number, const Moment& now) override;
    void writeJson(JsonWriter& json) const override;

private:
    struct Context {
        std::int64_t from = 0;             // positions
        std::optional<std::int64_t> until; // none while it is shown
        std::array<std::string, kColumns.size()> texts;
    };
    struct Row {
        std::size_t context;
        std::size_t column;
    };

    std::string _path;
    std::vector<Context> _contexts;
    std::unordered_map<std::string, std::size_t> _places; // of the contexts, by key
    std::unordered_map<std::size_t, Row> _rows;           // by number
    std::size_t _omitted = 0;                             // contexts beyond the limit
};

} // namespace orvex
