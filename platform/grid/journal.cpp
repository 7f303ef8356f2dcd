#include "platform/grid/journal.h"

#include <utility>

namespace kota::grid {

void Journal::note(Change change, CellPlace place, unsigned gesture) {
    if (replaying_) {
        replaying_->changes.push_back(std::move(change));
        return;
    }
    redo_.clear();
    if (undo_.empty() || undo_.back().gesture != gesture) {
        if (undo_.size() == mostSteps)
            undo_.erase(undo_.begin());
        undo_.push_back({.place = place, .gesture = gesture, .changes = {}});
    }
    undo_.back().changes.push_back(std::move(change));
}

void Journal::forget() {
    undo_.clear();
    redo_.clear();
    if (replaying_)
        replaying_->changes.clear();
}

Step Journal::begin(Replay which) {
    Step step = std::move(stepsOf(which).back());
    stepsOf(which).pop_back();
    replaying_ = Step{.place = step.place, .gesture = 0, .changes = {}};
    return step;
}

void Journal::end(Replay which) {
    Step replayed = std::move(*std::exchange(replaying_, std::nullopt));
    if (!replayed.changes.empty())
        stepsOf(which == Replay::Undo ? Replay::Redo : Replay::Undo).push_back(std::move(replayed));
}

} // namespace kota::grid
