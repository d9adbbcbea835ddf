#pragma once
#include <string>
#include <string_view>

namespace qv {

// A title (or the year-and-company line) rewritten for the speech engine: upper case,
// abbreviations and Roman numerals spelled out, bracketed set names dropped, and a trailing
// ", The" moved to the front.
std::string MakeSpeakable(std::string_view text);

}  // namespace qv
