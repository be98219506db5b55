#include "harness.h"

#include <algorithm>
#include <chrono>
#include <cstdio>
#include <map>

namespace bench {
namespace {

using Clock = std::chrono::steady_clock;

constexpr double kMinimumRunNs = 200e6;
constexpr int kRepetitions = 5;

double RunNs(const Body& body, std::int64_t iterations) {
    const auto start = Clock::now();
    body(iterations);
    return std::chrono::duration<double, std::nano>(Clock::now() - start).count();
}

std::map<std::string, void (*)()>& Groups() {
    static std::map<std::string, void (*)()> groups;
    return groups;
}

}  // namespace

double Measure(const Body& body) {
    std::int64_t iterations = 1;
    while (RunNs(body, iterations) < kMinimumRunNs) iterations *= 2;
    double best = RunNs(body, iterations);
    for (int i = 1; i < kRepetitions; ++i) best = std::min(best, RunNs(body, iterations));
    return best / static_cast<double>(iterations);
}

void Report(const std::string& name, double ns, const std::string& baseline, double baselineNs) {
    std::printf("%-58s %12.1f ns/op  %8.3fx %s\n", name.c_str(), ns, ns / baselineNs,
                baseline.c_str());
    std::fflush(stdout);
}

void ReportBaseline(const std::string& name, double ns) {
    std::printf("%-58s %12.1f ns/op  (baseline)\n", name.c_str(), ns);
    std::fflush(stdout);
}

void Note(const std::string& text) {
    std::printf("%s\n", text.c_str());
    std::fflush(stdout);
}

Registrar::Registrar(const char* name, void (*run)()) { Groups()[name] = run; }

}  // namespace bench

// Runs every group, or those whose name contains the first argument.
int main(int argc, char** argv) {
    const std::string filter = argc > 1 ? argv[1] : "";
    for (const auto& [name, run] : bench::Groups()) {
        if (name.find(filter) == std::string::npos) continue;
        std::printf("== %s\n", name.c_str());
        run();
    }
    return 0;
}
