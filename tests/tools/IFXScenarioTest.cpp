// What the IFX scenario sends, read as a receiver does: the first element of every array left out,
// dictionaries of one entry replaced by its value.

#include "ScenarioItems.h"

#include "Array.h"
#include "Dictionary.h"
#include "PropertyList.h"

#include <gmock/gmock.h>

#include <map>
#include <set>

namespace orvex::korat {
namespace {

using namespace std::chrono_literals;

class IFXDrive {
public:
    void note(const Bytes& message)
    {
        const auto list = propertyListFromData(message);
        ASSERT_TRUE(list.value && list.value->dictionary()) << list.error;
        for (const auto& [key, value] : *list.value->dictionary())
            noteShown(key, value);
    }

    std::map<std::string, std::set<std::string>> texts; // by path, numbers left out
    std::map<std::string, std::set<std::size_t>> lengths;

private:
    void noteShown(const std::string& path, const Value& value)
    {
        if (const std::string* text = value.string()) {
            EXPECT_NE(*text, "") << path;
            texts[path].insert(*text);
        } else if (const auto dictionary = value.dictionary()) {
            const bool isUnwrapped = dictionary->size() == 1;
            for (const auto& [key, entry] : *dictionary)
                noteShown(isUnwrapped ? path : std::string(path).append("/").append(key), entry);
        } else if (const auto array = value.array()) {
            ASSERT_FALSE(array->isEmpty()) << path;
            EXPECT_TRUE((*array)[0].string()) << path;
            lengths[path].insert(array->size() - 1);
            for (auto element = array->begin() + 1; element != array->end(); ++element)
                noteShown(path + "/", *element);
        } else {
            ADD_FAILURE() << path << " is a " << nameOf(value.kind()) << ", which is fatal to a receiver";
        }
    }
};

TEST(IFXTownScenario, SendsTreesInBothFormsWhoseValuesMove)
{
    IFXDrive drive;
    Microseconds due{0};
    bool isXML = true;
    for (const auto& item : itemsOf(*findScenario("IFX", "town"), 600s)) {
        EXPECT_EQ(item.due, due);
        due += 1s;
        const Bytes& bytes = item.message.bytes;
        EXPECT_THAT(std::string(bytes.begin(), bytes.begin() + 8), isXML ? "<?xml ve" : "bplist00");
        isXML = !isXML;
        drive.note(bytes);
    }

    using Texts = std::set<std::string>;
    auto& texts = drive.texts;
    EXPECT_EQ(texts["Serving Cell/Technology"], (Texts{"GSM", "UMTS"}));
    EXPECT_EQ(texts["Serving Cell/Network"], (Texts{"001-01"}));
    EXPECT_EQ(texts["Serving Cell/Area"], (Texts{"5120", "5121"}));
    EXPECT_GE(texts["Serving Cell/Cell"].size(), 8U);
    EXPECT_EQ(texts["Radio Resources/State"],
        (Texts{"Idle", "Access", "Connecting", "Packet Transfer", "CELL_DCH", "CELL_FACH", "CELL_PCH",
            "Packet Idle"}));
    EXPECT_EQ(texts["Packet Data//Name Servers/"], (Texts{"192.0.2.53", "198.51.100.53"}));
    EXPECT_EQ(drive.lengths["Mobility/Cell Changes"].size(), 9U); // none up to eight
    EXPECT_THAT(drive.lengths["Neighbours/UMTS"], testing::Contains(0));
    EXPECT_THAT(drive.lengths["Neighbours/GSM"], testing::Contains(testing::Ge(8U)));

    const struct {
        const char* path;
        double least;
        double most;
    } numbers[] = {
        {"Serving Cell/RSCP", -115, -25},
        {"Serving Cell/RxLev", -115, -40},
        {"Serving Cell/EcN0", -24, -6},
        {"Neighbours/GSM//RxLev", -104, -40},
        {"Neighbours/UMTS//EcN0", -24, -6},
        {"Timing/Frequency Error", -90, 90},
    };
    for (const auto& [path, least, most] : numbers) {
        EXPECT_GE(texts[path].size(), 20U) << path;
        for (const std::string& text : texts[path]) {
            const double number = std::stod(text);
            EXPECT_TRUE(number >= least && number <= most) << path << ' ' << text;
        }
    }
}

} // namespace
} // namespace orvex::korat
