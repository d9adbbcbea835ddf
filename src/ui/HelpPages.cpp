#include "ui/HelpPages.h"

#include <QFile>

#include "app/TextFile.h"

namespace qv {

int EnsureHelpPages(const std::filesystem::path& appFolder) {
    const auto folder = appFolder / "help";
    int written = 0;
    for (const char* name : {"quorvane.html", "mame.html"}) {
        const auto target = folder / name;
        if (FileExists(target)) continue;
        QFile page(QStringLiteral(":/help/") + QLatin1String(name));
        if (!page.open(QIODevice::ReadOnly)) continue;
        const QByteArray bytes = page.readAll();
        std::error_code ignored;
        std::filesystem::create_directories(folder, ignored);
        if (WriteFileAtomically(target, std::string_view(bytes.constData(), bytes.size()))
                .empty())
            ++written;
    }
    return written;
}

}  // namespace qv
