#pragma once
#include <string>

#include "catalogue/MyClass.h"

namespace qv {

// The resolution label's cycle: "Auto" -> first -> ... -> last -> "Auto", built from the
// comma-separated Resolutions setting. Kept as a MyClass keyed list (key: the resolution trimmed;
// its Resolution field: the successor as written, so a leading blank can show on the label).
class ResolutionCycle {
public:
    static constexpr const char* kAuto = "Auto";

    ResolutionCycle() { Build(""); }
    explicit ResolutionCycle(const std::string& resolutions) { Build(resolutions); }

    // Rebuilds the cycle; the label then shows "Auto". Pieces that are blank or repeat an
    // earlier one are left out.
    void Build(const std::string& resolutions);

    // The label text after labelText: an empty label counts as "Auto"; a text outside the cycle
    // (a record's resolution no longer offered) starts over at "Auto".
    std::string Next(const std::string& labelText) const;

    // A click on the resolution label: returns the new label text and, when a game is
    // selected, stores it in its Resolution (empty for "Auto").
    std::string Advance(const std::string& labelText, MyClass* selectedGame) const;

    const MyClass& Entries() const { return cycle_; }

private:
    MyClass cycle_;
};

}  // namespace qv
