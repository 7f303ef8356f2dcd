#pragma once

#include "platform/framework/types.h"

#include <QDockWidget>

#include <functional>

namespace kota::hub {

// A panel of the shell beside the documents, which the main window's menu shows and hides by a command. Keys
// that its widgets leave go no further, so that nothing happens in a document behind the user's back, but for
// Ctrl+N, O, S and Q and F6; Escape and Ctrl+Tab leave the panel.
class Dock : public QDockWidget {
public:
    Dock(UINT command, const QString& title);

    // The command of a panel; 0 for one that is none of these.
    static UINT commandOf(const QDockWidget& panel);

    // The user goes back to the document.
    std::function<void()> onLeave;

protected:
    // Puts the content in, which belongs to the panel from now on, and of which `first` takes the focus.
    void fill(QWidget& content, QWidget& first);
    void keyPressEvent(QKeyEvent* event) override;
};

} // namespace kota::hub
