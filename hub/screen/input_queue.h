#pragma once

#include <QObject>

#include <deque>
#include <functional>

namespace kota::hub {

// What the user did, in its order, until the toolkit's own handlers have returned: an input may open a modal
// box or take the widget away from which it came.
class InputQueue : public QObject {
public:
    using Action = std::function<void()>;

    // `afterEach` is called when an action is done.
    explicit InputQueue(std::function<void()> afterEach);

    void add(Action action);

    void customEvent(QEvent* event) override;

    // While one lives, what stood in the queue before waits. For boxes and dialogs, which run an event loop
    // of their own.
    class Level {
    public:
        explicit Level(InputQueue& queue);
        ~Level();
        Level(const Level&) = delete;
        Level& operator=(const Level&) = delete;

    private:
        InputQueue& queue_;
        std::deque<Action> waiting_;
    };

private:
    void schedule();
    void drain();

    std::function<void()> afterEach_;
    std::deque<Action> actions_;
};

} // namespace kota::hub
