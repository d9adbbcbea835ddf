#include "ui/IconSet.h"

#include <QFile>

namespace qv {

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
