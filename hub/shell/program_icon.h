#pragma once

#include <QIcon>

namespace kota::hub {

// The program's own picture: a river, in all usual sizes.
QIcon programIcon();

} // namespace kota::hub
