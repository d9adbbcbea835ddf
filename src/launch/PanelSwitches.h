#pragma once
#include <string>

#include "app/HostConventions.h"
#include "app/Options.h"
#include "catalogue/GameTree.h"
#include "catalogue/MyClass.h"
#include "launch/DetailsState.h"

namespace qv {

enum class PanelSwitch { Working, Mouse, Hidden, Cheats, Joystick, Sound, Artwork, Priority, Window };

struct SwitchResult {
    std::string spoken;        // the confirmation or refusal; empty: nothing to say
    bool nodeChanged = false;  // the selected tree node's picture or colour changed
};

// The per-game switches and the rating of the details panel. A click on a switch's shown image
// or on its label flips it; guarded game switches need a selected game and editing allowed.
class PanelSwitches {
public:
    PanelSwitches(DetailsState& state, MyClass& records, Options& options);

    // selectedNode: the tree's selected node (NoNode when none); the working switch recolours it.
    SwitchResult Click(PanelSwitch which, GameTree& tree, NodeId selectedNode);
    // A click on the shown rating image: advances it when allowed, stores and returns its text.
    std::string ClickRating();

private:
    bool Editable() const;
    SwitchResult ClickGuarded(PanelSwitch which, GameTree& tree, NodeId node);
    SwitchResult ClickCheats();
    SwitchResult ClickArtwork();

    DetailsState& state_;
    MyClass& records_;
    Options& options_;
};

// The play button: the mouse over IPlayN shows IPlayY when the game is working; the mouse over
// the window background, or a click on IPlayY, puts IPlayN back. IPlayX stays as it is.
void HoverPlay(DetailsState& state);
void RestorePlay(DetailsState& state);

// The shown state and label of a switch.
SwitchView& SwitchOf(DetailsState& state, PanelSwitch which);
const SwitchView& SwitchOf(const DetailsState& state, PanelSwitch which);

}  // namespace qv
