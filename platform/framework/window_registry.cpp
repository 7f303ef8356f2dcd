#include "platform/framework/window_registry.h"

#include "platform/framework/turn.h"

#include <algorithm>
#include <unordered_map>

namespace kota {

namespace {

struct Entry {
    WindowState state;
    std::unique_ptr<CWnd> owned; // of a control that no object has taken over
};

struct Registry {
    std::unordered_map<HWND, Entry> alive;
    std::uintptr_t lastHandle = 0;
};

Registry& registry() {
    static Registry all;
    return all;
}

} // namespace

HWND registerWindow(const WindowSetup& setup, CWnd* object) {
    Registry& all = registry();
    const HWND handle = reinterpret_cast<HWND>(++all.lastHandle);
    WindowState& state = all.alive[handle].state;
    state.object = object;
    state.setup = setup;
    if (WindowState* parent = windowState(setup.parent))
        parent->children.push_back(handle);
    else
        state.setup.parent = nullptr;
    noteChange(handle, Change::Made);
    return handle;
}

void unregisterWindow(HWND handle) {
    Registry& all = registry();
    const auto found = all.alive.find(handle);
    if (found == all.alive.end())
        return;
    if (WindowState* parent = windowState(found->second.state.setup.parent))
        std::erase(parent->children, handle);
    if (found->second.owned)
        deleteLater(found->second.owned.release());
    all.alive.erase(found);
    noteChange(handle, Change::Gone);
}

WindowState* windowState(HWND handle) {
    const auto found = registry().alive.find(handle);
    return found == registry().alive.end() ? nullptr : &found->second.state;
}

CWnd* adoptWindow(HWND handle, std::unique_ptr<CWnd> object) {
    Entry& entry = registry().alive.at(handle);
    entry.owned = std::move(object);
    entry.state.object = entry.owned.get();
    return entry.state.object;
}

bool hasPlainObject(HWND handle) {
    const auto found = registry().alive.find(handle);
    return found != registry().alive.end() && found->second.owned != nullptr;
}

void releaseWindow(HWND handle, CWnd* object) {
    Entry& entry = registry().alive.at(handle);
    entry.state.object = object;
    if (entry.owned) {
        entry.owned->Detach();
        deleteLater(entry.owned.release());
    }
}

HWND createTabs(HWND sheet, UINT id, std::vector<CString> captions) {
    const HWND tabs = registerWindow({.parent = sheet, .id = id, .kind = WindowKind::Tabs}, nullptr);
    windowState(tabs)->choices = std::move(captions);
    return tabs;
}

HWND dialogAround(HWND control) {
    const WindowState* state = windowState(control);
    while (state) {
        const HWND around = state->setup.parent;
        state = windowState(around);
        if (state && state->setup.kind != WindowKind::Group && state->setup.kind != WindowKind::Row)
            return around;
    }
    return nullptr;
}

} // namespace kota
