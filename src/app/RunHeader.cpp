#include "app/RunHeader.h"

#include <string>

#include "app/AppVersion.h"

namespace qv {

void WriteRunHeader(ActivityLog& log, HostInfo& hostInfo, int screenWidth, int screenHeight,
                    const Regional& regional, const Clock& clock) {
    // Written without time stamps; the line break sets the run off from the previous one.
    log.WriteLog("\r\n", 1);
    log.WriteLog(app_version::ProgramName, 1);
    log.WriteLog(std::string("Version ") + app_version::Version + "." + app_version::DateStamp +
                     " Build " + std::to_string(app_version::Build),
                 1);
    const std::string address = hostInfo.GetLocalIP();
    const std::string hostName = hostInfo.GetLocalHostName();
    log.WriteLog("Client IP: " + address + " (" + hostName + ")", 1);
    log.WriteLog("Screen Size: " + std::to_string(screenWidth) + " x " +
                     std::to_string(screenHeight),
                 1);
    log.WriteLog("Started: " + regional.GeneralDate(clock.Now()), 1);
    log.WriteLog("", 1);
}

}  // namespace qv
