#pragma once

#include "platform/grid/cell_store.h"

#include <optional>
#include <variant>
#include <vector>

namespace kota::grid {

struct CellPlace {
    ROWCOL row = 0;
    ROWCOL col = 0;

    bool isNone() const { return row == 0 && col == 0; }
    friend bool operator==(const CellPlace&, const CellPlace&) = default;
};

// What takes a change of a grid back.
struct CellWas {
    CellPlace place;
    CellContent content;
};
struct LineStyleWas {
    ROWCOL row;
    StyleId style;
};
struct LinesCame {
    ROWCOL row;
    ROWCOL count;
};
struct LinesWent {
    ROWCOL row;
    TakenLines lines;
};
using Change = std::variant<CellWas, LineStyleWas, LinesCame, LinesWent>;

// All changes of one gesture, in their order.
struct Step {
    CellPlace place; // where it began
    unsigned gesture = 0;
    std::vector<Change> changes;
};

enum class Replay { Undo, Redo };

// What the user did in a grid, gesture by gesture, so that it can be undone and redone.
class Journal {
public:
    bool canReplay(Replay which) const { return !replaying_ && !stepsOf(which).empty(); }
    // Notes a change: of the gesture, or of the replay that runs. Whatever could be redone cannot be any
    // more.
    void note(Change change, CellPlace place, unsigned gesture);
    // Forgets all: the grid was changed in a way that is not noted.
    void forget();

    // Hands out the last step, whose changes are to be taken back from the last to the first. All that is
    // noted until the end of the replay will undo it in its turn.
    Step begin(Replay which);
    void end(Replay which);

private:
    static constexpr std::size_t mostSteps = 200;

    const std::vector<Step>& stepsOf(Replay which) const { return which == Replay::Undo ? undo_ : redo_; }
    std::vector<Step>& stepsOf(Replay which) { return which == Replay::Undo ? undo_ : redo_; }

    std::vector<Step> undo_;
    std::vector<Step> redo_;
    std::optional<Step> replaying_; // what was noted since a replay began
};

} // namespace kota::grid
