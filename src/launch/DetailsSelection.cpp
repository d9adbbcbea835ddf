#include "launch/DetailsSelection.h"

#include "app/TextFile.h"
#include "catalogue/RomLibrary.h"

namespace qv {

namespace {

const std::string NotAvailableFps = "FPS: Not available";

PanelText Coloured(std::string text, Rgb colour) { return {std::move(text), colour}; }

Rgb StatusColour(bool flag) { return flag ? colours::Green : colours::Red; }

PanelText MakerLine(const MyClass& game) {
    if (!game.Year.empty() && !game.Company.empty())
        return Coloured("(C) " + game.Year + ", " + DoubleAmpersands(game.Company), colours::Green);
    return Coloured("Manufacturer information not available", colours::Red);
}

std::string CategoryLine(const MyClass& entry) {
    return entry.Category.empty() ? "Category: None" : "Category: " + entry.Category;
}

std::string ArchiveLine(const MyClass& game, const Regional& regional) {
    return "ROM: " + game.RomFile + ", " + SizeText(game.FileSize, regional);
}

PanelText PlaysLine(const MyClass& game, const Regional& regional) {
    if (game.Plays == 0) return Coloured("Never played", colours::Red);
    const std::string minutes = regional.FormatNumber(game.PlaySeconds / 60.0, 0);
    const char* noun = game.Plays > 1 ? " plays (" : " play (";
    return Coloured(std::to_string(game.Plays) + noun + minutes +
                        " min), Last Played: " + game.LastPlayed,
                    colours::Green);
}

void SetEmulationStatus(DetailsState& state, const MyClass* entry) {
    state.emuWorking = StatusColour(entry && entry->EmuWorking);
    state.emuSound = StatusColour(entry && entry->EmuSound);
    state.emuColors = StatusColour(entry && entry->EmuColors);
    state.emuScreenFlip = StatusColour(entry && entry->EmuScreenFlip);
}

void SetSwitch(SwitchView& view, bool on, const char* onText, const char* offText) {
    view.on = on;
    view.label = on ? Coloured(onText, colours::Green) : Coloured(offText, colours::Red);
}

void SetTitle(DetailsState& state, const std::string& title) {
    state.titleCaption = DoubleAmpersands(title);
    state.titleTooltip = title;
}

std::string FrameRate(const SelectionSources& sources, const std::string& key) {
    return sources.frameRateText ? sources.frameRateText(key) : NotAvailableFps;
}

void ShowOwnedGame(DetailsState& state, GameTree& tree, NodeId node, MyClass& game,
                   const std::string& key, const SelectionSources& sources,
                   SelectionResult& result) {
    SetTitle(state, game.Title);
    state.maker = MakerLine(game);
    state.plays = PlaysLine(game, sources.regional);
    state.archive.text = ArchiveLine(game, sources.regional);

    const MyClass* entry = sources.library.Item(key);
    if (entry) {
        state.category.text = CategoryLine(*entry);
        if (!entry->MameVersion.empty()) state.archive.text += ", " + entry->MameVersion;
    }
    SetEmulationStatus(state, entry);

    SetSwitch(state.working, game.Working, "Working", "Not Working");
    tree.SetImage(node, game.Working ? "good" : "bad");
    result.nodeChanged = true;
    state.play = game.Working ? PlayImage::Normal : PlayImage::Disabled;
    SetSwitch(state.mouse, game.Mouse, "Mouse On", "Mouse Off");
    SetSwitch(state.hidden, game.Hidden, "Hidden", "Not Hidden");

    const std::string& artDir = sources.options.ArtworkDir;
    if (!artDir.empty() && FileExists(sources.host.Join(artDir, game.RomFile))) {
        state.artworkMark = true;
    } else if (state.artwork.on) {
        // The label repeats the image, so it follows when artwork is forced off.
        SetSwitch(state.artwork, false, "Use Artwork", "No Artwork");
    }

    state.archive.colour = StatusColour(game.Present);

    if (game.Resolution.empty()) game.Resolution = "Auto";
    state.resolution = game.Resolution;

    state.frameRate.text = FrameRate(sources, key);
    state.frameRate.colour = state.frameRate.text == NotAvailableFps ? colours::Red : colours::Green;

    state.rating = game.Rating.size() <= 5 ? static_cast<int>(game.Rating.size()) : 0;
    result.textView = TextViewRefresh::All;

    if (!sources.executableFound) state.play = PlayImage::Disabled;
    state.selectedGameKey = key;
    result.refreshPictures = true;
    result.titleToSpeak = game.Title;
    result.gameShown = true;
}

void ShowLibraryGame(DetailsState& state, GameTree& tree, NodeId node, const MyClass& entry,
                     const std::string& key, const SelectionSources& sources,
                     SelectionResult& result) {
    SetTitle(state, entry.Title);
    state.maker = MakerLine(entry);
    state.category.text = CategoryLine(entry);
    state.plays = Coloured("Never played", colours::Red);

    SetEmulationStatus(state, &entry);
    SetSwitch(state.working, false, "Working", "Not Working");
    tree.SetImage(node, "bad");
    result.nodeChanged = true;
    SetSwitch(state.mouse, false, "Mouse On", "Mouse Off");
    SetSwitch(state.hidden, false, "Hidden", "Not Hidden");
    state.play = PlayImage::Disabled;

    state.archive = Coloured(ArchiveLine(entry, sources.regional), StatusColour(entry.Present));
    result.textView = TextViewRefresh::NotesHistoryInfo;
    state.rating = 0;
    state.frameRate.text = FrameRate(sources, key);  // colour stays as it was

    result.refreshPictures = true;
    result.titleToSpeak = entry.Title;
    result.gameShown = true;
}

}  // namespace

std::string DoubleAmpersands(const std::string& text) {
    std::string out;
    out.reserve(text.size() + 4);
    for (char c : text) {
        out += c;
        if (c == '&') out += '&';
    }
    return out;
}

std::string CaptionDisplayText(std::string_view caption) {
    std::string out;
    out.reserve(caption.size());
    for (std::size_t i = 0; i < caption.size(); ++i) {
        if (caption[i] != '&') {
            out += caption[i];
        } else if (i + 1 < caption.size() && caption[i + 1] == '&') {
            out += '&';
            ++i;
        }
    }
    return out;
}

SelectionResult SelectNode(DetailsState& state, GameTree& tree, NodeId node,
                           const SelectionSources& sources) {
    SelectionResult result;
    if (node < 0 || node >= tree.Count()) return result;
    const TreeNode& treeNode = tree.Node(node);
    if (treeNode.ExpandedImage == "fopen") {
        result.folder = true;
        return result;
    }
    const std::string key = treeNode.Tag;
    state.selectedGameKey.clear();

    const bool offered = treeNode.Parent != NoNode &&
                         MyClass::FoldKey(tree.Node(treeNode.Parent).Key) ==
                             MyClass::FoldKey(RomServerParentKey);
    state.downloadShown = offered;
    if (offered) state.selectedGameKey = key;

    if (!key.empty()) {
        if (MyClass* game = sources.records.Item(key)) {
            ShowOwnedGame(state, tree, node, *game, key, sources, result);
        } else if (const MyClass* entry = sources.library.Item(key)) {
            ShowLibraryGame(state, tree, node, *entry, key, sources, result);
        }
    }

    if (state.titleCaption.size() > TitleCaptionLimit)
        state.titleCaption = state.titleCaption.substr(0, TitleCaptionLimit) + "...";
    return result;
}

}  // namespace qv
