#pragma once
#include <QObject>
#include <QPersistentModelIndex>
#include <QLineEdit>
#include <QPointer>
#include <functional>


class QTreeView;

namespace qv {

// In-place editing of a tree node's label: a line edit laid over the node. Enter or leaving
// the field reports the new text once; Escape cancels.
class TreeLabelEditor final : public QObject {
    Q_OBJECT
public:
    using Done = std::function<void(const QString& newText)>;
    explicit TreeLabelEditor(QTreeView* view);

    void Start(const QModelIndex& index, const QString& text, Done done);
    bool Editing() const { return !editor_.isNull(); }
    QLineEdit* Editor() const { return editor_; }

protected:
    bool eventFilter(QObject* watched, QEvent* event) override;

private:
    void Finish(bool accept);

    QTreeView* view_;
    QPointer<QLineEdit> editor_;
    Done done_;
};

}  // namespace qv
