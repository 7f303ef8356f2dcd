#include "hub/shell/plug_ins.h"

#include "hub/shell/menu.h"
#include "platform/language/language.h"

#include <QCoreApplication>
#include <QDir>

#include <stdexcept>

namespace kota::hub {

QString plugInFolder() {
    const QString wanted = qEnvironmentVariable("KOTA_PLUGINS");
    return wanted.isEmpty() ? QDir::cleanPath(QCoreApplication::applicationDirPath() + "/../lib/kota/plugins")
                            : wanted;
}

PlugIns loadPlugIns(const QString& folder) {
    addLanguageFolder(QFile::encodeName(QDir(folder).filePath("languages")).constData());
    PlugIns plugIns;
    for (const QFileInfo& file : QDir(folder).entryInfoList({"lib*.so"}, QDir::Files, QDir::Name)) {
        try {
            plugIns.loaded.emplace_back(QFile::encodeName(file.absoluteFilePath()).toStdString());
        } catch (const std::runtime_error& error) {
            plugIns.problems.append(
                hubText(HubText::NotLoaded).arg(file.fileName(), QString::fromUtf8(error.what())));
        }
    }
    if (plugIns.loaded.empty() && plugIns.problems.empty())
        plugIns.problems.append(hubText(HubText::NoEditorIn).arg(folder));
    return plugIns;
}

} // namespace kota::hub
