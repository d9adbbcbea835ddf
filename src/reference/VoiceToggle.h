#pragma once
#include "app/Options.h"

namespace qv {

// "Use Voice": a checked entry switches speech off, an unchecked one on. Returns the new check
// state (= the Speak setting). The voice is not checked again here.
inline bool ToggleVoice(Options& options, bool checked) {
    options.Speak = !checked;
    return options.Speak;
}

}  // namespace qv
