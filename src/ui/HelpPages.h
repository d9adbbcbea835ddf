#pragma once
#include <filesystem>

namespace qv {

// Writes help/quorvane.html and help/mame.html (shipped inside the program) into the
// application folder when they are missing; pages already there are left alone. Returns how
// many pages were written.
int EnsureHelpPages(const std::filesystem::path& appFolder);

}  // namespace qv
