#include "ui/TreeLabelEditor.h"

#include <QKeyEvent>
#include <QLineEdit>
#include <QTreeView>

namespace qv {

TreeLabelEditor::TreeLabelEditor(QTreeView* view) : QObject(view), view_(view) {}

void TreeLabelEditor::Start(const QModelIndex& index, const QString& text, Done done) {
    Finish(false);
    if (!index.isValid()) return;
    view_->scrollTo(index);
    done_ = std::move(done);
    auto* editor = new QLineEdit(text, view_->viewport());
    editor->setObjectName(QStringLiteral("TreeLabelEdit"));
    QRect rect = view_->visualRect(index);
    rect.setWidth(std::max(rect.width(), 220));
    editor->setGeometry(rect);
    editor->selectAll();
    editor->installEventFilter(this);
    connect(editor, &QLineEdit::returnPressed, this, [this] { Finish(true); });
    editor_ = editor;
    editor->show();
    editor->setFocus();
}

bool TreeLabelEditor::eventFilter(QObject* watched, QEvent* event) {
    if (watched == editor_) {
        if (event->type() == QEvent::KeyPress &&
            static_cast<QKeyEvent*>(event)->key() == Qt::Key_Escape) {
            Finish(false);
            return true;
        }
        if (event->type() == QEvent::FocusOut) Finish(true);
    }
    return QObject::eventFilter(watched, event);
}

void TreeLabelEditor::Finish(bool accept) {
    if (editor_.isNull()) return;
    QLineEdit* editor = editor_;
    editor_.clear();
    editor->removeEventFilter(this);
    const QString text = editor->text();
    Done done = std::move(done_);
    done_ = nullptr;
    editor->hide();
    editor->deleteLater();
    if (accept && done) done(text);
    view_->setFocus();
}

}  // namespace qv
