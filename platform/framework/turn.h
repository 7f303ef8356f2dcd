#pragma once

#include "platform/framework/object.h"
#include "platform/framework/window_state.h"

struct MSG;

namespace kota {

// One turn of the user interface: an input of the user with all that follows from it. Every input operation
// is one, and a screen makes one of whatever else calls into the platform. When the turn ends, posted
// messages are delivered and the screen is told what changed; when the outermost one ends, the objects put
// off by deleteLater are deleted.
class KOTA_API Turn {
public:
    Turn();
    ~Turn();
    Turn(const Turn&) = delete;
    Turn& operator=(const Turn&) = delete;
};

// How many outermost turns there have been, the one that runs now among them.
KOTA_API unsigned turnNumber();

// Deletes an object when nothing of it can be running any more: at the end of the outermost turn.
KOTA_API void deleteLater(CObject* object);
// Takes that back: somebody uses the object again before the turn ends.
KOTA_API void keep(const CObject* object);

// Puts a message off to the end of the turn.
KOTA_API void postMessage(const MSG& message);

// Notes for the screen that something of a window changed.
KOTA_API void noteChange(HWND window, Change change);
// Tells the screen what changed so far; a modal box does it before it opens.
KOTA_API void tellScreen();

} // namespace kota
