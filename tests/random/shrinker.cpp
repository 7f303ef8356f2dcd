#include "tests/random/shrinker.h"

#include <algorithm>

namespace kota::random_user {

namespace {

// The numbers nearer to 1 than this one, the nearest first.
std::vector<int> simplerNumbers(int number) {
    std::vector<int> simpler;
    for (const int candidate : {1, number / 2, number - 1})
        if (candidate >= 1 && candidate < number && std::ranges::find(simpler, candidate) == simpler.end())
            simpler.push_back(candidate);
    if (number < 1)
        simpler.push_back(1);
    return simpler;
}

// Never cuts a character of several bytes in two: a script stays readable.
std::size_t characterBefore(const std::string& text, std::size_t place) {
    while (place > 0 && place < text.size() && (static_cast<unsigned char>(text[place]) & 0xC0U) == 0x80U)
        --place;
    return place;
}

std::vector<std::string> simplerTexts(const std::string& text) {
    std::vector<std::string> simpler;
    const auto add = [&](std::string candidate) {
        const bool isKnown = std::ranges::find(simpler, candidate) != simpler.end();
        const bool isSmaller = candidate.size() < text.size() || (candidate == "1" && text.size() == 1);
        if (candidate != text && isSmaller && !isKnown)
            simpler.push_back(std::move(candidate));
    };
    const std::size_t middle = characterBefore(text, text.size() / 2);
    add("");
    add("1");
    add(text.substr(0, middle));
    add(text.substr(middle));
    add(text.substr(0, characterBefore(text, text.size() - std::min<std::size_t>(text.size(), 1))));
    add(text.substr(characterBefore(text, std::min<std::size_t>(text.size(), 1))));
    return simpler;
}

class Shrinker {
public:
    Shrinker(Script script, const Fails& fails, int mostTries)
        : script_(std::move(script)), fails_(fails), triesLeft_(mostTries) {}

    Script run() {
        for (bool isShorter = true; isShorter;) {
            const bool dropped = dropChunks();
            isShorter = simplifyActions() || dropped;
        }
        return std::move(script_);
    }

private:
    // Takes the script if it fails too.
    bool take(Script candidate) {
        if (triesLeft_ == 0)
            return false;
        --triesLeft_;
        if (!fails_(candidate))
            return false;
        script_ = std::move(candidate);
        return true;
    }

    bool dropChunks() {
        bool dropped = false;
        for (std::size_t length = std::max<std::size_t>(script_.size() / 2, 1); length > 0; length /= 2)
            for (std::size_t start = 0; start < script_.size();) {
                Script candidate = script_;
                const auto first = candidate.begin() + static_cast<std::ptrdiff_t>(start);
                const std::size_t count = std::min(length, script_.size() - start);
                candidate.erase(first, first + static_cast<std::ptrdiff_t>(count));
                if (take(std::move(candidate)))
                    dropped = true;
                else
                    start += length;
            }
        return dropped;
    }

    bool simplifyActions() {
        bool simplified = false;
        for (std::size_t place = 0; place < script_.size(); ++place)
            while (simplifyOnce(place))
                simplified = true;
        return simplified;
    }

    bool simplifyOnce(std::size_t place) {
        const std::vector<Action> candidates = simplerThan(script_[place]);
        return std::ranges::any_of(candidates, [&](const Action& action) {
            Script candidate = script_;
            candidate[place] = action;
            return take(std::move(candidate));
        });
    }

    Script script_;
    const Fails& fails_;
    int triesLeft_;
};

} // namespace

std::vector<Action> simplerThan(const Action& action) {
    std::vector<Action> simpler;
    if (!action.inner.empty()) {
        simpler.push_back(action.inner.front());
        for (Action& inner : simplerThan(action.inner.front())) {
            simpler.push_back(action);
            simpler.back().inner.front() = std::move(inner);
        }
    }
    for (std::size_t i = 0; i < action.numbers.size(); ++i)
        for (const int number : simplerNumbers(action.numbers[i])) {
            simpler.push_back(action);
            simpler.back().numbers[i] = number;
        }
    std::size_t text = 0;
    for (const char argument : formOf(action.verb).arguments) {
        if (argument != 't' && argument != 'w')
            continue;
        if (argument == 't')
            for (std::string& candidate : simplerTexts(action.texts[text])) {
                simpler.push_back(action);
                simpler.back().texts[text] = std::move(candidate);
            }
        ++text;
    }
    if (action.verb == Verb::Edit) // the click may be all that counts
        simpler.push_back({.verb = Verb::Cell, .numbers = action.numbers});
    return simpler;
}

Script shrunk(Script script, const Fails& fails, int mostTries) {
    return Shrinker(std::move(script), fails, mostTries).run();
}

} // namespace kota::random_user
