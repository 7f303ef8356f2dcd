#pragma once

#include "platform/foundation/plug_in.h"

#include <QString>
#include <QStringList>

#include <vector>

namespace kota::hub {

// The plug-ins of a folder, loaded in the order of their names.
struct PlugIns {
    std::vector<PlugIn> loaded;
    QStringList problems; // what to tell the user, a line for each library that could not be loaded
};

// Where an installed shell, and one in the build tree, has its plug-ins, beside the program's folder; the
// environment's KOTA_PLUGINS goes before.
QString plugInFolder();
// Language libraries stand in the folder "languages" in it.
PlugIns loadPlugIns(const QString& folder);

} // namespace kota::hub
