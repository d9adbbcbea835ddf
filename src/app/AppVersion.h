#pragma once

#ifndef QUORVANE_BUILD_NUMBER
#define QUORVANE_BUILD_NUMBER 1
#endif

namespace qv::app_version {

inline constexpr const char* ProgramName = "Quorvane";
inline constexpr const char* Version = "2.25";
inline constexpr const char* DateStamp = "031704";
inline constexpr int Build = QUORVANE_BUILD_NUMBER;

}  // namespace qv::app_version
