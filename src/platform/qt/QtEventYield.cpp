#include "platform/qt/QtEventYield.h"

#include <QCoreApplication>

namespace qv {

void QtEventYield::Yield() {
    if (QCoreApplication::instance()) QCoreApplication::processEvents();
}

}  // namespace qv
