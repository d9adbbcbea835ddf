#pragma once
#include <cstdint>
#include <string>

#include "app/ActivityLog.h"
#include "catalogue/MyClass.h"
#include "platform/Regional.h"
#include "platform/StatusDisplay.h"

namespace qv {

// Reads mame_rom_lib.inc into the library collection (keys: short name + ".zip"). A later line
// with the same key overwrites the earlier entry's fields; the collection is not emptied first.
void LoadRomLibrary(MyClass& library, const std::string& libraryFile, ActivityLog& log,
                    StatusDisplay& status);

// "0 KB", "1,000 KB", "1.0 MB": the size text of archives and of the whole ROM folder.
std::string SizeText(std::int64_t bytes, const Regional& regional);

}  // namespace qv
