#pragma once
#include <QString>

namespace qv {

// The main window's look: a dark arcade title strip and frame around a light, readable tree
// (the tree's text colours carry meaning and need a light background).
QString PlayFormStyleSheet();

}  // namespace qv
