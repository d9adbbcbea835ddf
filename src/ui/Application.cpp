#include "ui/Application.h"

#include <QApplication>

namespace qv {

int RunQuorvane(int argc, char** argv) {
    QApplication app(argc, argv);
    return 0;
}

}  // namespace qv
