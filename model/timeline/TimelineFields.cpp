#include "TimelineFields.h"

#include "NodesByPath.h"

#include <optional>

namespace orvex {

namespace {

// The rest of the path behind that component; none if it begins with another.
std::optional<std::string_view> restBehind(std::string_view path, std::string_view component)
{
    if (!path.starts_with(component))
        return std::nullopt;
    path.remove_prefix(component.size());
    if (path.empty())
        return path;
    if (!path.starts_with('/'))
        return std::nullopt;
    return path.substr(1);
}

} // namespace

TimelineFields::TimelineFields(const std::vector<std::string>& paths)
{
    for (const std::string& path : paths)
        _fields.push_back({path});
}

TimelineFields::Part TimelineFields::ofDisplay()
{
    Part part;
    part._isWhole = _fields.empty();
    for (Field& field : _fields) {
        const std::string_view path = withoutSlashesAround(field.path);
        if (path.empty())
            part._isWhole = field.isFound = true;
        else
            part._rests.push_back({path, &field.isFound});
    }
    return part;
}

TimelineFields::Part TimelineFields::Part::below(std::string_view name) const
{
    // Names may contain "/", so a component of the path is whatever the name is. One of nothing else adds
    // nothing to the path.
    const std::string_view component = withoutSlashesAround(name);
    if (_rests.empty() || component.empty())
        return *this;
    Part part;
    part._isWhole = _isWhole;
    for (const Rest& rest : _rests) {
        for (const std::string_view candidate : {component, std::string_view("*")}) {
            const auto behind = restBehind(rest.path, candidate);
            if (!behind)
                continue;
            if (behind->empty())
                part._isWhole = *rest.isFound = true;
            else
                part._rests.push_back({*behind, rest.isFound});
        }
    }
    return part;
}

std::vector<std::string> TimelineFields::missing() const
{
    std::vector<std::string> result;
    for (const Field& field : _fields) {
        if (!field.isFound)
            result.push_back(field.path);
    }
    return result;
}

} // namespace orvex
