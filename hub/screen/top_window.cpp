#include "hub/screen/top_window.h"

#include "hub/screen/parts.h"
#include "hub/screen/text.h"

#include <QVBoxLayout>

namespace kota::hub {

TopWindow::TopWindow(Parts& parts, Part& shown, QWidget* owner)
    : QDialog(owner), parts_(parts), window_(shown.window()) {
    setWindowFlag(Qt::WindowContextHelpButtonHint, false);
    auto* const layout = new QVBoxLayout(this);
    layout->setContentsMargins(0, 0, 0, 0);
    layout->addWidget(shown.widget());
    setWindowTitle(toQt(CWnd::FromHandle(window_)->GetWindowText()));
    QObject::connect(shown.widget(), &QObject::destroyed, this, &QObject::deleteLater);
}

void TopWindow::reject() {
    parts_.queue().add([window = window_] {
        if (CWnd* const closed = CWnd::FromHandle(window))
            input::close(*closed);
    });
}

} // namespace kota::hub
