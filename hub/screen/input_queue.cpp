#include "hub/screen/input_queue.h"

#include <QCoreApplication>
#include <QEvent>

#include <iterator>
#include <utility>

namespace kota::hub {

InputQueue::InputQueue(std::function<void()> afterEach) : afterEach_(std::move(afterEach)) {}

void InputQueue::add(Action action) {
    actions_.push_back(std::move(action));
    schedule();
}

void InputQueue::schedule() {
    QCoreApplication::postEvent(this, new QEvent(QEvent::User));
}

void InputQueue::customEvent(QEvent* /*event*/) {
    drain();
}

void InputQueue::drain() {
    while (!actions_.empty()) {
        const Action action = std::move(actions_.front());
        actions_.pop_front();
        action();
        afterEach_();
    }
}

InputQueue::Level::Level(InputQueue& queue) : queue_(queue) {
    waiting_.swap(queue_.actions_);
}

InputQueue::Level::~Level() {
    waiting_.swap(queue_.actions_);
    queue_.actions_.insert(queue_.actions_.end(), std::make_move_iterator(waiting_.begin()),
                           std::make_move_iterator(waiting_.end()));
    if (!queue_.actions_.empty())
        queue_.schedule();
}

} // namespace kota::hub
