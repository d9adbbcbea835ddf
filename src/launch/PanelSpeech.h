#pragma once
#include <string>

#include "launch/DetailsState.h"

namespace qv {

// The panel texts that speak when clicked.
enum class PanelLabel { Title, Maker, Category, Archive, Plays, FrameRate };

// What a click on a panel text says: the full title and the maker line in their speakable form,
// the frame rate with "FPS" spelled out, the other lines as shown.
std::string SpokenLabelText(PanelLabel label, const DetailsState& state);

}  // namespace qv
