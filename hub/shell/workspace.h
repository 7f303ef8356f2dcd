#pragma once

#include <QByteArray>
#include <QStringList>

class QMainWindow;

namespace kota::hub {

// What the user had open when the program ended, to go on with it at the next start.
struct Workspace {
    QString project;       // empty for none
    QStringList documents; // the one in front last
    QByteArray geometry;   // of the main window
    QByteArray layout;     // of its tool bars and panels

    // From the user's settings, without the files that are there no more, and into them.
    static Workspace load();
    void save() const;
    // The main window's size and panels.
    void take(const QMainWindow& window);
    // False where nothing is known of it.
    bool restoreGeometry(QMainWindow& window) const;
    // Once all tool bars and panels are there.
    void restoreLayout(QMainWindow& window) const;
};

} // namespace kota::hub
