#include "platform/kvs/occurrences.h"

#include "platform/kvs/lexicon.h"

namespace kota::kvs {

namespace {
// A family that is asked for more names than this is gone through once for all names, not for each anew.
constexpr int fewNames = 100;
} // namespace

const Occurrences::Elements& Occurrences::of(std::uint32_t family, std::string_view name, const Walk& walk) {
    if (last_ && last_->first.family == family && sameName(last_->first.name, name))
        return last_->second.elements;
    auto& asked = *answers_.try_emplace({family, std::string(name)}).first;
    Answer& answer = asked.second;
    if (!answer.known) {
        const int questions = ++questions_[family];
        if (questions <= fewNames)
            walk([&](std::string_view other, std::uint32_t element) {
                if (sameName(other, name))
                    answer.elements.push_back(element);
            });
        else if (questions == fewNames + 1)
            findAll(family, walk);
        answer.known = true;
    }
    last_ = &asked;
    return answer.elements;
}

void Occurrences::findAll(std::uint32_t family, const Walk& walk) {
    walk([&](std::string_view name, std::uint32_t element) {
        Answer& answer = answers_[{family, std::string(name)}];
        if (!answer.known)
            answer.elements.push_back(element);
    });
}

} // namespace kota::kvs
