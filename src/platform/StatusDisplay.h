#pragma once
#include <string>

namespace qv {

// The wait window as the loaders see it: progress text shown only while it is visible.
class StatusDisplay {
public:
    virtual ~StatusDisplay() = default;
    virtual bool IsVisible() const = 0;
    virtual void SetStatus(const std::string& text) = 0;
    void ShowStatusIfVisible(const std::string& text) {
        if (IsVisible()) SetStatus(text);
    }
};

// No wait window (tests, or after start-up).
class NoStatusDisplay final : public StatusDisplay {
public:
    bool IsVisible() const override { return false; }
    void SetStatus(const std::string&) override {}
};

}  // namespace qv
