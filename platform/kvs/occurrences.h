#pragma once

#include <cstddef>
#include <cstdint>
#include <functional>
#include <string>
#include <string_view>
#include <unordered_map>
#include <vector>

namespace kota::kvs {

// Where the elements of a name stand among their siblings, found at the first question and remembered, so
// that the n-th costs the same for every n. Nothing is indexed that nobody asks for.
class Occurrences {
public:
    using Elements = std::vector<std::uint32_t>;
    // Calls its argument with each element of the family asked about, and its name, in file order.
    using Visitor = std::function<void(std::string_view name, std::uint32_t element)>;
    using Walk = std::function<void(const Visitor&)>;

    // The elements of `name` in a family of siblings, in file order. `walk` goes through the family.
    const Elements& of(std::uint32_t family, std::string_view name, const Walk& walk);

private:
    struct Query {
        std::uint32_t family;
        std::string name;
        bool operator==(const Query&) const = default;
    };
    struct QueryHash {
        std::size_t operator()(const Query& query) const {
            return std::hash<std::string>()(query.name) ^ query.family * 0x9E3779B97F4A7C15u;
        }
    };
    struct Answer {
        Elements elements;
        bool known = false;
    };
    using Answers = std::unordered_map<Query, Answer, QueryHash>;

    void findAll(std::uint32_t family, const Walk& walk);

    Answers answers_;
    const Answers::value_type* last_ = nullptr;        // the next question is mostly the same
    std::unordered_map<std::uint32_t, int> questions_; // by family: how many names were asked for
};

} // namespace kota::kvs
