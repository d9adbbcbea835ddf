#include "ui/ReferenceController.h"

#include <QAction>
#include <QApplication>
#include <QTreeView>
#include <QVBoxLayout>

#include "app/TextFile.h"
#include "launch/GameLog.h"
#include "reference/CatalogueEditing.h"
#include "ui/BusyCursor.h"
#include "ui/DetailsTextEdit.h"
#include "ui/GameRoadController.h"
#include "ui/GameTreeModel.h"
#include "ui/PicturePanel.h"
#include "ui/PlayForm.h"
#include "ui/Program.h"
#include "ui/TreeLabelEditor.h"
#include "ui/TreePane.h"

namespace qv {
ReferenceController::ReferenceController(PlayForm& form, Program& program, ReferenceHooks hooks)
    : QObject(&form),
      form_(form),
      program_(program),
      hooks_(std::move(hooks)),
      view_(new ReferenceView),
      labelEditor_(new TreeLabelEditor(form.Pane().View())),
      notes_(program.gameRecords, program.options),
      views_(program.options, notes_, *program.log) {
    form.DetailsLayout()->addWidget(view_, 1);
    pictures_.Size = view_->Pictures()->Size();


    connect(view_, &ReferenceView::tabClicked, this, &ReferenceController::ClickTab);
    connect(view_, &ReferenceView::notesTabDoubleClicked, this, &ReferenceController::ViewLog);
    DetailsTextEdit* text = view_->TextArea();
    connect(text, &DetailsTextEdit::edited, this, [this, text] { area_.Text = text->TextCrlf(); });
    connect(text, &DetailsTextEdit::doubleClicked, this, [this] {
        if (hooks_.speak) hooks_.speak(area_.Text);
    });
    for (PictureSlot slot : {PictureSlot::Marquee, PictureSlot::Screenshot}) {
        PictureBoxWidget* box = view_->Pictures()->Box(slot);
        connect(box, &PictureBoxWidget::pressed, this,
                [this](PictureSlot, int buttons, QPointF at) {
                    PressPicture(anchor_, buttons, at.x(), at.y());
                });
        auto drag = [this](PictureSlot which, int buttons, QPointF at) {
            PictureBox& target =
                which == PictureSlot::Marquee ? pictures_.Marquee : pictures_.Screenshot;
            if (DragPicture(anchor_, buttons, at.x(), at.y(), target)) RenderPictures();
        };
        connect(box, &PictureBoxWidget::moved, this, drag);
        connect(box, &PictureBoxWidget::released, this, drag);
    }
    connect(view_->Pictures()->Box(PictureSlot::Screenshot), &PictureBoxWidget::doubleClicked,
            this, [this] {
                ShowPNG(pictures_, program_.options, program_.host, NodeTag(CurrentNode()),
                        reader_, *program_.log);
                RenderPictures();
            });

    const MainMenus& menus = form.Menus();
    for (QAction* action : {menus.mNotes, menus.mHistory, menus.mLog, menus.mScreenshot,
                            menus.mRename, menus.mDelete, menus.mInsertInfo, menus.mUpdateAll})
        action->setEnabled(true);
    connect(menus.mNotes, &QAction::triggered, this, [this] { ClickTab(ViewTab::Notes); });
    connect(menus.mHistory, &QAction::triggered, this, [this] { ClickTab(ViewTab::History); });
    connect(menus.mLog, &QAction::triggered, this, &ReferenceController::ViewLog);
    connect(menus.mScreenshot, &QAction::triggered, this, [this] { ClickTab(ViewTab::Screen); });
    connect(menus.mRename, &QAction::triggered, this, &ReferenceController::Rename);
    connect(menus.mDelete, &QAction::triggered, this, &ReferenceController::Delete);
    connect(menus.mInsertInfo, &QAction::triggered, this,
            &ReferenceController::InsertMameInformation);
    connect(menus.mUpdateAll, &QAction::triggered, this, &ReferenceController::UpdateAll);
    RenderText();
    RenderPictures();
    // The window opens on the pictures, so the first selected game shows its screenshot.
    view_->ResetViewTabs();
    view_->SelectViewTab(ViewTab::Screen);
    view_->ShowImagePanel();
}

void ReferenceController::MarkMissingDatabases() {
    // Nothing clears the mark later in the run.
    if (!FileExists(program_.options.HistoryFile)) view_->MarkUnavailable(ViewTab::History);
    if (!FileExists(program_.options.MameInfoFile)) view_->MarkUnavailable(ViewTab::Info);
}

std::string ReferenceController::SelectedKey() const {
    return hooks_.selectedGameKey ? hooks_.selectedGameKey() : std::string();
}

NodeId ReferenceController::CurrentNode() const {
    TreePane& pane = form_.Pane();
    return pane.Model().NodeOf(pane.View()->currentIndex());
}

std::string ReferenceController::NodeTag(NodeId node) const {
    const GameTree& tree = form_.Tree();
    return node >= 0 && node < tree.Count() ? tree.Node(node).Tag : std::string();
}

void ReferenceController::RenderText() { view_->RenderText(area_); }

void ReferenceController::RenderPictures() {
    view_->RenderPictures(pictures_, reader_.Picture(PictureSlot::Marquee),
                          reader_.Picture(PictureSlot::Screenshot));
}

void ReferenceController::GameShown(NodeId node, bool refreshText, bool withLog,
                                    bool refreshPictures) {
    const std::string key = NodeTag(node);
    if (refreshText) {
        BusyCursor busy;
        if (area_.Marker == "Notes") notes_.ShowNotes(area_, key);
        else if (area_.Marker == "Hist") views_.ShowHistory(area_, key);
        else if (area_.Marker == "Info") views_.ShowMameInfo(area_, key);
        else if (area_.Marker == "Log" && withLog) ShowLog(key);
        RenderText();
    }
    if (refreshPictures) ShowPictures(key);
}

void ReferenceController::ClickTab(ViewTab tab) {
    view_->ResetViewTabs();
    view_->SelectViewTab(tab);
    if (tab == ViewTab::Screen) {
        view_->ShowImagePanel();
        ShowPictures(NodeTag(CurrentNode()));
        return;
    }
    if (tab == ViewTab::Notes) {
        view_->ShowTextArea();
        notes_.ShowNotes(area_, SelectedKey());
        RenderText();
        return;
    }
    const bool history = tab == ViewTab::History;
    if (view_->Unavailable(tab)) {
        const ReferenceKind kind = history ? ReferenceKind::History : ReferenceKind::Info;
        const std::string& path =
            history ? program_.options.HistoryFile : program_.options.MameInfoFile;
        if (hooks_.speak) hooks_.speak(UnavailableMessage(kind, path));
        return;
    }
    view_->ShowTextArea();
    std::string name = SelectedKey();
    if (name.empty()) name = NodeTag(CurrentNode());
    BusyCursor busy;
    if (history) views_.ShowHistory(area_, name);
    else views_.ShowMameInfo(area_, name);
    RenderText();
}

void ReferenceController::ViewLog() {
    view_->ResetViewTabs();
    view_->SelectViewTab(ViewTab::Notes);
    view_->ShowTextArea();
    ShowLog(SelectedKey());
}

void ReferenceController::ShowLog(const std::string& key) {
    notes_.SaveNotes(area_);
    const LogView log = ReadLogView(GameLogPath(program_.appFolder.string(), key, program_.host));
    area_.Text = log.text;
    area_.Colour = log.found ? textcolours::Shown : textcolours::Failure;
    area_.Marker = "Log";
    area_.ReadOnly = true;
    RenderText();
}

void ReferenceController::ShowPictures(const std::string& key) {
    qv::ShowPictures(pictures_, program_.options, program_.host, key, reader_, *program_.log);
    RenderPictures();
}

void ReferenceController::NodeTextChanged(NodeId node) {
    GameTreeModel& model = form_.Pane().Model();
    const QModelIndex index = model.IndexOf(node);
    if (index.isValid()) emit model.dataChanged(index, index);
}

CatalogueEdit ReferenceController::Edit() {
    return CatalogueEdit{program_.gameRecords, program_.romLibrary, program_.options,
                         form_.Tree(), *program_.prompt, *program_.log};
}

void ReferenceController::Rename() {
    const NodeId node = CurrentNode();
    if (!CanEditLabel(form_.Tree(), node)) return;
    const std::string oldText = form_.Tree().Node(node).Text;
    TreePane& pane = form_.Pane();
    labelEditor_->Start(pane.Model().IndexOf(node), QString::fromStdString(DisplayUtf8(oldText)),
                        [this, node, oldText](const QString& text) {
                            LabelEdited(node, oldText, text.toStdString());
                        });
}

void ReferenceController::LabelEdited(NodeId node, const std::string& oldText,
                                      const std::string& newText) {
    GameTree& tree = form_.Tree();
    if (node < 0 || node >= tree.Count()) return;
    CatalogueEdit edit = Edit();
    const std::string key = SelectedKey();
    if (!key.empty()) {
        const std::string spoken = RenameGame(edit, node, key, newText);
        for (NodeId id = 0; id < tree.Count(); ++id)
            if (tree.Node(id).Text == newText) NodeTextChanged(id);
        if (hooks_.showTitle) hooks_.showTitle(newText, nullptr);
        if (hooks_.speak) hooks_.speak(spoken);
        return;
    }
    RenameCategory(edit, oldText, newText);
    tree.SetText(node, newText);
    NodeTextChanged(node);
}

void ReferenceController::Delete() {
    CatalogueEdit edit = Edit();
    const std::string key = SelectedKey();
    const NodeId node = CurrentNode();
    DeleteOutcome outcome = DeleteOutcome::Nothing;
    form_.Pane().ChangeTree([&] { outcome = DeleteSelected(edit, key, node); }, true);
    (void)outcome;
}

void ReferenceController::InsertMameInformation() {
    CatalogueEdit edit = Edit();
    const NodeId node = CurrentNode();
    const LibraryInfoShown shown = qv::InsertMameInformation(edit, SelectedKey(), node);
    if (!shown.copied) return;
    NodeTextChanged(node);
    if (hooks_.showTitle) hooks_.showTitle(shown.title, &shown.makerLine);
}

void ReferenceController::UpdateAll() {
    CatalogueEdit edit = Edit();
    BusyCursor busy;
    form_.Pane().ChangeTree([&] { UpdateAllFromLibrary(edit); }, false);
}

ReferenceController* AttachReference(PlayForm& form, Program& program, GameRoadController& road) {
    ReferenceHooks hooks;
    hooks.selectedGameKey = [&road] { return road.State().selectedGameKey; };
    hooks.speak = [&form](const std::string& text) {
        if (form.Hooks().speak) form.Hooks().speak(text);
    };
    hooks.showTitle = [&road](const std::string& title, const std::string* maker) {
        road.ShowEditedTitle(title, maker);
    };
    auto* reference = new ReferenceController(form, program, std::move(hooks));
    road.afterSelection = [reference](NodeId node, const SelectionResult& result) {
        reference->GameShown(node, result.textView != TextViewRefresh::None,
                             result.textView == TextViewRefresh::All, result.refreshPictures);
    };
    PlayFormHooks& formHooks = form.Hooks();
    formHooks.checkVoice = [reference, previous = formHooks.checkVoice] {
        reference->MarkMissingDatabases();
        if (previous) previous();
    };
    return reference;
}

}  // namespace qv
