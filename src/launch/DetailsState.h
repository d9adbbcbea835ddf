#pragma once
#include <optional>
#include <string>
#include <string_view>

#include "catalogue/GameTree.h"
#include "launch/RunSwitches.h"

namespace qv {

// One text of the details panel; no colour means the panel's own text colour.
struct PanelText {
    PanelText() = default;
    PanelText(std::string t, std::optional<Rgb> c = std::nullopt)
        : text(std::move(t)), colour(c) {}
    std::string text;
    std::optional<Rgb> colour;
    bool operator==(const PanelText&) const = default;
};

// A two-image switch: `on` tells which image of the pair is shown, the label repeats it.
struct SwitchView {
    bool on = false;
    PanelText label;
};

enum class PlayImage { Normal, Active, Disabled };  // IPlayN, IPlayY, IPlayX

// Everything the details panel shows, as plain data. The panel widget only renders it.
struct DetailsState {
    std::string titleCaption = "Name of the Game";  // "&" doubled, as a label caption
    std::string titleTooltip;                       // the full title
    PanelText maker{"(C) Year, Company "};
    PanelText category{"Category:"};
    PanelText archive{"ROM: name, size KB"};
    PanelText plays{"0 Plays (0 min), Last Played: Never"};
    PanelText frameRate{"FPS:"};
    std::optional<Rgb> emuWorking, emuSound, emuColors, emuScreenFlip;

    SwitchView working{false, {"Working"}};
    SwitchView mouse{false, {"Mouse Off"}};
    SwitchView hidden{false, {"Not Hidden"}};
    SwitchView cheats{false, {"Cheats Off"}};
    SwitchView joystick{false, {"Joystick Off"}};
    SwitchView sound{false, {"No Sound"}};
    SwitchView artwork{false, {"Use Artwork"}};
    SwitchView priority{false, {"High Priority"}};
    SwitchView window{false, {"Windowed"}};
    // Set once an artwork archive of a selected game was found; allows artwork to be switched on.
    bool artworkMark = false;

    std::string resolution = "Auto";  // Label21
    PanelText executable;             // Label25: the emulator build, green when it exists
    std::string version;              // Label32: "Using mame Version: 0.251"
    int rating = 0;  // the one rating image shown, IR0..IR5
    PlayImage play = PlayImage::Normal;
    bool downloadShown = false;  // "ROM" download label and its button image

    // The archive name of the selected game when it is owned (or offered by a ROM server).
    std::string selectedGameKey;

    RunSwitches Run() const { return {cheats.on, artwork.on, priority.on, window.on}; }
};

// How a label shows its caption: "&&" is a literal "&", a single "&" only marks an access key.
std::string CaptionDisplayText(std::string_view caption);

}  // namespace qv
