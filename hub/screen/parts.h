#pragma once

#include "hub/screen/input_queue.h"
#include "hub/screen/keyboard.h"
#include "hub/screen/part.h"
#include "platform/framework/screen.h"

#include <map>

namespace kota::hub {

// The parts of all windows that are on the screen.
class Parts {
public:
    explicit Parts(InputQueue& queue);
    ~Parts();
    Parts(const Parts&) = delete;
    Parts& operator=(const Parts&) = delete;

    InputQueue& queue() { return queue_; }
    Keyboard& keyboard() { return keyboard_; }

    // The part of a window, made with those of the windows inside it when there is none yet. Null for a
    // window that is nothing to see.
    Part* make(HWND window);
    // Null when the window has none.
    Part* find(HWND window) const;
    void change(const WindowChange& change);
    // Gives the toolkit's focus to the widget of the window that has the platform's.
    void settle();

private:
    InputQueue& queue_;
    Keyboard keyboard_;
    std::map<HWND, Part*> parts_; // owned until they retire
    HWND focusBefore_ = nullptr;  // the platform's, when it was settled last
};

} // namespace kota::hub
