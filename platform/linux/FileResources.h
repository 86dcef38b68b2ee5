#pragma once

#include "Resources.h"

#include <string>

namespace orvex {

// The plist files of one directory, read anew at every call.
class FileResources final : public Resources {
public:
    explicit FileResources(std::string directory)
        : _directory(std::move(directory))
    {
    }

    // $ORVEX_RESOURCES; else the data directory of the installation that the program is part of, wherever
    // that lies now; else, for a program that runs from the build tree, the source tree's resources; else the
    // data directory chosen at configuration.
    static std::string defaultDirectory();

    std::vector<std::string> propertyListPaths() const override;
    DictionaryResult dictionaryNamed(const std::string& baseName) const override;

private:
    std::string _directory;
};

} // namespace orvex
