#pragma once

#include "hub/shell/hub_frame.h"

#include <QMainWindow>

namespace kota::hub {

// Plays a short session on a copy of a document: opens it, visits every tab, makes a few edits and mistakes,
// saves, closes and opens it again. Leaves a picture of each step and the saved copy in `folder`. Says on the
// standard output what it does, and on the error stream what went wrong. 0: all went as it should.
int takeTour(HubFrame& frame, QMainWindow& window, const QString& document, const QString& folder);

} // namespace kota::hub
