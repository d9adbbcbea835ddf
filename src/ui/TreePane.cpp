#include "ui/TreePane.h"

#include <QDir>
#include <QHBoxLayout>
#include <QHeaderView>
#include <QLineEdit>
#include <QListWidget>
#include <QToolButton>
#include <QTreeView>
#include <QVBoxLayout>
#include <vector>

#include "ui/ClickLabel.h"

namespace qv {

TreePane::TreePane(GameTree& tree, IconSet& icons, QWidget* parent)
    : QWidget(parent), tree_(tree), model_(new GameTreeModel(tree, icons, this)) {
    setObjectName(QStringLiteral("TreePane"));

    search_ = new QLineEdit(this);
    search_->setObjectName(QStringLiteral("Text1"));
    search_->setPlaceholderText(QStringLiteral("Search"));
    searchButton_ = new QToolButton(this);
    searchButton_->setObjectName(QStringLiteral("ImageSearch"));
    searchButton_->setIcon(icons.Icon("search"));
    searchButton_->setAutoRaise(true);
    // The search itself arrives with the title search; until then the box does nothing.
    search_->setEnabled(false);
    searchButton_->setEnabled(false);

    view_ = new QTreeView(this);
    view_->setObjectName(QStringLiteral("TreeView1"));
    view_->setHeaderHidden(true);
    view_->setUniformRowHeights(true);  // lets the view skip measuring 45,000 rows
    view_->setEditTriggers(QAbstractItemView::NoEditTriggers);
    view_->setSelectionMode(QAbstractItemView::SingleSelection);
    view_->setModel(model_);

    files_ = new QListWidget(this);
    files_->setObjectName(QStringLiteral("File1"));
    files_->setUniformItemSizes(true);
    files_->hide();

    count_ = new ClickLabel(this);
    count_->setObjectName(QStringLiteral("Label15"));
    count_->setAlignment(Qt::AlignCenter);
    count_->setToolTip(QStringLiteral("Right button: show the ROM folder's files"));

    auto* searchRow = new QHBoxLayout;
    searchRow->setContentsMargins(0, 0, 0, 0);
    searchRow->setSpacing(4);
    searchRow->addWidget(search_, 1);
    searchRow->addWidget(searchButton_);

    auto* column = new QVBoxLayout(this);
    column->setContentsMargins(0, 0, 0, 0);
    column->setSpacing(6);
    column->addLayout(searchRow);
    column->addWidget(view_, 1);
    column->addWidget(files_, 1);
    column->addWidget(count_);

    connect(view_, &QTreeView::expanded, this,
            [this](const QModelIndex& index) { model_->SetExpanded(index, true); });
    connect(view_, &QTreeView::collapsed, this,
            [this](const QModelIndex& index) { model_->SetExpanded(index, false); });
    connect(view_->selectionModel(), &QItemSelectionModel::currentChanged, this,
            [this](const QModelIndex& current) {
                const NodeId id = model_->NodeOf(current);
                if (id != NoNode) emit nodeSelected(id);
            });
    connect(view_, &QTreeView::doubleClicked, this, [this](const QModelIndex& index) {
        const NodeId id = model_->NodeOf(index);
        if (id != NoNode && !tree_.IsFolder(id)) emit gameActivated(id);
    });
}

void TreePane::ChangeTree(const std::function<void()>& change, bool keepOpenFolders) {
    std::vector<std::string> openKeys;
    if (keepOpenFolders) {
        for (const NodeId root : tree_.Children(NoNode))
            if (view_->isExpanded(model_->IndexOf(root))) openKeys.push_back(tree_.Node(root).Key);
    }
    // The change may let window events run (progress lines yield); the view must neither paint
    // nor take clicks while the nodes it knows are being replaced.
    view_->setUpdatesEnabled(false);
    view_->setEnabled(false);
    model_->BeginTreeChange();
    change();
    model_->EndTreeChange();
    for (const std::string& key : openKeys) view_->expand(model_->IndexOf(tree_.Find(key)));
    view_->setEnabled(true);
    view_->setUpdatesEnabled(true);
}

void TreePane::FillFileList(const std::string& folder) {
    files_->clear();
    const QDir dir(QString::fromStdString(folder));
    if (!dir.exists()) return;
    files_->addItems(dir.entryList(QDir::Files | QDir::Hidden, QDir::Name | QDir::IgnoreCase));
}

void TreePane::SwapTreeAndFileList() {
    const bool showTree = !TreeShown();
    view_->setVisible(showTree);
    files_->setVisible(!showTree);
}

bool TreePane::TreeShown() const { return !view_->isHidden(); }

}  // namespace qv
