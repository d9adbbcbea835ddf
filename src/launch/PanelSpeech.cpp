#include "launch/PanelSpeech.h"

#include "launch/GameLog.h"
#include "reference/MakeSpeakable.h"

namespace qv {

std::string SpokenLabelText(PanelLabel label, const DetailsState& state) {
    switch (label) {
        case PanelLabel::Title: return MakeSpeakable(state.titleTooltip);
        case PanelLabel::Maker: return MakeSpeakable(state.maker.text);
        case PanelLabel::Category: return state.category.text;
        case PanelLabel::Archive: return state.archive.text;
        case PanelLabel::Plays: return state.plays.text;
        case PanelLabel::FrameRate: return SpokenFrameRate(state.frameRate.text);
    }
    return {};
}

}  // namespace qv
