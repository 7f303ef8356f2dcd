#pragma once

#include <functional>
#include <string>

namespace kota::random_user {

// How a function ended that ran in a process of its own.
struct Ending {
    enum class Kind {
        Done,    // it returned, and lost no memory
        Broken,  // it returned with words
        Crashed, // the process ended: by a signal, a sanitizer, an exit
        Leaked,  // it returned, and memory was lost
    };

    Kind kind = Kind::Done;
    std::string words;  // Broken: the function's; Crashed and Leaked: the end of what the process said
    std::string report; // what the function reported until then
};

using Report = std::function<void(const std::string& line)>;

// Runs a function in a process of its own, which has all that this one has. Its result is empty when all went
// well. Memory is looked after where the build has a leak sanitizer.
Ending runApart(const std::function<std::string(const Report& report)>& function);

} // namespace kota::random_user
