#pragma once

#include <string>
#include <vector>

namespace orvex {

// A file that a program reads or writes.
struct FileInUse {
    std::string label; // for the user: "--output x.pcap"
    std::string path;
};

// Finds an output that is also an input or another output, even through links or before the file exists.
// Returns one line that names both, or an empty text. Devices and pipes may be used more than once.
std::string fileConflict(const std::vector<FileInUse>& inputs, const std::vector<FileInUse>& outputs);

} // namespace orvex
