#include "launch/PanelSwitches.h"

#include "app/TextFile.h"

namespace qv {

namespace {

struct SwitchTexts {
    const char* onLabel;
    const char* offLabel;
    const char* spokenOn;
    const char* spokenOff;
};

SwitchTexts TextsOf(PanelSwitch which) {
    switch (which) {
        case PanelSwitch::Working: return {"Working", "Not Working", "Working", "Not Working"};
        case PanelSwitch::Mouse: return {"Mouse On", "Mouse Off", "Mouse enabled", "Mouse disabled"};
        case PanelSwitch::Hidden: return {"Hidden", "Not Hidden", "Hidden", "Not hidden"};
        case PanelSwitch::Cheats:
            return {"Cheats On", "Cheats Off", "Cheats enabled", "Cheats disabled"};
        case PanelSwitch::Joystick:
            return {"Joystick On", "Joystick Off", "Joystick enabled", "Joystick disabled"};
        case PanelSwitch::Sound: return {"Sound On", "Sound Off", "Sound enabled", "Sound disabled"};
        case PanelSwitch::Artwork:
            return {"Use Artwork", "No Artwork", "Artwork Enabled", "Artwork disabled"};
        case PanelSwitch::Priority: return {"High Priority", "High Priority", "", ""};
        case PanelSwitch::Window: return {"Windowed", "Windowed", "", ""};
    }
    return {"", "", "", ""};
}

// Shows the other image, sets the label and returns what is said about the new state.
std::string Flip(SwitchView& view, PanelSwitch which, bool on) {
    const SwitchTexts texts = TextsOf(which);
    view.on = on;
    view.label.text = on ? texts.onLabel : texts.offLabel;
    view.label.colour = on ? colours::Green : colours::Red;
    return on ? texts.spokenOn : texts.spokenOff;
}

bool& RecordFlag(MyClass& game, PanelSwitch which) {
    if (which == PanelSwitch::Mouse) return game.Mouse;
    if (which == PanelSwitch::Hidden) return game.Hidden;
    return game.Working;
}

bool ValidNode(const GameTree& tree, NodeId node) { return node >= 0 && node < tree.Count(); }

}  // namespace

SwitchView& SwitchOf(DetailsState& state, PanelSwitch which) {
    switch (which) {
        case PanelSwitch::Working: return state.working;
        case PanelSwitch::Mouse: return state.mouse;
        case PanelSwitch::Hidden: return state.hidden;
        case PanelSwitch::Cheats: return state.cheats;
        case PanelSwitch::Joystick: return state.joystick;
        case PanelSwitch::Sound: return state.sound;
        case PanelSwitch::Artwork: return state.artwork;
        case PanelSwitch::Priority: return state.priority;
        case PanelSwitch::Window: return state.window;
    }
    return state.working;
}

const SwitchView& SwitchOf(const DetailsState& state, PanelSwitch which) {
    return SwitchOf(const_cast<DetailsState&>(state), which);
}

void HoverPlay(DetailsState& state) {
    if (state.play == PlayImage::Normal && state.working.on) state.play = PlayImage::Active;
}

void RestorePlay(DetailsState& state) {
    if (state.play == PlayImage::Active) state.play = PlayImage::Normal;
}

PanelSwitches::PanelSwitches(DetailsState& state, MyClass& records, Options& options)
    : state_(state), records_(records), options_(options) {}

bool PanelSwitches::Editable() const {
    // A ROM-server game has a key but no record: there is nothing to store the change in.
    return !state_.selectedGameKey.empty() && options_.Edit &&
           records_.exists(state_.selectedGameKey);
}

SwitchResult PanelSwitches::Click(PanelSwitch which, GameTree& tree, NodeId selectedNode) {
    SwitchView& view = SwitchOf(state_, which);
    switch (which) {
        case PanelSwitch::Working:
        case PanelSwitch::Mouse:
        case PanelSwitch::Hidden:
            return ClickGuarded(which, tree, selectedNode);
        case PanelSwitch::Cheats:
            return ClickCheats();
        case PanelSwitch::Artwork:
            return ClickArtwork();
        case PanelSwitch::Joystick:
            options_.Joystick = !view.on;
            return {Flip(view, which, !view.on)};
        case PanelSwitch::Sound:
            options_.Sound = !view.on;
            return {Flip(view, which, !view.on)};
        case PanelSwitch::Priority:
        case PanelSwitch::Window:
            Flip(view, which, !view.on);
            return {};
    }
    return {};
}

SwitchResult PanelSwitches::ClickGuarded(PanelSwitch which, GameTree& tree, NodeId node) {
    SwitchView& view = SwitchOf(state_, which);
    const SwitchTexts texts = TextsOf(which);
    const bool working = which == PanelSwitch::Working;
    const bool nodeOk = ValidNode(tree, node);
    SwitchResult result;

    if (!Editable()) {
        // Only the current state is said; the working switch's exact lower-case refusal.
        if (!view.on) {
            result.spoken = working ? "Not working" : texts.spokenOff;
        } else {
            result.spoken = texts.spokenOn;
            if (working && nodeOk) {
                tree.SetImage(node, "good");
                result.nodeChanged = true;
            }
        }
        return result;
    }

    MyClass& game = *records_.Item(state_.selectedGameKey);
    if (!view.on) {
        if (working && !game.Present) return {"Cannot find ROM file!"};
        RecordFlag(game, which) = true;
        result.spoken = Flip(view, which, true);
        if (working) {
            if (nodeOk) {
                tree.SetColour(node, colours::Black);
                tree.SetImage(node, "good");
                result.nodeChanged = true;
            }
            state_.play = PlayImage::Normal;
        }
    } else {
        RecordFlag(game, which) = false;
        result.spoken = Flip(view, which, false);
        if (working) {
            if (nodeOk) {
                tree.SetColour(node, colours::Red);
                tree.SetImage(node, "bad");
                result.nodeChanged = true;
            }
            state_.play = PlayImage::Disabled;
        }
    }
    return result;
}

SwitchResult PanelSwitches::ClickCheats() {
    SwitchView& view = state_.cheats;
    if (!view.on) {
        if (options_.CheatsFile.empty()) return {"No cheats file identified."};
        if (!FileExists(options_.CheatsFile)) return {"Cannot find cheats file."};
    }
    return {Flip(view, PanelSwitch::Cheats, !view.on)};
}

SwitchResult PanelSwitches::ClickArtwork() {
    SwitchView& view = state_.artwork;
    if (!view.on && !state_.artworkMark) return {"Can not find artwork"};
    return {Flip(view, PanelSwitch::Artwork, !view.on)};
}

std::string PanelSwitches::ClickRating() {
    const bool editable = Editable();
    if (editable) state_.rating = (state_.rating + 1) % 6;
    const int stars = state_.rating >= 0 && state_.rating <= 5 ? state_.rating : 0;
    if (editable) records_.Item(state_.selectedGameKey)->Rating = std::string(stars, '*');
    return options_.RateText(stars);
}

}  // namespace qv
