#pragma once

#include "Storage.h"

#include "Dictionary.h"

#include <map>

namespace orvex::test {

// Resources that the test lays out by base name.
class FixedResources final : public Resources {
public:
    std::vector<std::string> propertyListPaths() const override
    {
        std::vector<std::string> paths;
        for (const auto& [name, dictionary] : templates)
            paths.push_back(name + ".plist");
        return paths;
    }
    DictionaryResult dictionaryNamed(const std::string& baseName) const override
    {
        const auto found = templates.find(baseName);
        if (found == templates.end())
            return {nullptr, baseName + ".plist: missing"};
        return {found->second, {}};
    }

    std::map<std::string, DictionaryRef> templates;
};

} // namespace orvex::test
