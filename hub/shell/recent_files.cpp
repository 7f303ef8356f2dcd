#include "hub/shell/recent_files.h"

#include <QFileInfo>
#include <QSettings>

namespace kota::hub {

namespace {

constexpr const char* settingsKey = "recentFiles";

} // namespace

RecentFiles::RecentFiles() : paths_(QSettings().value(settingsKey).toStringList()) {}

void RecentFiles::add(const QString& path) {
    const QString absolute = QFileInfo(path).absoluteFilePath();
    paths_.removeAll(absolute);
    paths_.prepend(absolute);
    paths_ = paths_.mid(0, most);
    save();
}

void RecentFiles::remove(const QString& path) {
    paths_.removeAll(path);
    save();
}

void RecentFiles::save() const {
    QSettings().setValue(settingsKey, paths_);
}

} // namespace kota::hub
