// The random user: plays scripts of random actions on the editor, and shrinks the first one that shows a
// fault to a short script, which it leaves in a file.
//
//   random_user [--seed N] [--scripts N] [--steps N]   plays scripts
//   random_user --play FILE                            plays the script in a file
//   random_user --print N [--seed N] [--steps N]       prints the N-th script of a run
//
// What is not given is taken from the environment: KOTA_RANDOM_SEED, KOTA_RANDOM_SCRIPTS, KOTA_RANDOM_STEPS.
// With KOTA_RANDOM_HUNT there are many more scripts, from another seed each time.
#include "tests/random/generator.h"
#include "tests/random/hunt.h"

#include <cstdlib>
#include <filesystem>
#include <iostream>
#include <random>

using namespace kota::random_user;

namespace {

struct Task {
    std::string program;
    std::uint64_t seed = 20240311;
    std::uint64_t scripts = KOTA_RANDOM_SCRIPTS;
    int steps = 30;
    std::optional<std::string> file;
    std::optional<std::uint64_t> printed;
};

Task readTask(int count, char** arguments) {
    Task task{.program = arguments[0], .file = {}, .printed = {}};
    if (std::getenv("KOTA_RANDOM_HUNT")) {
        task.seed = std::random_device()();
        task.scripts = 20000;
    }
    if (const char* const seed = std::getenv("KOTA_RANDOM_SEED"))
        task.seed = std::stoull(seed);
    if (const char* const scripts = std::getenv("KOTA_RANDOM_SCRIPTS"))
        task.scripts = std::stoull(scripts);
    if (const char* const steps = std::getenv("KOTA_RANDOM_STEPS"))
        task.steps = std::stoi(steps);
    for (int i = 1; i + 1 < count; i += 2) {
        const std::string option = arguments[i];
        const std::string value = arguments[i + 1];
        if (option == "--seed")
            task.seed = std::stoull(value);
        else if (option == "--scripts")
            task.scripts = std::stoull(value);
        else if (option == "--steps")
            task.steps = std::stoi(value);
        else if (option == "--play")
            task.file = value;
        else if (option == "--print")
            task.printed = std::stoull(value);
        else
            throw std::invalid_argument("no such option: " + option);
    }
    if (count % 2 == 0)
        throw std::invalid_argument("an option has no value");
    return task;
}

Game gameOf(const Task& task, const Surroundings& surroundings) {
    return {
        .make = [&](std::uint64_t n) { return makeScript(seedOf(task.seed, n), task.steps, surroundings); },
        .play = [&](const Script& script, Counts& taken) { return playScript(script, surroundings, taken); }};
}

int playFile(const Game& game, const std::string& path) {
    const auto broken = playApart(game, parseScript(kota::test::readFile(path)));
    std::cout << broken.value_or("all is well") << '\n';
    return broken ? 1 : 0;
}

int tellFault(const Found& found, const Task& task) {
    const std::string name = std::to_string(task.seed) + '.' + std::to_string(found.number) + ".script";
    const std::string path = std::filesystem::absolute("random_user." + name).string();
    kota::test::writeFile(path, print(found.script));
    std::cout << found.words << "\n\nThe shortest script that shows it:\n\n"
              << print(found.script) << "\nTo play it again: " << task.program << " --play " << path << '\n';
    return 1;
}

// An action that is never taken looks for nothing. A few scripts need not have them all.
int tellCounts(const Counts& taken, std::uint64_t played, const Surroundings& surroundings) {
    bool isComplete = true;
    for (std::size_t i = 0; i < taken.size(); ++i) {
        const Verb verb = static_cast<Verb>(i);
        std::cout << formOf(verb).name << ' ' << taken[i] << (i + 1 < taken.size() ? ", " : "\n");
        isComplete = isComplete && (taken[i] > 0 || !surroundings.mayBeTaken(verb));
    }
    constexpr std::uint64_t few = 200;
    if (isComplete || played < few)
        return 0;
    std::cout << "some actions were never taken\n";
    return 1;
}

int run(const Task& task) {
    const kota::test::TempFolder folder; // what a process leaves that crashes
    setenv("TMPDIR", folder.path().c_str(), 1);
    const Surroundings surroundings = lookAround();
    const Game game = gameOf(task, surroundings);
    if (task.file)
        return playFile(game, *task.file);
    if (task.printed) {
        std::cout << print(game.make(*task.printed));
        return 0;
    }
    std::cout << task.scripts << " scripts of " << task.steps << " actions, seed " << task.seed << std::endl;
    const HuntResult result = hunt(game, task.scripts, std::cout);
    return result.found ? tellFault(*result.found, task)
                        : tellCounts(result.taken, result.played, surroundings);
}

} // namespace

int main(int count, char** arguments) {
    try {
        return run(readTask(count, arguments));
    } catch (const std::exception& failure) {
        std::cerr << "random_user: " << failure.what() << '\n';
        return 2;
    }
}
