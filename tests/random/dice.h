#pragma once

#include <cstdint>
#include <span>
#include <string>
#include <vector>

namespace kota::random_user {

// Draws from a seed, the same on every machine.
class Dice {
public:
    explicit Dice(std::uint64_t seed) : state_(seed) {}

    std::uint64_t next() {
        // The steps of a sequence with a well mixed output.
        state_ += 0x9E3779B97F4A7C15U;
        std::uint64_t mixed = state_;
        mixed = (mixed ^ (mixed >> 30U)) * 0xBF58476D1CE4E5B9U;
        mixed = (mixed ^ (mixed >> 27U)) * 0x94D049BB133111EBU;
        return mixed ^ (mixed >> 31U);
    }

    // From 0 to below `count`, which is not 0.
    std::size_t below(std::size_t count) { return static_cast<std::size_t>(next() % count); }
    int between(int first, int last) {
        return first + static_cast<int>(below(static_cast<std::size_t>(last - first) + 1));
    }
    // True once in so many times.
    bool onceIn(std::size_t times) { return below(times) == 0; }

    template <class Range>
    const auto& one(const Range& range) {
        return range[below(std::size(range))];
    }

private:
    std::uint64_t state_;
};

// What is typed, pasted, offered: good and bad.
std::string anyText(Dice& dice);
std::string anyTable(Dice& dice);
std::string anyRiver(Dice& dice);

} // namespace kota::random_user
