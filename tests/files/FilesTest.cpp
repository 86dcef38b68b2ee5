#include "OutputFile.h"

#include <gtest/gtest.h>

#include <filesystem>
#include <fstream>
#include <iterator>

#include <unistd.h>

namespace orvex {
namespace {

namespace fs = std::filesystem;

TEST(OutputFiles, AreTheirUsersAlone)
{
    std::string folder = testing::TempDir() + "filesXXXXXX";
    ::mkdtemp(folder.data());
    const auto path = [&folder](const std::string& name) { return folder + '/' + name; };
    const auto contentOf = [&path](const std::string& name) {
        std::ifstream file(path(name));
        return std::string(std::istreambuf_iterator<char>(file), {});
    };
    for (const char* name : {"old", "kept", "stranger's"})
        std::ofstream(path(name)) << "a longer content";
    fs::create_directory(path("folder"));
    const std::pair<const char*, const char*> links[] = {{"kept", "foreign link"},
        {"foreign link", "link to it"}, {"old", "link"}, {"../link", "folder/link"}, {"new too", "dangling"},
        {"circle", "circle"}};
    for (const auto& [target, name] : links)
        fs::create_symlink(target, path(name));

    constexpr uid_t kStranger = 65534;
    fs::permissions(path("old"), fs::perms::all);
    const bool isRoot = ::geteuid() == 0;
    for (const char* name : {"foreign link", "stranger's"})
        ASSERT_TRUE(!isRoot || ::lchown(path(name).c_str(), kStranger, kStranger) == 0);
    const struct {
        const char* name;
        const char* error;
        const char* written;
        bool takesRoot = false;
    } cases[] = {
        {"new", "", "new"},
        {"old", "", "old"},
        {"folder/link", "", "old"},
        {"dangling", "", "new too"},
        {"circle", "Too many levels of symbolic links", nullptr},
        {"folder", "Is a directory", nullptr},
        {"nowhere/file", "No such file or directory", nullptr},
        {"foreign link", "a link that belongs to another user", nullptr, true},
        {"link to it", "a link that belongs to another user", nullptr, true},
        {"stranger's", "belongs to another user", nullptr, true},
    };
    for (const auto& test : cases) {
        if (test.takesRoot && !isRoot)
            continue;
        auto [file, error] = openOutputFile(path(test.name));
        EXPECT_EQ(error, test.error) << test.name;
        ASSERT_EQ(file != nullptr, test.written != nullptr) << test.name;
        if (!file)
            continue;
        std::fputs(test.name, file.get());
        file.reset(); // closes it, which writes
        EXPECT_EQ(contentOf(test.written), test.name);
        EXPECT_EQ(fs::status(path(test.written)).permissions(), fs::perms(0600)) << test.name;
    }
    EXPECT_EQ(contentOf("kept") + contentOf("stranger's"), "a longer contenta longer content");
    fs::remove_all(folder);
}

} // namespace
} // namespace orvex
