#include "ui/PlayFormStyle.h"

namespace qv {

QString PlayFormStyleSheet() {
    return QStringLiteral(R"(
#PlayFormBody { background: #14172b; }
#TitleArea { background: qlineargradient(x1:0, y1:0, x2:0, y2:1, stop:0 #262b52, stop:1 #14172b);
             border-bottom: 2px solid #f5c400; }
#Image1 { color: #f5c400; font-size: 26px; font-weight: bold; letter-spacing: 6px; }
#TreeView1, #File1 { background: #ffffff; color: #000000; border: 1px solid #3a3f66;
                     selection-background-color: #ffe680; selection-color: #000000; }
#Text1 { background: #ffffff; color: #000000; border: 1px solid #3a3f66; padding: 3px; }
#Text1:disabled { background: #d8d9e3; color: #6b6e80; }
#Label15 { color: #f5c400; font-weight: bold; padding: 4px; }
#DetailsHost { background: #1d2140; border: 1px solid #3a3f66; border-radius: 6px; }
QMenuBar { background: #262b52; color: #ffffff; }
QMenuBar::item:selected { background: #3a3f66; }
QMenu { background: #f4f4f8; color: #000000; }
QMenu::item:disabled { color: #9a9aa6; }
QMenu::item:selected { background: #ffe680; }
)");
}

}  // namespace qv
