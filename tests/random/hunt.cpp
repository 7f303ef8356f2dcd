#include "tests/random/hunt.h"

#include "tests/random/shrinker.h"

#include <algorithm>
#include <ostream>
#include <sstream>

namespace kota::random_user {

namespace {

// So many scripts share a process: starting one and looking for lost memory takes as long as some scripts.
constexpr std::uint64_t blockLength = 50;

std::string playBlock(const Game& game, std::uint64_t first, std::uint64_t end, const Report& report) {
    Counts taken = {};
    for (std::uint64_t n = first; n < end; ++n) {
        report("at " + std::to_string(n));
        if (const auto broken = game.play(game.make(n), taken))
            return *broken;
    }
    std::string counts = "taken";
    for (const int count : taken)
        counts += ' ' + std::to_string(count);
    report(counts);
    return {};
}

// The number of the script that was played last, as a block reported it.
std::uint64_t lastOf(const std::string& report) {
    std::istringstream lines(report);
    std::uint64_t last = 0;
    for (std::string line; std::getline(lines, line);)
        if (line.starts_with("at "))
            last = std::stoull(line.substr(3));
    return last;
}

void addCounts(const std::string& report, Counts& taken) {
    const std::size_t start = report.find("taken ");
    std::istringstream counts(start == std::string::npos ? std::string() : report.substr(start + 6));
    for (int& count : taken)
        if (int more = 0; counts >> more)
            count += more;
}

Ending play(const Game& game, const Script& script) {
    return runApart([&](const Report&) {
        Counts ignored = {};
        return game.play(script, ignored).value_or(std::string());
    });
}

// The script of a block at which it ended. Lost memory is seen at the end of the block alone.
std::optional<std::uint64_t> culpritOf(const Game& game, const Ending& ending, std::uint64_t first,
                                       std::uint64_t end) {
    if (ending.kind != Ending::Kind::Leaked)
        return lastOf(ending.report);
    for (std::uint64_t n = first; n < end; ++n)
        if (play(game, game.make(n)).kind == Ending::Kind::Leaked)
            return n;
    return std::nullopt;
}

Found shrunkFault(const Game& game, std::uint64_t number, std::ostream& log) {
    Found found{.number = number, .script = game.make(number), .words = {}};
    const Ending first = play(game, found.script);
    found.words = first.words;
    if (first.kind == Ending::Kind::Done) {
        log << "script " << number << " alone shows no fault\n";
        found.words = "a fault that one script alone does not show";
        return found;
    }
    log << "script " << number << " of " << found.script.size() << " actions: " << kindOf(first)
        << "; shrinking" << std::endl;
    const std::string kind = kindOf(first);
    found.script = shrunk(found.script, [&](const Script& script) {
        const Ending ending = play(game, script);
        const bool fails = ending.kind != Ending::Kind::Done && kindOf(ending) == kind;
        if (fails)
            found.words = ending.words;
        return fails;
    });
    return found;
}

} // namespace

std::string kindOf(const Ending& ending) {
    if (ending.kind == Ending::Kind::Done)
        return "no fault";
    if (ending.kind == Ending::Kind::Leaked)
        return "lost memory";
    if (ending.kind == Ending::Kind::Broken)
        return ending.words.substr(0, ending.words.find(':'));
    constexpr std::string_view summary = "SUMMARY: ";
    const std::size_t start = ending.words.find(summary);
    if (start == std::string::npos)
        return "crash";
    // "AddressSanitizer: heap-use-after-free path:line in function"
    std::istringstream words(ending.words.substr(start + summary.size()));
    std::string tool;
    std::string kind;
    words >> tool >> kind;
    return tool + ' ' + kind;
}

HuntResult hunt(const Game& game, std::uint64_t count, std::ostream& log) {
    HuntResult result;
    for (std::uint64_t first = 0; first < count; first += blockLength) {
        const std::uint64_t end = std::min(first + blockLength, count);
        const Ending ending =
            runApart([&](const Report& report) { return playBlock(game, first, end, report); });
        addCounts(ending.report, result.taken);
        if (ending.kind != Ending::Kind::Done) {
            log << kindOf(ending) << " in the scripts " << first << " to " << end - 1 << std::endl;
            const auto culprit = culpritOf(game, ending, first, end);
            result.found = culprit ? shrunkFault(game, *culprit, log)
                                   : Found{.number = first, .script = {}, .words = ending.words};
            return result;
        }
        result.played = end;
        if (end % 1000 == 0)
            log << end << " scripts" << std::endl;
    }
    return result;
}

std::optional<std::string> playApart(const Game& game, const Script& script) {
    const Ending ending = play(game, script);
    if (ending.kind == Ending::Kind::Done)
        return std::nullopt;
    return kindOf(ending) + "\n" + ending.words;
}

} // namespace kota::random_user
