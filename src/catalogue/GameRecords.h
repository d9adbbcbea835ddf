#pragma once
#include <cstdint>
#include <string>

#include "app/ActivityLog.h"
#include "app/HostConventions.h"
#include "app/Options.h"
#include "catalogue/MyClass.h"
#include "platform/Regional.h"
#include "platform/StatusDisplay.h"

namespace qv {

// Counters of the last load: lines of games.inc that are not comments plus new archives, and
// the bytes of every file counted by the ROM-folder scan.
struct RecordCounts {
    std::int32_t RomCount = 0;
    std::int64_t RomBytes = 0;
};

// Replaces the records with games.inc (options.GamesFile), then scans options.DefaultROMdir
// and merges its archives in.
RecordCounts LoadGameRecords(MyClass& records, const Options& options,
                             const HostConventions& host, ActivityLog& log,
                             StatusDisplay& status);

// One games.inc line (14 tab-separated columns) of a record.
std::string GameRecordLine(const MyClass& record, const Regional& regional);

// Writes games.inc through a temporary file (the old file survives a failure). Returns an
// error text (also logged with LogError), empty on success.
std::string SaveGameRecords(const MyClass& records, const Options& options,
                            const HostConventions& host, const Regional& regional,
                            ActivityLog& log);

}  // namespace qv
