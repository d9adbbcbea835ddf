#pragma once
#include <QHash>
#include <QIcon>
#include <QString>
#include <string>

namespace qv {

// The program's pictures by the image keys the core uses ("fclosed", "fopen", "good", "bad",
// "logo"...), loaded once from the resources. An unknown or empty key gives a null icon.
class IconSet {
public:
    IconSet();
    const QIcon& Icon(const std::string& key);
    static QString ResourcePath(const std::string& key);

private:
    QHash<QString, QIcon> cache_;
    QIcon none_;
};

}  // namespace qv
