#include "tests/save/saving_fixture.h"

#include <chrono>
#include <random>
#include <sys/wait.h>
#include <unistd.h>

namespace kota::test {
namespace {

using Clock = std::chrono::steady_clock;

class KilledSave : public Saving {
protected:
    static constexpr int lines = 3000;

    // What a save of one of the two documents writes.
    std::string contentOf(double decayConst) {
        fillDecay(lines, decayConst);
        save("content.AD31");
        return folder.read("content.AD31");
    }

    // Saves the two documents by turns, in another process, until that is killed after `life`.
    void saveUntilKilled(Clock::duration life) {
        const pid_t child = fork();
        if (child == 0) {
            for (;;) {
                fillDecay(lines, 0.25);
                save("river.AD31");
                fillDecay(lines, 0.5);
                save("river.AD31");
            }
        }
        ASSERT_GT(child, 0);
        // Not a sleep: those end on the ticks of a clock, always at the same moments of a save.
        for (const auto end = Clock::now() + life; Clock::now() < end;) {
        }
        kill(child, SIGKILL);
        waitpid(child, nullptr, 0);
    }

    std::string readOrNothing(const std::string& name) { return folder.has(name) ? folder.read(name) : ""; }
};

TEST_F(KilledSave, LeavesTheOldOrTheNewContentInTheFileOrInTheKeptVersion) {
    const std::string one = contentOf(0.25);
    const std::string other = contentOf(0.5);
    ASSERT_NE(one, other);
    fillDecay(lines, 0.5);
    ASSERT_EQ(save("river.AD31"), 1);
    const auto isWhole = [&](const std::string& content) { return content == one || content == other; };
    std::mt19937 random(227);
    std::uniform_int_distribution<int> microseconds(0, 20'000);

    int interrupted = 0;
    for (int round = 0; round < 200; ++round) {
        saveUntilKilled(std::chrono::microseconds(microseconds(random)));
        const std::string file = readOrNothing("river.AD31");
        const std::string kept = readOrNothing("river.AD31~");
        ASSERT_TRUE(isWhole(file) || isWhole(kept))
            << "after round " << round << ": " << file.size() << " and " << kept.size() << " bytes";
        if (!isWhole(file) || !isWhole(kept))
            ++interrupted;
    }
    RecordProperty("interrupted", interrupted);
    EXPECT_GT(interrupted, 0) << "no round hit a save in its middle";
}

} // namespace
} // namespace kota::test
