#pragma once

namespace qv {

// Switches of the details panel that hold for the rest of the run and are read when the next
// game starts. Sound and joystick live in Options; mouse, hidden and working in the record.
struct RunSwitches {
    bool Cheats = false;
    bool Artwork = false;
    bool Priority = false;
    bool Window = false;
};

}  // namespace qv
