#include "platform/framework/turn.h"

#include "platform/framework/screen.h"
#include "platform/framework/window.h"

#include <algorithm>
#include <utility>
#include <vector>

namespace kota {

namespace {

struct Pending {
    int depth = 0;
    unsigned number = 0;
    std::vector<MSG> posted;
    std::vector<CObject*> doomed;
    std::vector<WindowChange> changes;
};

Pending& pending() {
    static Pending all;
    return all;
}

void deliverPosted() {
    // A message may post another one: the turn goes on until all is quiet, within reason.
    for (int round = 0; round < 100 && !pending().posted.empty(); ++round) {
        const std::vector<MSG> messages = std::exchange(pending().posted, {});
        for (const MSG& message : messages)
            SendMessage(message.hwnd, message.message, message.wParam, message.lParam);
    }
}

void deleteDoomed() {
    while (!pending().doomed.empty()) {
        const std::vector<CObject*> doomed = std::exchange(pending().doomed, {});
        for (CObject* object : doomed)
            delete object;
    }
}

} // namespace

Turn::Turn() {
    if (pending().depth++ == 0)
        ++pending().number;
}

Turn::~Turn() {
    deliverPosted();
    if (pending().depth == 1)
        deleteDoomed();
    tellScreen();
    --pending().depth;
    // What the screen itself changed while it was told, and messages that go on and on, are another turn's.
    if (pending().depth == 0 && attachedScreen() && !(pending().changes.empty() && pending().posted.empty()))
        attachedScreen()->changesPending();
}

unsigned turnNumber() {
    return pending().number;
}

void deleteLater(CObject* object) {
    auto& doomed = pending().doomed;
    if (object && std::ranges::find(doomed, object) == doomed.end())
        doomed.push_back(object);
    if (pending().depth == 0 && attachedScreen())
        attachedScreen()->changesPending();
}

void keep(const CObject* object) {
    std::erase(pending().doomed, object);
}

void postMessage(const MSG& message) {
    pending().posted.push_back(message);
    if (pending().depth == 0 && attachedScreen())
        attachedScreen()->changesPending();
}

void noteChange(HWND window, Change change) {
    if (!attachedScreen())
        return;
    auto& changes = pending().changes;
    const bool first = changes.empty();
    const unsigned bits = static_cast<unsigned>(change);
    const auto noted = std::ranges::find(changes, window, &WindowChange::window);
    if (noted != changes.end())
        noted->changes |= bits;
    else
        changes.push_back({window, bits});
    if (first && pending().depth == 0)
        attachedScreen()->changesPending();
}

void tellScreen() {
    const std::vector<WindowChange> changes = std::exchange(pending().changes, {});
    if (!changes.empty() && attachedScreen())
        attachedScreen()->windowsChanged(changes);
}

} // namespace kota
