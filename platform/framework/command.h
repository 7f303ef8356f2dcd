#pragma once

#include "platform/framework/object.h"
#include "platform/framework/types.h"

#include <array>
#include <cstddef>

// The root of all that takes commands.
class KOTA_API CCmdTarget : public CObject {
    DECLARE_DYNAMIC(CCmdTarget)
public:
    CCmdTarget();
    ~CCmdTarget() override;

    // Runs the handler of a command or of a control's notification; with CN_UPDATE_COMMAND_UI only tells
    // whether a command has one. 1: there was one. The base has none.
    virtual BOOL OnCmdMsg(UINT id, int notification);
};

// In place of a notification: is there a handler of the command at present?
inline constexpr int CN_UPDATE_COMMAND_UI = -1;

namespace kota {

// One row of a class's command map: what runs on the command `id`, or on the notification of the control
// `id`.
template <class Target>
struct CommandRow {
    UINT id;
    int notification;
    void (Target::*handler)();
};

// A class's command map, checked when it is compiled: no id and notification may stand in it twice.
template <class Target, std::size_t rows>
consteval std::array<CommandRow<Target>, rows> commandMap(const CommandRow<Target> (&map)[rows]) {
    std::array<CommandRow<Target>, rows> result{};
    for (std::size_t i = 0; i < rows; ++i) {
        for (std::size_t j = 0; j < i; ++j)
            if (map[j].id == map[i].id && map[j].notification == map[i].notification)
                throw "a command stands twice in the map";
        result[i] = map[i];
    }
    return result;
}

// Runs the handler of the map, unless it is only asked for; false when it has none.
template <class Target, std::size_t rows>
bool runCommand(Target& target, const std::array<CommandRow<Target>, rows>& map, UINT id, int notification) {
    const bool asked = notification == CN_UPDATE_COMMAND_UI;
    for (const CommandRow<Target>& row : map)
        if (row.id == id && row.notification == (asked ? 0 : notification)) {
            if (!asked)
                (target.*row.handler)();
            return true;
        }
    return false;
}

} // namespace kota
