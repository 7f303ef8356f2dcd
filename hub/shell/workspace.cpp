#include "hub/shell/workspace.h"

#include <QFileInfo>
#include <QMainWindow>
#include <QSettings>

namespace kota::hub {

namespace {

constexpr const char* projectKey = "workspace/project";
constexpr const char* documentsKey = "workspace/documents";
constexpr const char* geometryKey = "workspace/geometry";
constexpr const char* layoutKey = "workspace/layout";

} // namespace

Workspace Workspace::load() {
    const QSettings stored;
    Workspace workspace{stored.value(projectKey).toString(), stored.value(documentsKey).toStringList(),
                        stored.value(geometryKey).toByteArray(), stored.value(layoutKey).toByteArray()};
    if (!QFileInfo::exists(workspace.project))
        workspace.project.clear();
    workspace.documents.removeIf([](const QString& path) { return !QFileInfo::exists(path); });
    return workspace;
}

void Workspace::save() const {
    QSettings stored;
    stored.setValue(projectKey, project);
    stored.setValue(documentsKey, documents);
    stored.setValue(geometryKey, geometry);
    stored.setValue(layoutKey, layout);
}

void Workspace::take(const QMainWindow& window) {
    geometry = window.saveGeometry();
    layout = window.saveState();
}

bool Workspace::restoreGeometry(QMainWindow& window) const {
    return !geometry.isEmpty() && window.restoreGeometry(geometry);
}

void Workspace::restoreLayout(QMainWindow& window) const {
    if (!layout.isEmpty())
        window.restoreState(layout);
}

} // namespace kota::hub
