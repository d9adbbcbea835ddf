#include "ui/IconSet.h"

#include <QFile>

// The pictures are compiled into the window library, a static library: its resources must be
// registered by name before the first lookup.
static void RegisterQuorvaneResources() { Q_INIT_RESOURCE(quorvane); }

namespace qv {

IconSet::IconSet() {
    static const bool registered = (RegisterQuorvaneResources(), true);
    (void)registered;
}

QString IconSet::ResourcePath(const std::string& key) {
    return QStringLiteral(":/icons/") + QString::fromStdString(key) + QStringLiteral(".png");
}

const QIcon& IconSet::Icon(const std::string& key) {
    if (key.empty()) return none_;
    const QString name = QString::fromStdString(key);
    auto it = cache_.find(name);
    if (it == cache_.end()) {
        const QString path = ResourcePath(key);
        it = cache_.insert(name, QFile::exists(path) ? QIcon(path) : QIcon());
    }
    return *it;
}

}  // namespace qv
