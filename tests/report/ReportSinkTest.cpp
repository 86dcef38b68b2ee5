#include "ReportSink.h"

#include <gtest/gtest.h>
#include <nlohmann/json.hpp>

#include <map>
#include <sstream>

namespace orvex::test {
namespace {

using nlohmann::json;

// Feeds a report with samples of rows by path; "" clears one.
class Capture {
public:
    explicit Capture(const char* technology)
        : _sink(technology)
    {
    }

    void sample(int second, const std::vector<std::pair<std::string, std::string>>& rows)
    {
        _sink.takeMessage(std::chrono::seconds(kStart + second));
        _sink.sample({static_cast<double>(kStart + second)});
        for (const auto& [path, text] : rows) {
            const auto [row, isNew] = _rows.try_emplace(path, _rows.size());
            if (isNew)
                _sink.addRow(row->second, {path, ""});
            if (text.empty())
                _sink.clear(row->second);
            else
                _sink.set(row->second, text);
        }
    }
    json report()
    {
        _sink.finish();
        std::ostringstream stream;
        JsonWriter writer(stream);
        writer.beginObject();
        _sink.writeJson(writer);
        writer.endObject();
        return json::parse(stream.str());
    }

    static constexpr int kStart = 1'700'000'000;

private:
    ReportSink _sink;
    std::map<std::string, std::size_t> _rows;
};

TEST(ReportSink, GivesEachServingCellItsTimeAndItsLevels)
{
    const std::string info = "/Serving Cell Info/";
    const std::string idle = "/Serving Cell Measurements/";
    const std::string connected = "/Connected mode LTE Intra-frequency Measurement/Serving ";
    Capture capture("MRL_LTE");
    capture.sample(0,
        {{info + "Physical Cell ID", "7"}, {info + "Download Frequency", "6300"},
            {idle + "Physical Cell ID", "7"}, {idle + "Measured RSRP", "-80.00 dBm"}});
    capture.sample(4, {{connected + "Physical Cell ID", "7"}, {connected + "Filtered RSRP", "-85.50 dBm"}});
    // The measurement is still of the old cell, and the list names the channel.
    capture.sample(10, {{info + "Physical Cell ID", "9"}, {info + "UARFCN", "1300"}});
    capture.sample(12, {{idle + "Physical Cell ID", "9"}, {idle + "Measured RSRP", "-100.00 dBm"}});
    capture.sample(42, {}); // after a gap
    capture.sample(44, {{info + "Physical Cell ID", "7"}, {info + "UARFCN", ""}});
    capture.sample(45, {});
    const json report = capture.report();

    const json& cells = report["servingCells"][0]["cells"];
    ASSERT_EQ(cells.size(), 2);
    EXPECT_EQ(cells[0]["name"], "PCI 7, EARFCN 6300");
    EXPECT_EQ(cells[0]["duration"], 11'000);
    EXPECT_EQ(cells[0]["visits"], 2);
    EXPECT_EQ(cells[0]["levels"][0]["best"], -80);
    EXPECT_EQ(cells[0]["levels"][0]["median"], -85.5);
    EXPECT_EQ(cells[0]["levels"][0]["last"], -85.5);
    EXPECT_EQ(cells[1]["name"], "PCI 9, EARFCN 1300");
    EXPECT_EQ(cells[1]["duration"], 4'000);
    EXPECT_EQ(cells[1]["levels"][0]["best"], -100);
    EXPECT_NEAR(cells[1]["share"].get<double>(), 4.0 / 15, 1e-9);
    EXPECT_EQ(report["gaps"], json::parse("[[1700000012000,1700000042000]]"));
    EXPECT_EQ(report["bands"][0]["texts"],
        json::parse(R"(["PCI 7, EARFCN 6300","PCI 9, EARFCN 1300","PCI 7, EARFCN 6300"])"));
}

} // namespace
} // namespace orvex::test
