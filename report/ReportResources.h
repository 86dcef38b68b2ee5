#pragma once

#include <string_view>

// The files of the page, compiled into the program; see CMakeLists.txt.
namespace orvex::resources {

extern const std::string_view kPage;    // HTML with places for the others: {{style}}
extern const std::string_view kStyle;   // the library's and the page's own
extern const std::string_view kLibrary; // that draws the plots
extern const std::string_view kScript;
extern const std::string_view kLicence; // of the library

} // namespace orvex::resources
