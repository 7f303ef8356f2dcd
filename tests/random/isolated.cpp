#include "tests/random/isolated.h"

#include <sys/wait.h>
#include <unistd.h>

#include <cstdio>
#include <cstdlib>
#include <memory>
#include <stdexcept>

// There in a build with the leak sanitizer alone. Ends the process when memory was lost.
extern "C" __attribute__((weak)) void __lsan_do_leak_check(void);

namespace kota::random_user {

namespace {

constexpr int brokenExit = 81;
// A function that takes longer than this will not end.
constexpr unsigned mostSeconds = 300;

using File = std::unique_ptr<std::FILE, int (*)(std::FILE*)>;

File temporaryFile() {
    File file(std::tmpfile(), std::fclose);
    if (!file)
        throw std::runtime_error("no temporary file can be made");
    return file;
}

// All of a file, or its last part.
std::string contentOf(std::FILE* file, long most) {
    std::fseek(file, 0, SEEK_END);
    const long size = std::ftell(file);
    const long start = size > most ? size - most : 0;
    std::fseek(file, start, SEEK_SET);
    std::string content(static_cast<std::size_t>(size - start), '\0');
    content.resize(std::fread(content.data(), 1, content.size(), file));
    return content;
}

void write(std::FILE* file, const std::string& text) {
    std::fwrite(text.data(), 1, text.size(), file);
    std::fflush(file);
}

[[noreturn]] void runChild(const std::function<std::string(const Report&)>& function, std::FILE* report,
                           std::FILE* words, std::FILE* said) {
    dup2(fileno(said), STDERR_FILENO);
    dup2(fileno(said), STDOUT_FILENO);
    alarm(mostSeconds);
    const std::string result = function([&](const std::string& line) { write(report, line + '\n'); });
    write(words, result);
    if (!result.empty())
        _exit(brokenExit);
    write(words, "done");
    if (__lsan_do_leak_check)
        __lsan_do_leak_check();
    _exit(0);
}

} // namespace

Ending runApart(const std::function<std::string(const Report&)>& function) {
    constexpr long mostSaid = 20000;
    const File report = temporaryFile();
    const File words = temporaryFile();
    const File said = temporaryFile();
    std::fflush(nullptr);
    const pid_t child = fork();
    if (child < 0)
        throw std::runtime_error("no process can be made");
    if (child == 0)
        runChild(function, report.get(), words.get(), said.get());
    int status = 0;
    while (waitpid(child, &status, 0) < 0) {
    }
    Ending ending;
    ending.report = contentOf(report.get(), 1L << 24U);
    ending.words = contentOf(words.get(), mostSaid);
    const bool isDone = ending.words == "done";
    if (WIFEXITED(status) && WEXITSTATUS(status) == 0 && isDone) {
        ending.words.clear();
    } else if (WIFEXITED(status) && WEXITSTATUS(status) == brokenExit && !isDone) {
        ending.kind = Ending::Kind::Broken;
    } else {
        ending.kind = isDone ? Ending::Kind::Leaked : Ending::Kind::Crashed;
        ending.words = contentOf(said.get(), mostSaid);
        if (WIFSIGNALED(status))
            ending.words += "\nended by signal " + std::to_string(WTERMSIG(status));
    }
    return ending;
}

} // namespace kota::random_user
