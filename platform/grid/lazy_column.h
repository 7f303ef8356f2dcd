#pragma once

#include <algorithm>
#include <cstddef>
#include <iterator>
#include <utility>
#include <vector>

namespace kota::grid {

// A value for each line, of which only those up to the last one written take memory; the others are T{}.
template <class T>
class LazyColumn {
public:
    LazyColumn() = default;
    LazyColumn(LazyColumn&&) noexcept = default;
    LazyColumn& operator=(LazyColumn&&) noexcept = default;

    const T& operator[](std::size_t line) const { return line < lines_.size() ? lines_[line] : unwritten; }

    // The value of a line, to be written. `lines` is how many there are in all.
    T& write(std::size_t line, std::size_t lines) {
        if (line >= lines_.size())
            grow(line + 1, lines);
        return lines_[line];
    }

    // Takes the values of the lines `first` to `last`, with which they go.
    LazyColumn take(std::size_t first, std::size_t last) {
        LazyColumn taken;
        if (first >= lines_.size())
            return taken;
        const auto from = lines_.begin() + static_cast<std::ptrdiff_t>(first);
        const auto end = lines_.begin() + static_cast<std::ptrdiff_t>(std::min(last + 1, lines_.size()));
        taken.lines_.assign(std::make_move_iterator(from), std::make_move_iterator(end));
        lines_.erase(from, end);
        return taken;
    }
    // Gives lines that were never written values, from `line` on.
    void put(std::size_t line, LazyColumn values, std::size_t lines) {
        for (T& value : values.lines_)
            write(line++, lines) = std::move(value);
    }

    void insert(std::size_t line, std::size_t count) {
        if (line >= lines_.size())
            return;
        grow(lines_.size() + count, lines_.size() + count);
        const auto gap = lines_.begin() + static_cast<std::ptrdiff_t>(line);
        std::move_backward(gap, lines_.end() - static_cast<std::ptrdiff_t>(count), lines_.end());
        std::generate_n(gap, count, [] { return T{}; });
    }

private:
    // Room for all lines there are, or for a quarter more than before where lines are appended one by one.
    // Room that is not used yet costs no memory but addresses.
    void grow(std::size_t size, std::size_t lines) {
        if (size > lines_.capacity())
            lines_.reserve(std::max(lines, lines_.capacity() + lines_.capacity() / 4));
        lines_.resize(size);
    }

    static inline const T unwritten{};

    std::vector<T> lines_;
};

} // namespace kota::grid
