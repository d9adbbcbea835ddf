#pragma once
#include "app/ActivityLog.h"
#include "platform/HostInfo.h"

namespace qv {

// The lines that open each run in quorvane.log: name, version, client address, screen size,
// start time and a separator.
void WriteRunHeader(ActivityLog& log, HostInfo& hostInfo, int screenWidth, int screenHeight,
                    const Regional& regional, const Clock& clock);

}  // namespace qv
