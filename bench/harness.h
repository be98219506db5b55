// A small benchmark harness. Each case runs its operation in a loop whose
// length is doubled until one run takes at least 200 ms; the best of five runs
// of that length gives the time per operation. Cases are reported against a
// baseline measured in the same run, as a ratio.
#ifndef VANTORBASE_BENCH_HARNESS_H
#define VANTORBASE_BENCH_HARNESS_H

#include <cstdint>
#include <functional>
#include <string>

namespace bench {

// Runs the measured operation `iterations` times.
using Body = std::function<void(std::int64_t iterations)>;

// Nanoseconds per operation: the best of five runs of at least 200 ms each.
double Measure(const Body& body);

// Prints one line: the case, its time per operation, and its ratio to the
// baseline's time (case / baseline).
void Report(const std::string& name, double nanoseconds, const std::string& baseline,
            double baselineNanoseconds);

// Prints one line for a baseline itself.
void ReportBaseline(const std::string& name, double nanoseconds);

// Prints a free-form line (a derived figure, such as a tick count).
void Note(const std::string& text);

// Keeps the compiler from discarding a computed value.
template <typename T>
inline void Keep(T&& value) {
#if defined(__GNUC__)
    asm volatile("" : : "g"(&value) : "memory");
#else
    static volatile const void* sink;
    sink = &value;
#endif
}

// Registers a group of cases, run by the bench program in name order.
struct Registrar {
    Registrar(const char* name, void (*run)());
};

}  // namespace bench

#define VANTORBASE_BENCH_GROUP(name)                                   \
    static void name();                                                \
    static const ::bench::Registrar name##_registrar(#name, &name);    \
    static void name()

#endif  // VANTORBASE_BENCH_HARNESS_H
