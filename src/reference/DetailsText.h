#pragma once
#include <string>

#include "catalogue/GameTree.h"

namespace qv {

// The details text area as plain data: what it shows, in which colour, which view it holds
// ("Notes", "Hist", "Info" or "Log") and whether the user may type in it. Text lines end in
// CR LF. The window renders this and feeds the user's typing back into Text.
struct DetailsText {
    std::string Text;
    Rgb Colour = colours::LightBlue;
    std::string Marker;
    bool ReadOnly = true;
};

namespace textcolours {
inline constexpr Rgb Searching{128, 255, 128};
inline constexpr Rgb Shown{128, 128, 255};
inline constexpr Rgb Failure{255, 0, 0};
inline constexpr Rgb NoNotesRecord{0, 255, 0};
}  // namespace textcolours

}  // namespace qv
