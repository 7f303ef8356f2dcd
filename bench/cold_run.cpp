#include "bench/cold_run.h"

#include <chrono>
#include <cstdlib>
#include <fstream>
#include <stdexcept>
#include <sys/resource.h>
#include <sys/wait.h>
#include <unistd.h>

namespace bench {

namespace {

double measure(const std::function<void()>& work) {
    const auto start = std::chrono::steady_clock::now();
    work();
    return std::chrono::duration<double>(std::chrono::steady_clock::now() - start).count();
}

double residentMegabytes() {
    long pages = 0;
    long resident = 0;
    std::ifstream("/proc/self/statm") >> pages >> resident;
    return static_cast<double>(resident) * static_cast<double>(sysconf(_SC_PAGESIZE)) / 1e6;
}

[[noreturn]] void runAsChild(const std::function<std::function<void()>()>& prepare, int result) {
    Measured measured;
    const std::function<void()> work = prepare();
    const double before = residentMegabytes();
    measured.seconds = measure(work);
    measured.grownMegabytes = residentMegabytes() - before;
    rusage usage{};
    getrusage(RUSAGE_SELF, &usage);
    measured.peakMegabytes = static_cast<double>(usage.ru_maxrss) / 1024;
    const bool told = write(result, &measured, sizeof measured) == sizeof measured;
    _exit(told ? EXIT_SUCCESS : EXIT_FAILURE);
}

} // namespace

Measured runCold(const std::function<std::function<void()>()>& prepare) {
    int ends[2];
    if (pipe(ends) != 0)
        throw std::runtime_error("no pipe");
    const pid_t child = fork();
    if (child == 0)
        runAsChild(prepare, ends[1]);
    close(ends[1]);
    Measured measured;
    const bool heard = child > 0 && read(ends[0], &measured, sizeof measured) == sizeof measured;
    close(ends[0]);
    waitpid(child, nullptr, 0);
    if (!heard)
        throw std::runtime_error("the measured process ended without a result");
    return measured;
}

} // namespace bench
