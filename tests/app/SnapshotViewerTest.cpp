#include "SnapshotViewer.h"

#include "PaneFixture.h"
#include "Window.h"

namespace orvex::test {
namespace {

TEST(SnapshotViewer, ShowsEntriesThenTheirTrees)
{
    const auto entry = [](const char* description, const char* value) {
        return Dictionary::make({{"Description", description},
            {"Display", Dictionary::make({{"Section", Dictionary::make({{"Row", value}})}})}});
    };
    const auto data = Array::make({entry("Snapshot (a)", "1"), entry("Snapshot (a)", "2"),
        Dictionary::make({{"Display", Array::make()}}),
        Dictionary::make({{"DLF", std::make_shared<Bytes>(161)}})});
    const SnapshotViewer viewer(
        {"2024-03-05 14:07:09 +0000", data, "no service"}, "x.orvex", QSize(300, 500));
    EXPECT_EQ(viewer.window().windowTitle(), "x.orvex – Orvex");
    EXPECT_EQ(viewer.window().size(), QSize(300, 500));
    NavigationStack& stack = viewer.navigationStack();
    const auto& root = paneAt(stack, 0);
    ASSERT_EQ(root.tableList().rowCount(), 5);
    EXPECT_EQ(shownAt(root, 1), "Snapshot (a) (2)");
    EXPECT_EQ(shownAt(root, 2), "(no description)");
    EXPECT_EQ(shownAt(root, 3), "DLF=161 bytes");
    tapRow(root.tableList(), 1);
    tapRow(paneAt(stack, 1).tableList(), 0);
    const auto& section = paneAt(stack, 2);
    EXPECT_EQ(shownAt(section, 0), "Row=2");
    EXPECT_EQ(section.status(), "Saved 2024-03-05 14:07:09 +0000");
    EXPECT_FALSE(section.isLoading());
}

} // namespace
} // namespace orvex::test
